/// One opened face of a font.
#pragma once

#include "foundation/common/MoxString.h"
#include "foundation/fontservice/FS_CompositeGuard.h"
#include "foundation/fontservice/FS_FaceRequest.h"
#include "foundation/fontservice/FS_GlyphDrawInfo.h"
#include "foundation/fontservice/FS_NewTextMetricEx.h"
#include "foundation/fontservice/FS_VerticalForms.h"

#include <ft2build.h>
#include FT_FREETYPE_H
#include <hb.h>

#include <cstdint>
#include <memory>
#include <mutex>
#include <optional>
#include <vector>

namespace MoxFontService_NS {

class FS_FontLibrary;

/// A face in one style, shared by all that use it. Threads may call it as they like.
class FS_Face {
public:
    static constexpr std::uint16_t noGlyph = 65535;

    /// Opens the face and sets its axes.
    /// Returns: null for what can't be read as a font.
    static std::shared_ptr<FS_Face> open(const FS_FaceRequest& request);

    FS_Face(const FS_Face&) = delete;
    FS_Face& operator=(const FS_Face&) = delete;
    ~FS_Face();

    /// Returns: the glyph of a character of Unicode, or its form in vertical text; `noGlyph` for
    /// none.
    std::uint16_t findGlyph(int codePoint, bool vertical);

    /// Fills `info` with a glyph. Returns: false, with `info` emptied, when it can't be read.
    bool readGlyph(unsigned glyphId, FS_GlyphDrawInfo& info);

    /// Fills `metrics` in units of which `unitsWanted` make an em.
    void readMetrics(FS_NewTextMetricEx& metrics, int unitsWanted);

    /// Returns: the names of the face, the family name first.
    std::vector<UnicodeString> readAllNames();

    UnicodeString familyName; ///< a width that only the axes give is part of it
    FS_FaceStyle style;       ///< as it is set
    FS_StyleRange range;      ///< what it can be set to
    int unitsPerEm = 1000;
    bool isVariable = false; ///< whether it has axes

private:
    FS_Face(std::shared_ptr<FS_FontLibrary> fontLibrary, FS_FontSource fontSource,
            FT_Face openedFace);

    bool setUp(const FS_FaceRequest& request);
    void readFontStyle();
    void chooseCharMap();
    unsigned lookUp(int codePoint);
    bool loadOutline(unsigned glyphId, FS_GlyphDrawInfo& info);

    std::shared_ptr<FS_FontLibrary> library;
    FS_FontSource source;         // holds bytes in memory as long as the face reads them
    std::mutex inUse;             // of all below
    FT_Face face;                 // owned
    hb_face_t* shapes;            // owned, reads tables through `face`
    hb_font_t* symbols = nullptr; // owned; null for fonts without a charmap of symbols
    FS_CompositeGuard composites;
    std::optional<FS_VerticalForms> verticalForms; // made when first asked for
};

} // namespace MoxFontService_NS
