/// Shapes the texts of the example `fonts` with HarfBuzz.
#pragma once

#include "foundation/common/MoxString.h"
#include "foundation/records/TLStringWithGlyphInfo.h"

#include <algorithm>
#include <cstdint>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include <fontconfig/fontconfig.h>
#include <hb-ot.h>

/// Characters that became glyphs together. Lengths are parts of an em.
struct Cluster {
    icu::UnicodeString text;
    std::vector<std::uint16_t> glyphs; ///< in the order of the page
    float advance = 0;
    float xOffset = 0;     ///< how far its first glyph stands from the pen
    bool isMoved = false;  ///< whether a glyph stands away from the pen
    bool isKerned = false; ///< whether it moves the pen by anything but its advances
};

/// Adds the entries of a cluster: the first says how many characters it stands for.
inline void appendEntries(std::vector<TalFont::TLGlyphEntry>& entries, const Cluster& cluster) {
    auto count = static_cast<std::int16_t>(cluster.text.length());
    for (const std::uint16_t glyph : cluster.glyphs) {
        entries.push_back({count, glyph});
        count = 0;
    }
}

/// Returns: the words of a text that blanks part.
inline std::vector<icu::UnicodeString> splitWords(const icu::UnicodeString& text) {
    std::vector<icu::UnicodeString> words;
    std::int32_t begin = 0;
    while (begin <= text.length()) {
        const std::int32_t blank = text.indexOf(u' ', begin);
        const std::int32_t end = blank < 0 ? text.length() : blank;
        words.push_back(text.tempSubStringBetween(begin, end));
        begin = end + 1;
    }
    return words;
}

/// A font of the system, found by its family name.
class GlyphShaper {
public:
    /// Throws: std::runtime_error when there is no such font.
    explicit GlyphShaper(const char16_t* family) : font(nullptr, &hb_font_destroy) {
        std::string name;
        icu::UnicodeString(family).toUTF8String(name);
        const Pattern wanted(FcPatternBuild(nullptr, FC_FAMILY, FcTypeString, name.c_str(),
                                            FC_STYLE, FcTypeString, "Regular", nullptr),
                             &FcPatternDestroy);
        const std::unique_ptr<FcConfig, decltype(&FcConfigDestroy)> fonts(
            FcInitLoadConfigAndFonts(), &FcConfigDestroy);
        FcConfigSubstitute(fonts.get(), wanted.get(), FcMatchPattern);
        FcDefaultSubstitute(wanted.get());
        FcResult result = FcResultNoMatch;
        const Pattern found(FcFontMatch(fonts.get(), wanted.get(), &result), &FcPatternDestroy);
        open(found.get(), name);
    }

    /// Returns: the clusters of `text` in the order of the page.
    std::vector<Cluster> shape(const icu::UnicodeString& text, hb_direction_t direction) const {
        const std::unique_ptr<hb_buffer_t, decltype(&hb_buffer_destroy)> buffer(hb_buffer_create(),
                                                                                &hb_buffer_destroy);
        const auto* units = reinterpret_cast<const std::uint16_t*>(text.getBuffer());
        hb_buffer_add_utf16(buffer.get(), units, text.length(), 0, text.length());
        hb_buffer_set_direction(buffer.get(), direction);
        hb_buffer_guess_segment_properties(buffer.get());
        hb_shape(font.get(), buffer.get(), nullptr, 0);
        return readClusters(buffer.get(), text, direction);
    }

    /// Returns: how far `text` moves the pen.
    float getAdvance(const icu::UnicodeString& text) const {
        float width = 0;
        for (const Cluster& cluster : shape(text, HB_DIRECTION_LTR)) {
            width += cluster.advance;
        }
        return width;
    }

private:
    using Pattern = std::unique_ptr<FcPattern, decltype(&FcPatternDestroy)>;

    void open(const FcPattern* found, const std::string& name) {
        FcChar8* path = nullptr;
        FcChar8* family = nullptr;
        int index = 0;
        const bool known = found && FcPatternGetString(found, FC_FILE, 0, &path) == FcResultMatch &&
                           FcPatternGetString(found, FC_FAMILY, 0, &family) == FcResultMatch &&
                           name == reinterpret_cast<const char*>(family);
        if (!known) { // fontconfig answers with another font rather than with none
            throw std::runtime_error("no font " + name);
        }
        FcPatternGetInteger(found, FC_INDEX, 0, &index);
        hb_blob_t* blob = hb_blob_create_from_file(reinterpret_cast<const char*>(path));
        hb_face_t* face = hb_face_create(blob, static_cast<unsigned>(index));
        font.reset(hb_font_create(face));
        em = static_cast<float>(hb_face_get_upem(face));
        hb_face_destroy(face);
        hb_blob_destroy(blob);
    }

    std::vector<Cluster> readClusters(hb_buffer_t* buffer, const icu::UnicodeString& text,
                                      hb_direction_t direction) const {
        unsigned count = 0;
        const hb_glyph_info_t* infos = hb_buffer_get_glyph_infos(buffer, &count);
        const hb_glyph_position_t* places = hb_buffer_get_glyph_positions(buffer, &count);
        const bool vertical = HB_DIRECTION_IS_VERTICAL(direction);
        std::vector<Cluster> clusters;
        for (unsigned i = 0; i < count; ++i) {
            const bool isNew = i == 0 || infos[i].cluster != infos[i - 1].cluster;
            if (isNew && !clusters.empty() && joinsNext(clusters.back().text)) {
                clusters.back().text += readText(text, infos, count, infos[i].cluster);
            } else if (isNew) {
                clusters.emplace_back();
                clusters.back().text = readText(text, infos, count, infos[i].cluster);
                clusters.back().xOffset = static_cast<float>(places[i].x_offset) / em;
            }
            addGlyph(clusters.back(), infos[i].codepoint, places[i], vertical);
        }
        return clusters;
    }

    void addGlyph(Cluster& cluster, hb_codepoint_t glyph, const hb_glyph_position_t& place,
                  bool vertical) const {
        const int advance = vertical ? -place.y_advance : place.x_advance;
        const int ownAdvance = vertical ? advance : hb_font_get_glyph_h_advance(font.get(), glyph);
        cluster.glyphs.push_back(static_cast<std::uint16_t>(glyph));
        cluster.advance += static_cast<float>(advance) / em;
        cluster.isMoved = cluster.isMoved || place.x_offset != 0 || place.y_offset != 0;
        cluster.isKerned = cluster.isKerned || advance != ownAdvance;
    }

    /// A virama binds the consonants of a syllable. Whoever cuts there changes their shape for all
    /// viewers that set the text with a font of their own.
    static bool joinsNext(const icu::UnicodeString& text) {
        constexpr char16_t virama = 0x094D;
        return text.endsWith(icu::UnicodeString(virama));
    }

    /// A cluster goes up to where the next one of the text begins.
    static icu::UnicodeString readText(const icu::UnicodeString& text, const hb_glyph_info_t* infos,
                                       unsigned count, std::uint32_t begin) {
        auto end = static_cast<std::uint32_t>(text.length());
        for (unsigned i = 0; i < count; ++i) {
            end = infos[i].cluster > begin ? std::min(end, infos[i].cluster) : end;
        }
        return text.tempSubStringBetween(static_cast<std::int32_t>(begin),
                                         static_cast<std::int32_t>(end));
    }

    std::unique_ptr<hb_font_t, decltype(&hb_font_destroy)> font;
    float em = 1;
};
