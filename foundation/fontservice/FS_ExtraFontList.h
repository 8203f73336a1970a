/// The fonts behind a set of further fonts.
#pragma once

#include "foundation/fontservice/FS_ExtraFonts.h"

#include <vector>

namespace MoxFontService_NS {

/// The fonts that a caller has added.
class FS_ExtraFontList {
public:
    std::vector<FS_ExtraFont> entries;
};

} // namespace MoxFontService_NS
