/// Where the pages of a run go, which is what links between them need to know.
#pragma once

#include "foundation/common/MoxString.h"

#include <string>
#include <vector>

namespace DrawmereConvert {

using icu::UnicodeString;

/// A place in a page to which some link of the document leads. Units: points from the top left.
struct LinkDestination {
    UnicodeString id;
    bool isView = false; ///< a rectangle rather than a point
    float x = 0;
    float y = 0;
    float width = 0;
    float height = 0;
};

/// Filled before the first page is drawn, and only read from then on.
struct PageTargets {
    bool singleFile = false; ///< all pages are in one document

    /// The name of the file of each page, from page 0, without directory; empty for a page that is
    /// not converted. Of a single file the names don't matter, only that they are not empty.
    std::vector<UnicodeString> files;

    /// The destinations in each page, as `DocumentConverter::findDestinations` finds them.
    std::vector<std::vector<LinkDestination>> destinations;
};

} // namespace DrawmereConvert
