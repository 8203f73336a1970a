#include "foundation/fontservice/FS_Face.h"

#include "foundation/fontservice/FS_FaceNames.h"
#include "foundation/fontservice/FS_FontLibrary.h"
#include "foundation/fontservice/FS_OutlineReader.h"
#include "foundation/fontservice/FS_VariationAxes.h"

#include <hb-ft.h>
#include <hb-ot.h>

#include <algorithm>
#include <new>
#include <span>
#include <utility>

#include FT_TRUETYPE_TABLES_H

namespace MoxFontService_NS {

namespace {

constexpr int boldWeight = 700;

const TT_OS2* findOS2(FT_Face face) {
    constexpr FT_UShort absent = 0xFFFF;
    const auto* table = static_cast<const TT_OS2*>(FT_Get_Sfnt_Table(face, FT_SFNT_OS2));
    return table && table->version != absent ? table : nullptr;
}

// Old fonts count weights from 1 to 9.
int readWeight(const TT_OS2& table) {
    constexpr int hundred = 100;
    return table.usWeightClass < 10 ? hundred * table.usWeightClass : table.usWeightClass;
}

bool isItalic(const TT_OS2& table) {
    constexpr unsigned italicBit = 1U << 0U;
    constexpr unsigned obliqueBit = 1U << 9U;
    return (table.fsSelection & (italicBit | obliqueBit)) != 0;
}

// The characters that all encodings of one byte have in common.
constexpr bool isAscii(int codePoint) { return codePoint < 0x80; }

struct MetricField {
    int FS_NewTextMetricEx::*target;
    long value;
};

} // namespace

std::shared_ptr<FS_Face> FS_Face::open(const FS_FaceRequest& request) {
    const std::shared_ptr<FS_FontLibrary> library = FS_FontLibrary::shared();
    const auto close = [&library](FT_Face opened) { library->close(opened); };
    std::unique_ptr<FT_FaceRec, decltype(close)> opened(
        library->open(request.source, request.faceIndex), close);
    if (!opened) {
        return nullptr;
    }
    std::unique_ptr<FS_Face> made(new FS_Face(library, request.source, opened.get()));
    static_cast<void>(opened.release());
    return made->setUp(request) ? std::shared_ptr<FS_Face>(std::move(made)) : nullptr;
}

FS_Face::FS_Face(std::shared_ptr<FS_FontLibrary> fontLibrary, FS_FontSource fontSource,
                 FT_Face openedFace)
    : library(std::move(fontLibrary)), source(std::move(fontSource)), face(openedFace),
      shapes(hb_ft_face_create(openedFace, nullptr)), composites(openedFace) {}

FS_Face::~FS_Face() {
    verticalForms.reset();
    hb_font_destroy(symbols);
    hb_face_destroy(shapes);
    library->close(face);
}

bool FS_Face::setUp(const FS_FaceRequest& request) {
    if (shapes == hb_face_get_empty()) {
        throw std::bad_alloc(); // this is how HarfBuzz says it
    }
    if (FT_IS_SCALABLE(face) && face->units_per_EM > 0) {
        unitsPerEm = face->units_per_EM;
    }
    chooseCharMap();
    readFontStyle();
    FS_VariationAxes axes(face);
    const int designedWidth = style.widthClass;
    if (request.axes && !axes.apply(*request.axes)) {
        FS_FontLibrary::requireMemory();
        return false;
    }
    axes.readStyle(style);
    range = axes.readRange(style);
    isVariable = axes.areThere();
    familyName = readFamilyName(face);
    if (style.widthClass != designedWidth) {
        familyName += u' ';
        familyName += widthWordOf(style.widthClass);
    }
    FS_FontLibrary::requireMemory();
    return true;
}

void FS_Face::readFontStyle() {
    const TT_OS2* table = findOS2(face);
    const bool italic = (face->style_flags & FT_STYLE_FLAG_ITALIC) != 0;
    if (table) {
        style = makeStyle(readWeight(*table), italic || isItalic(*table), table->usWidthClass);
        return;
    }
    style.italic = italic;
    if ((face->style_flags & FT_STYLE_FLAG_BOLD) != 0) {
        style.weight = boldWeight;
    }
}

// Symbols are looked up as shapers do; where there is no Unicode either, any charmap serves for
// ASCII.
void FS_Face::chooseCharMap() {
    const std::span<const FT_CharMap> maps(face->charmaps, face->num_charmaps);
    const auto isSymbols = [](FT_CharMap map) { return map->encoding == FT_ENCODING_MS_SYMBOL; };
    if (std::ranges::any_of(maps, isSymbols)) {
        symbols = hb_font_create(shapes);
        if (symbols == hb_font_get_empty()) {
            throw std::bad_alloc();
        }
        hb_ot_font_set_funcs(symbols);
    }
    if (!face->charmap && !maps.empty()) {
        FT_Set_Charmap(face, maps.front());
    }
}

std::uint16_t FS_Face::findGlyph(int codePoint, bool vertical) {
    const std::lock_guard lock(inUse);
    unsigned glyph = lookUp(codePoint);
    if (glyph == 0 || glyph >= noGlyph) {
        return noGlyph;
    }
    if (vertical) {
        if (!verticalForms) {
            verticalForms.emplace(shapes);
        }
        glyph = verticalForms->find(glyph);
    }
    return static_cast<std::uint16_t>(std::min<unsigned>(glyph, noGlyph));
}

// Symbols stand in the private range, on behalf of the characters from U+0020 to U+00FF, and in
// Arabic fonts of old on behalf of Arabic letters.
unsigned FS_Face::lookUp(int codePoint) {
    const bool unicode = face->charmap && face->charmap->encoding == FT_ENCODING_UNICODE;
    if (unicode || (!symbols && isAscii(codePoint))) {
        if (const unsigned glyph = FT_Get_Char_Index(face, codePoint)) {
            return glyph;
        }
    }
    hb_codepoint_t glyph = 0;
    return symbols && hb_font_get_nominal_glyph(symbols, codePoint, &glyph) ? glyph : 0;
}

bool FS_Face::readGlyph(unsigned glyphId, FS_GlyphDrawInfo& info) {
    const std::lock_guard lock(inUse);
    if (loadOutline(glyphId, info)) {
        return true;
    }
    info.horizontalAdvance = 0;
    info.verticalAdvance = 0;
    info.polygons.clear();
    return false;
}

bool FS_Face::loadOutline(unsigned glyphId, FS_GlyphDrawInfo& info) {
    if (!FT_IS_SCALABLE(face) || glyphId >= static_cast<unsigned long>(face->num_glyphs) ||
        !composites.isBounded(glyphId)) {
        return false;
    }
    FS_FontLibrary::expectMemory();
    const bool isLoaded = FT_Load_Glyph(face, glyphId, FT_LOAD_NO_SCALE) == 0;
    FS_FontLibrary::requireMemory();
    if (!isLoaded) {
        return false;
    }
    const FT_GlyphSlot slot = face->glyph;
    if (slot->format != FT_GLYPH_FORMAT_OUTLINE) {
        return false;
    }
    info.horizontalAdvance = static_cast<int>(slot->metrics.horiAdvance);
    info.verticalAdvance =
        FT_HAS_VERTICAL(face) ? static_cast<int>(slot->metrics.vertAdvance) : unitsPerEm;
    return FS_OutlineReader::read(slot->outline, info.polygons);
}

void FS_Face::readMetrics(FS_NewTextMetricEx& metrics, int unitsWanted) {
    const std::lock_guard lock(inUse);
    const TT_OS2* table = findOS2(face);
    const bool hasHeights = table && table->version >= 2;
    const MetricField fields[] = {
        {&FS_NewTextMetricEx::ascender, face->ascender},
        {&FS_NewTextMetricEx::descender, face->descender},
        {&FS_NewTextMetricEx::lineGap, face->height - face->ascender + face->descender},
        {&FS_NewTextMetricEx::capHeight, hasHeights ? table->sCapHeight : 0},
        {&FS_NewTextMetricEx::xHeight, hasHeights ? table->sxHeight : 0},
        {&FS_NewTextMetricEx::underlinePosition, face->underline_position},
        {&FS_NewTextMetricEx::underlineThickness, face->underline_thickness},
        {&FS_NewTextMetricEx::averageCharWidth, table ? table->xAvgCharWidth : 0},
        {&FS_NewTextMetricEx::maxCharWidth, face->max_advance_width},
    };
    for (const MetricField& field : fields) {
        metrics.*field.target = static_cast<int>(FT_MulDiv(field.value, unitsWanted, unitsPerEm));
    }
    metrics.unitsPerEm = unitsWanted;
    metrics.weight = style.weight;
    metrics.italic = style.italic;
    metrics.fixedPitch = FT_IS_FIXED_WIDTH(face) != 0;
}

std::vector<UnicodeString> FS_Face::readAllNames() {
    const std::lock_guard lock(inUse);
    FS_FontLibrary::expectMemory();
    std::vector<UnicodeString> names = readNames(face);
    FS_FontLibrary::requireMemory();
    return names;
}

} // namespace MoxFontService_NS
