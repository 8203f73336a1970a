/// The table of contents that a document brings with it.
#pragma once

#include <string>
#include <vector>

namespace DrawmereConvert {

/// An entry of the document's outline, in document order.
struct OutlineEntry {
    bool operator==(const OutlineEntry&) const = default;

    std::string title; ///< UTF-8
    int page = -1;     ///< from 0; -1 for an entry that leads to no page
    int level = 0;
};

/// Returns: the outline as bytes, for `unpackOutline` in another process.
std::string packOutline(const std::vector<OutlineEntry>& outline);

/// Returns: the outline that `packOutline` made bytes of.
std::vector<OutlineEntry> unpackOutline(const std::string& bytes);

} // namespace DrawmereConvert
