/// What a search for a face has found.
#pragma once

#include "foundation/common/MoxString.h"
#include "foundation/fontservice/FS_ExtraFonts.h"
#include "foundation/fontservice/FS_Face.h"
#include "foundation/fontservice/FS_FaceRequest.h"

#include <memory>

namespace MoxFontService_NS {

/// What was said about the style of a font, whatever is in its file; 0 says nothing.
struct FS_StatedStyle {
    /// Returns: `style` with what is stated put in.
    FS_FaceStyle applyTo(FS_FaceStyle style) const;

    int weight = 0;
    FSSLANT slant = FSSLANT_UNSTATED;
    int widthClass = 0;
};

/// A face as the search names it, not opened yet.
struct FS_FoundName {
    FS_FaceRequest request;
    UnicodeString familyName; ///< empty for the face's own
    bool tellsWidth = false;  ///< whether `familyName` takes in a width that is not normal
    FS_StatedStyle stated;
};

/// An open face and how it presents itself.
struct FS_FoundFace {
    /// Opens what was found. Returns: null when it can't be read.
    static std::shared_ptr<const FS_FoundFace> open(const FS_FoundName& name);

    std::shared_ptr<FS_Face> face; ///< never null
    UnicodeString familyName;
    FS_FaceStyle style;
};

} // namespace MoxFontService_NS
