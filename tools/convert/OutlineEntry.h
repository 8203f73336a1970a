/// The table of contents that a document brings with it.
#pragma once

#include <string>

namespace DrawmereConvert {

/// An entry of the document's outline, in document order.
struct OutlineEntry {
    std::string title; ///< UTF-8
    int page = -1;     ///< from 0; -1 for an entry that leads to no page
    int level = 0;
};

} // namespace DrawmereConvert
