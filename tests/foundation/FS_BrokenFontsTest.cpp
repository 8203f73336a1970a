#include "foundation/fontservice/FS_FontInfo.h"

#include "tests/foundation/TestFonts.h"
#include "tests/support/TinyFont.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <iterator>
#include <random>

using namespace DrawmereTest;
using namespace MoxFontService_NS;

namespace {

const TinyContour triangle = {{0, 0}, {500, 0}, {250, 700}};

bool create(const std::string& bytes, FS_FontInfo& font) {
    FS_ExtraFonts extra;
    FS_ExtraFont description;
    description.names = {u"broken"};
    return extra.addBytes(bytes, description) &&
           font.createFont(u"broken", 650, true, 3, &extra, true);
}

FS_FontInfo createSound(const std::string& bytes) {
    FS_FontInfo font;
    EXPECT_TRUE(create(bytes, font));
    return font;
}

std::size_t readNumber(const std::string& bytes, std::size_t place) {
    std::size_t number = 0;
    for (const char byte : bytes.substr(place, 4)) {
        number = number << 8U | static_cast<unsigned char>(byte);
    }
    return number;
}

void writeNumber(std::string& bytes, std::size_t place, std::size_t number) {
    for (std::size_t i = 4; i > 0; --i) {
        bytes[place + i - 1] = static_cast<char>(number);
        number >>= 8U;
    }
}

// Puts a table last in the file, without its last bytes.
std::string moveToEndAndCut(std::string bytes, const std::string& tag, std::size_t cut) {
    const std::size_t entry = bytes.find(tag);
    const std::size_t length = readNumber(bytes, entry + 12) - cut;
    const std::string table = bytes.substr(readNumber(bytes, entry + 8), length);
    writeNumber(bytes, entry + 8, bytes.size());
    writeNumber(bytes, entry + 12, length);
    return bytes + table;
}

TinyContour makePolygon(int count) {
    TinyContour contour;
    for (int i = 0; i < count; ++i) {
        contour.push_back({i % 1000, i / 1000});
    }
    return contour;
}

// Reads all that a font of this size may have, and more.
void readEverything(const FS_FontInfo& font) {
    constexpr int glyphCount = 24;
    FS_GlyphDrawInfo info;
    for (int glyph = 0; glyph < glyphCount; ++glyph) {
        font.getGlyphDrawInfo(static_cast<unsigned short>(glyph), info, false);
        for (const FS_GlyphPolygon& polygon : info.polygons) {
            ASSERT_FALSE(polygon.segmentTypes.empty());
            ASSERT_GT(polygon.points.size(), polygon.segmentTypes.size());
        }
    }
    for (const int codePoint : {0x20, 0x41, 0x66, 0x3041, 0x4E00, 0xFF3B, 0xF041, 0x628, 0x10000}) {
        font.getGlyphID(codePoint, true);
        font.getGlyphDrawInfo(font.getGlyphID(codePoint, false), info, false);
    }
    FS_NewTextMetricEx metrics;
    font.getOutlineTextMetrics(metrics, -1000);
    EXPECT_GT(font.getUnitsPerEm(), 0);
    font.getDefaultCharWidth(0);
}

// Changes some bytes, half of them in the first tables, or cuts the font off.
std::string mutate(std::string bytes, std::mt19937& random) {
    constexpr std::size_t headSize = 600;
    const auto pick = [&random](std::size_t count) { return random() % count; };
    for (std::size_t changes = 1 + pick(8); changes > 0 && !bytes.empty(); --changes) {
        const bool anywhere = pick(2) == 0;
        const std::size_t place = pick(anywhere ? bytes.size() : std::min(bytes.size(), headSize));
        const char values[] = {
            static_cast<char>(pick(256)),
            '\xFF',
            static_cast<char>(bytes[place] ^ (1 << pick(8))),
            bytes[pick(bytes.size())],
        };
        bytes[place] = values[pick(std::size(values))];
        if (pick(40) == 0) {
            bytes.resize(place);
        }
    }
    return bytes;
}

void readMutations(const std::string& bytes, int count) {
    constexpr unsigned seed = 20'240'607;
    std::mt19937 random(seed);
    int created = 0;
    for (int i = 0; i < count; ++i) {
        FS_FontInfo font;
        if (create(mutate(bytes, random), font)) {
            ++created;
            readEverything(font);
        }
    }
    EXPECT_GT(created, count / 20); // else the test would read nothing
}

class FS_BrokenFontsTest : public testing::TestWithParam<const char*> {};

} // namespace

TEST(FS_BrokenFonts, GlyphThatHoldsItselfCantBeRead) {
    TinyFont tiny("Tiny");
    tiny.addComposite({1, 1}); // itself
    tiny.addComposite({3});    // each other
    tiny.addComposite({2});
    tiny.addGlyph({triangle});
    const FS_FontInfo font = createSound(tiny.build());
    EXPECT_EQ(outlineOf(font, 1), "unreadable");
    EXPECT_EQ(outlineOf(font, 2), "unreadable");
    EXPECT_EQ(outlineOf(font, 3), "unreadable");
    EXPECT_EQ(outlineOf(font, 4), "M0,0 L500,0 L250,700 Z");
}

TEST(FS_BrokenFonts, GlyphWhosePartsDoubleWithoutEndCantBeRead) {
    TinyFont tiny("Tiny");
    int last = tiny.addGlyph({}); // nothing in it, so no count of points stops the doubling
    for (int i = 0; i < 60; ++i) {
        last = tiny.addComposite({last, last});
    }
    const FS_FontInfo font = createSound(tiny.build());
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(outlineOf(font, static_cast<unsigned short>(last)), "unreadable");
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(5));
    EXPECT_EQ(outlineOf(font, 3), "");
}

TEST(FS_BrokenFonts, LastGlyphIsCountedOutThoughItsEndIsMissing) {
    TinyFont tiny("Tiny");
    int last = tiny.addGlyph({});
    for (int i = 0; i < 60; ++i) {
        last = tiny.addComposite({last, last});
    }
    const FS_FontInfo font = createSound(moveToEndAndCut(tiny.build(), "loca", 4));
    EXPECT_EQ(outlineOf(font, static_cast<unsigned short>(last)), "unreadable");
}

TEST(FS_BrokenFonts, EmptyGlyphIsNotTakenForThePartsThatFollowIt) {
    TinyFont tiny("Tiny");
    const int empty = tiny.addGlyph({}, 321);
    tiny.addComposite({empty + 2, empty}); // stands where the empty one would
    tiny.addGlyph({triangle});
    const FS_FontInfo font = createSound(tiny.build());
    EXPECT_EQ(outlineOf(font, static_cast<unsigned short>(empty)), "");
    EXPECT_EQ(outlineOf(font, static_cast<unsigned short>(empty + 1)), "M0,0 L500,0 L250,700 Z");
}

TEST(FS_BrokenFonts, DeepChainOfPartsCantBeRead) {
    TinyFont tiny("Tiny");
    int last = tiny.addGlyph({triangle});
    for (int i = 0; i < 60'000; ++i) {
        last = tiny.addComposite({last});
    }
    const FS_FontInfo font = createSound(tiny.build());
    EXPECT_EQ(outlineOf(font, static_cast<unsigned short>(last)), "unreadable");
    EXPECT_EQ(outlineOf(font, 9), "M0,0 L500,0 L250,700 Z");
}

TEST(FS_BrokenFonts, PartThatIsNoGlyphCantBeRead) {
    TinyFont tiny("Tiny");
    tiny.addComposite({9});
    tiny.addComposite({65535, 0});
    const FS_FontInfo font = createSound(tiny.build());
    EXPECT_EQ(outlineOf(font, 1), "unreadable");
    EXPECT_EQ(outlineOf(font, 2), "unreadable");
    EXPECT_EQ(outlineOf(font, 3), "unreadable");
    EXPECT_EQ(outlineOf(font, 65535), "unreadable");
}

TEST(FS_BrokenFonts, HugeOutlineCantBeRead) {
    TinyFont tiny("Tiny");
    tiny.addGlyph({makePolygon(20'000)});
    tiny.addGlyph({makePolygon(20'001)});
    const int many = tiny.addGlyph({makePolygon(100)});
    tiny.addComposite(std::vector<int>(150, many));
    tiny.addComposite(std::vector<int>(250, many));
    const FS_FontInfo font = createSound(tiny.build());
    EXPECT_NE(outlineOf(font, 1), "unreadable");
    EXPECT_EQ(outlineOf(font, 2), "unreadable");
    EXPECT_NE(outlineOf(font, 4), "unreadable");
    EXPECT_EQ(outlineOf(font, 5), "unreadable");
}

TEST(FS_BrokenFonts, FontCutOffAnywhereNeverBreaksTheReader) {
    TinyFont tiny("Tiny");
    tiny.characters['A'] = tiny.addGlyph({triangle});
    tiny.addComposite({1, 1});
    tiny.heights = {1000};
    tiny.axes = {{{'w', 'g', 'h', 't'}, 400, 800}};
    const std::string bytes = tiny.build();
    for (std::size_t size = 0; size < bytes.size(); size += 3) {
        FS_FontInfo font;
        if (create(bytes.substr(0, size), font)) {
            readEverything(font);
        }
    }
}

TEST(FS_BrokenFonts, MutatedTinyFontsNeverBreakTheReader) {
    TinyFont tiny("Tiny");
    tiny.characters['A'] = tiny.addGlyph({triangle});
    tiny.characters['B'] = tiny.addGlyph({{{0, 0, false}, {9, 9, false}, {0, 9}}, triangle});
    tiny.addComposite({1, 2});
    tiny.addComposite({3, 1, 3});
    tiny.heights = {1000, 900};
    tiny.axes = {{{'w', 'g', 'h', 't'}, 400, 800}, {{'w', 'd', 't', 'h'}, 100, 200}};
    readMutations(tiny.build(), 1000);
    tiny.axes.clear();
    readMutations(TinyFont::buildCollection({tiny, tiny}), 300);
    readMutations(buildTypeOne(), 500);
    readMutations(buildBitmapFont(), 300);
}

TEST_P(FS_BrokenFontsTest, MutatedFontsNeverBreakTheReader) {
    readMutations(fontBytes(GetParam()), 300);
}

INSTANTIATE_TEST_SUITE_P(FS_BrokenFonts, FS_BrokenFontsTest,
                         testing::Values("AdobeVFPrototype-Subset.otf", "Lobster.ttf",
                                         "SimpArabicTest.ttf", "SourceHanSans-subset-vert.otf",
                                         "TestSFNTOne.otf", "TestVRTR-TTF-Regular.ttf"));
