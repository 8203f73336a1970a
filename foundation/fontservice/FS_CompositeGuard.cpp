#include "foundation/fontservice/FS_CompositeGuard.h"

#include <string_view>

#include FT_FONT_FORMATS_H
#include FT_TRUETYPE_TABLES_H
#include FT_TRUETYPE_TAGS_H

namespace MoxFontService_NS {

namespace {

constexpr int mostDepth = 32;
constexpr int mostParts = 2048;

enum PARTFLAG : unsigned {
    PARTFLAG_WORDS = 0x0001,
    PARTFLAG_SCALE = 0x0008,
    PARTFLAG_MORE = 0x0020,
    PARTFLAG_TWOSCALES = 0x0040,
    PARTFLAG_MATRIX = 0x0080,
};

unsigned readWord(const unsigned char* bytes) { return bytes[0] << 8U | bytes[1]; }

std::uint32_t readLong(const unsigned char* bytes) {
    return readWord(bytes) << 16U | readWord(bytes + 2);
}

std::uint32_t readHalved(const unsigned char* bytes) { return 2 * readWord(bytes); }

// The bytes of a part behind its flags and its glyph.
std::uint32_t sizeOfRest(unsigned flags) {
    const std::uint32_t offsets = (flags & PARTFLAG_WORDS) != 0 ? 4 : 2;
    if ((flags & PARTFLAG_SCALE) != 0) {
        return offsets + 2;
    }
    if ((flags & PARTFLAG_TWOSCALES) != 0) {
        return offsets + 4;
    }
    return offsets + ((flags & PARTFLAG_MATRIX) != 0 ? 8 : 0);
}

} // namespace

FS_CompositeGuard::FS_CompositeGuard(FT_Face fontFace) : face(fontFace) {
    const char* format = FT_Get_Font_Format(face);
    const auto* head = static_cast<const TT_Header*>(FT_Get_Sfnt_Table(face, FT_SFNT_HEAD));
    hasComposites = format && std::string_view(format) == "TrueType" && head;
    longPlaces = hasComposites && head->Index_To_Loc_Format != 0;
}

bool FS_CompositeGuard::isBounded(unsigned glyphId) const {
    int budget = mostParts;
    return !hasComposites || countParts(glyphId, 0, budget);
}

bool FS_CompositeGuard::countParts(unsigned glyphId, int depth, int& budget) const {
    if (depth > mostDepth || --budget < 0) {
        return false;
    }
    std::uint32_t place = 0;
    if (!findGlyph(glyphId, place) || !isComposite(place)) {
        return true;
    }
    constexpr std::uint32_t headSize = 10;
    place += headSize;
    unsigned char part[4] = {};
    unsigned flags = PARTFLAG_MORE;
    while ((flags & PARTFLAG_MORE) != 0 && readTable(TTAG_glyf, place, part, sizeof part)) {
        flags = readWord(part);
        place += static_cast<std::uint32_t>(sizeof part) + sizeOfRest(flags);
        if (!countParts(readWord(part + 2), depth + 1, budget)) {
            return false;
        }
    }
    return true;
}

bool FS_CompositeGuard::isComposite(std::uint32_t place) const {
    constexpr unsigned signBit = 0x8000;
    unsigned char count[2] = {};
    return readTable(TTAG_glyf, place, count, sizeof count) && (readWord(count) & signBit) != 0;
}

// A glyph that ends where it begins is empty, whatever stands there. The last one may lack an end.
bool FS_CompositeGuard::findGlyph(unsigned glyphId, std::uint32_t& place) const {
    unsigned char entries[8] = {};
    const FT_Long size = longPlaces ? 4 : 2;
    const auto read = longPlaces ? readLong : readHalved;
    const bool hasEnd = readTable(TTAG_loca, glyphId * size, entries, 2 * size);
    if (!hasEnd && !readTable(TTAG_loca, glyphId * size, entries, size)) {
        return false;
    }
    place = read(entries);
    return !hasEnd || place != read(entries + size);
}

// Reads on behind the end of a table that is too short, as FreeType does for loca.
bool FS_CompositeGuard::readTable(FT_ULong tag, FT_Long place, unsigned char* bytes,
                                  FT_ULong count) const {
    return FT_Load_Sfnt_Table(face, tag, place, bytes, &count) == 0;
}

} // namespace MoxFontService_NS
