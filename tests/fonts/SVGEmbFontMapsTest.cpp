// What a font collects is what a plain search in its maps would have put there.
#include "fonts/SVGEmbFont.h"
#include "tests/fonts/EmbeddedFont.h"
#include "tests/support/TinyFont.h"

#include <gtest/gtest.h>
#include <random>

namespace DrawmereTest {
namespace {

/// The maps of a font, filled without anything that stands in front of them.
class PlainMaps {
public:
    explicit PlainMaps(const MoxFontService_NS::FS_FontInfo& openFace) : face(openFace) {}

    void embedText(const UnicodeString& text, bool isVertical) {
        for (std::int32_t i = 0; i < text.length(); i = text.moveIndex32(i, 1)) {
            const std::uint16_t glyph = face.getGlyphID(text.char32At(i), false);
            if (glyph == noGlyph) {
                continue;
            }
            const std::uint16_t standing = face.getGlyphID(text.char32At(i), true);
            const bool stands = isVertical && standing != glyph && standing < 65535;
            const UnicodeString key(text, i, text.moveIndex32(i, 1) - i);
            (stands ? vertical : horizontal).try_emplace(toKey(key), 1, stands ? standing : glyph);
        }
    }

    void embedClusters(const UnicodeString& text, const std::vector<TLGlyphEntry>& entries,
                       bool isVertical) {
        SVGGlyphMap& map = isVertical ? vertical : horizontal;
        std::vector<std::uint16_t>* last = nullptr;
        std::int32_t offset = 0;
        for (const TLGlyphEntry& entry : entries) {
            if (entry.charCount != 0) {
                const UnicodeString cluster = text.tempSubString(offset, entry.charCount);
                const auto [place, added] = map.try_emplace(toKey(cluster), 1, entry.glyphId);
                last = added ? &place->second : nullptr;
                offset += entry.charCount;
            } else if (last && entry.glyphId <= 65534) {
                last->push_back(entry.glyphId);
            }
        }
    }

    void embedRun(const UnicodeString& text, const std::vector<TLGlyphEntry>& entries,
                  bool isVertical) {
        std::vector<std::uint16_t> ids;
        for (const TLGlyphEntry& entry : entries) {
            if (entry.glyphId < 65535) {
                ids.push_back(entry.glyphId);
            }
        }
        (isVertical ? vertical : horizontal).try_emplace(toKey(text), ids);
    }

    static SVGEmbTLString toKey(const UnicodeString& text) { return SVGEmbTLString(viewOf(text)); }

    SVGGlyphMap horizontal;
    SVGGlyphMap vertical;

private:
    const MoxFontService_NS::FS_FontInfo& face;
};

/// Calls that nobody would make, the same for each number.
class Chance {
public:
    explicit Chance(unsigned seed) : random(seed) {}

    template <typename Value, std::size_t count> Value pick(const Value (&values)[count]) {
        return values[random() % count];
    }

    bool oneIn(unsigned count) { return random() % count == 0; }

    UnicodeString makeText() {
        // Characters with and without a glyph and a vertical form, halves of pairs and a null.
        constexpr char16_t units[] = {u'X',      u'X',      u'[',      u' ',   u'a',   u'\uFF3B',
                                      u'\u337B', u'\u4E00', u'\uFFFF', 0xD840, 0xDC0B, 0};
        UnicodeString text;
        while (!oneIn(5)) {
            text.append(pick(units));
        }
        return text;
    }

    std::vector<TLGlyphEntry> makeEntries() {
        constexpr std::int16_t counts[] = {0, 0, 1, 1, 1, 2, 3, -1, -2, 32767, -32768};
        constexpr std::uint16_t glyphs[] = {0, 1, 2, 3, 4, 60000, 65534, 65535};
        std::vector<TLGlyphEntry> entries;
        while (!oneIn(6)) {
            entries.push_back({pick(counts), pick(glyphs)});
        }
        return entries;
    }

private:
    std::mt19937 random;
};

void embed(SVGEmbFont& font, PlainMaps& maps, Chance& chance) {
    const UnicodeString text = chance.makeText();
    const bool vertical = chance.oneIn(2);
    if (chance.oneIn(3)) {
        font.embedText(text, vertical);
        maps.embedText(text, vertical);
        return;
    }
    const std::vector<TLGlyphEntry> entries = chance.makeEntries();
    const bool wholeRun = chance.oneIn(3);
    embedGlyphs(font, text, entries, wholeRun, vertical);
    if (wholeRun) {
        maps.embedRun(text, entries, vertical);
    } else {
        maps.embedClusters(text, entries, vertical);
    }
}

/// Adds an entry, as anybody may.
void addFromOutside(SVGEmbFont& font, PlainMaps& maps, Chance& chance) {
    const bool vertical = chance.oneIn(2);
    const SVGEmbTLString key = PlainMaps::toKey(chance.makeText());
    (vertical ? font.verticalGlyphs : font.horizontalGlyphs).try_emplace(key, 1, 7);
    (vertical ? maps.vertical : maps.horizontal).try_emplace(key, 1, 7);
}

/// Makes random calls on fonts of this face, every second time with additions from outside.
void compareWithPlainMaps(const UnicodeString& face, FS_ExtraFonts& fonts) {
    for (unsigned seed = 0; seed < 200; ++seed) {
        Chance chance(seed);
        SVGEmbFont font(makeFont(face, false), &fonts);
        PlainMaps maps(font.fontInfo);
        for (int i = 0; i < 60; ++i) {
            if (seed % 2 == 0 && chance.oneIn(20)) {
                addFromOutside(font, maps, chance);
            }
            embed(font, maps, chance);
            ASSERT_EQ(font.horizontalGlyphs, maps.horizontal) << seed << ", call " << i;
            ASSERT_EQ(font.verticalGlyphs, maps.vertical) << seed << ", call " << i;
        }
    }
}

TEST(SVGEmbFontMaps, HoldWhatAPlainSearchWouldHavePutThere) {
    compareWithPlainMaps(uprightFace, testFonts());
}

TEST(SVGEmbFontMaps, HoldSoOfAFaceWithGlyphsForPairsAndForTheirHalves) {
    TinyFont file("Pair Test");
    for (const int character : {0, 0x20, 0x58, 0xD840, 0xDC0B, 0x2000B}) {
        file.characters[character] = file.addGlyph({});
    }
    FS_ExtraFonts fonts;
    ASSERT_TRUE(fonts.addBytes(file.build()));
    compareWithPlainMaps(u"Pair Test", fonts);
}

} // namespace
} // namespace DrawmereTest
