/// The further fonts that a caller hands in with a font.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace MoxFontService_NS {

class FS_ExtraFontList;

/// The slant of a further font.
enum FSSLANT : std::int32_t {
    FSSLANT_UNSTATED = 0, // as the font file says
    FSSLANT_UPRIGHT = 1,
    FSSLANT_ITALIC = 2,
};

/// What a caller says about one further font; what it leaves out is read from the font itself.
struct FS_ExtraFont {
    /// The names it answers to; none for those in the file: family, full and PostScript name.
    /// Several fonts with one name are a family, of which weight, slant and width choose.
    std::vector<UnicodeString> names;
    int weight = 0; ///< 1 to 1000 as CSS counts; any other number: as the file says
    FSSLANT slant = FSSLANT_UNSTATED; ///< of the face
    int widthClass =
        0; ///< 1 ultra-condensed to 9 ultra-expanded; any other number: as the file says
    int faceIndex = 0; ///< which face of a collection, 0 in a file of one face
};

/// Fonts of the caller's own, looked through before those of the system.
///
/// A font is found under each of its names as it is spelled, else without regard to case; among
/// several of one name the nearest width is taken, then the wanted slant, then the nearest weight,
/// as CSS chooses, and the one added last among equals. A name that is here is not looked up in the
/// system, whatever weight or slant is wanted. Two fonts that are not to be taken for one another
/// need different first names: an embedded font is known by its first name, its weight and its
/// slant. A variable font takes the wanted weight, width and slant, as far as they are unstated.
///
/// The object may be changed and destroyed as soon as the call that took it is over: a font in use
/// keeps its bytes. Two threads may use one object as long as neither changes it. The formats are
/// those that FreeType reads: TrueType, OpenType and collections of them, WOFF, Type 1 and others.
class DRAWMERE_API FS_ExtraFonts {
public:
    FS_ExtraFonts();
    /// A copy.
    FS_ExtraFonts(const FS_ExtraFonts& other);
    /// Copies everything.
    FS_ExtraFonts& operator=(const FS_ExtraFonts& other);
    ~FS_ExtraFonts();

    /// Adds the font in the file `path`, which must stay as it is while the font is in use.
    /// Returns: false, and adds nothing, when no face can be read or no name is known for it.
    bool addFile(const UnicodeString& path, const FS_ExtraFont& font = FS_ExtraFont());

    /// Adds the font in `bytes`, the content of a font file.
    /// Owns: the bytes, shared with every use of the font.
    /// Returns: false, and adds nothing, when no face can be read or no name is known for it.
    bool addBytes(std::string bytes, const FS_ExtraFont& font = FS_ExtraFont());

    /// Returns: the count of fonts added.
    int count() const;

    std::unique_ptr<FS_ExtraFontList> fonts; ///< owned; never null
};

} // namespace MoxFontService_NS
