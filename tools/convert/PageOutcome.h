/// What became of a page, on its way from the process that wrote it.
#pragma once

#include "tools/convert/DocumentConverter.h"

#include <string>

namespace DrawmereConvert {

struct PageOutcome {
    int page = 0;              ///< counted from 0; below 0 for the document of all pages
    bool isWritten = false;    ///< there is a file, though perhaps not a complete one
    bool isLate = false;       ///< given up when its time was over
    bool isUnreadable = false; ///< the document doesn't give the page away
    PageSize size;
    PageReport report;
    std::string error; ///< why the page is not written, or why it is not complete
};

/// Returns: the outcome as bytes, for `unpackOutcome` in another process of the same program.
std::string packOutcome(const PageOutcome& outcome);

/// Returns: the outcome that `packOutcome` made bytes of.
PageOutcome unpackOutcome(const std::string& bytes);

} // namespace DrawmereConvert
