/// The fonts behind a set of further fonts.
#pragma once

#include "foundation/fontservice/FS_ExtraFonts.h"
#include "foundation/fontservice/FS_FoundFace.h"

#include <optional>
#include <vector>

namespace MoxFontService_NS {

/// The fonts that a caller has added, in the order of adding.
class FS_ExtraFontList {
public:
    /// Adds the font in `source`. Returns: false when it can't be read or has no name.
    bool add(const FS_FontSource& source, const FS_ExtraFont& font);

    /// Returns: the font called `name` that is nearest to `wanted`; nothing for an unknown name.
    std::optional<FS_FoundName> find(const UnicodeString& name, const FS_FaceStyle& wanted) const;

    int count() const { return static_cast<int>(entries.size()); }

private:
    struct Entry {
        FS_FontSource source;
        int faceIndex;
        std::vector<UnicodeString> names; // never empty
        FS_StatedStyle stated;
        FS_StyleRange range; // with what is stated
        bool variable;
    };

    std::vector<const Entry*> findNamed(const UnicodeString& name) const;
    bool isOneOfManyWidths(const Entry& entry) const;

    std::vector<Entry> entries;
};

} // namespace MoxFontService_NS
