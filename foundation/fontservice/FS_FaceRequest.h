/// Says which face of which file is wanted, in which style.
#pragma once

#include "foundation/fontservice/FS_FaceStyle.h"

#include <memory>
#include <optional>
#include <string>

namespace MoxFontService_NS {

/// Where the bytes of a font are: in a file, or in memory.
struct FS_FontSource {
    /// Returns: a text that is the same for the same bytes alone: a changed file has another.
    /// Empty when there is no plain file of that path.
    std::string makeIdentity() const;

    std::string path;                         ///< as the system spells it; of a file
    std::shared_ptr<const std::string> bytes; ///< null for a file
};

/// One face of a font.
struct FS_FaceRequest {
    FS_FontSource source;
    int faceIndex = 0; ///< as FreeType counts, with the number of a named instance above bit 15
    std::optional<FS_FaceStyle> axes; ///< the style that a variable font is to be set to
};

} // namespace MoxFontService_NS
