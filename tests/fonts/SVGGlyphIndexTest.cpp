#include "fonts/SVGGlyphIndex.h"

#include "tests/fonts/EmbeddedFont.h"

#include <algorithm>
#include <bit>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

/// A map that is filled along with its index.
struct IndexedMap {
    void add(std::u16string_view text) {
        const auto [entry, added] = map.try_emplace(SVGEmbTLString(text));
        if (added) {
            index.add(map, *entry);
        }
    }

    bool knows(std::u16string_view text) {
        index.follow(map);
        return index.knows(text);
    }

    SVGGlyphMap map;
    SVGGlyphIndex index;
};

/// Returns: a text of three units that no other number has.
std::u16string makeText(int number) {
    std::u16string text(3, u'a');
    text[0] = static_cast<char16_t>(number);
    text[1] = static_cast<char16_t>(number >> 8);
    return text;
}

TEST(SVGGlyphIndex, KnowsWhatTheMapHas) {
    IndexedMap texts;
    EXPECT_FALSE(texts.knows(u"fi"));
    texts.add(u"fi");
    texts.add(u"f");
    EXPECT_TRUE(texts.knows(u"fi"));
    EXPECT_TRUE(texts.knows(u"f"));
    EXPECT_FALSE(texts.knows(u"i"));
    EXPECT_FALSE(texts.knows(u""));
    texts.add(u"");
    EXPECT_TRUE(texts.knows(u""));
}

TEST(SVGGlyphIndex, TellsTextsWithNullCharactersApart) {
    using namespace std::string_view_literals;
    IndexedMap texts;
    texts.add(u"a\0"sv);
    EXPECT_TRUE(texts.knows(u"a\0"sv));
    EXPECT_FALSE(texts.knows(u"a"sv));
    EXPECT_FALSE(texts.knows(u"a\0\0"sv));
}

TEST(SVGGlyphIndex, KnowsAllOfAManyAndNothingElse) {
    constexpr int count = 20'000;
    IndexedMap texts;
    for (int i = 0; i < count; i += 2) {
        ASSERT_FALSE(texts.knows(makeText(i)));
        texts.add(makeText(i));
    }
    for (int i = 0; i < count; ++i) {
        ASSERT_EQ(texts.knows(makeText(i)), i % 2 == 0) << i;
    }
}

TEST(SVGGlyphIndex, AMapThatWasChangedFromOutsideIsReadAnew) {
    IndexedMap texts;
    texts.add(u"a");
    ASSERT_TRUE(texts.knows(u"a"));
    texts.map.try_emplace(SVGEmbTLString(u"b"));
    EXPECT_TRUE(texts.knows(u"b"));
    texts.map.clear();
    EXPECT_FALSE(texts.knows(u"a"));
    EXPECT_FALSE(texts.knows(u"b"));
}

TEST(SVGGlyphIndex, WhatWasTakenOutIsForgottenWhenTheNextComes) {
    IndexedMap texts;
    for (const std::u16string_view text : {u"ab", u"cd", u"e"}) {
        texts.add(text);
        ASSERT_TRUE(texts.knows(text));
    }
    texts.map.erase(SVGEmbTLString(u"ab"));
    texts.map.erase(SVGEmbTLString(u"e"));
    texts.add(u"fg");
    texts.add(u"hi"); // and the count is what it was
    EXPECT_FALSE(texts.knows(u"ab"));
    EXPECT_FALSE(texts.knows(u"e"));
    EXPECT_TRUE(texts.knows(u"cd"));
    EXPECT_TRUE(texts.knows(u"hi"));
}

/// Returns: texts that the index would look for in one place, as somebody who knows it may make.
std::vector<std::u16string> makeCrowd(std::size_t count) {
    constexpr std::uint64_t spread = 0x9E3779B97F4A7C15;
    std::vector<std::u16string> crowd;
    for (std::uint32_t number = 0; crowd.size() < count; ++number) {
        const std::u16string text = {static_cast<char16_t>(number >> 16),
                                     static_cast<char16_t>(number)};
        const std::uint64_t length = text.size();
        const std::uint64_t mixed = (std::rotl(length, 27) ^ number) * spread;
        const std::uint64_t hash = (mixed ^ mixed >> 32) * spread;
        if (hash >> 52 == 0) {
            crowd.push_back(text);
        }
    }
    return crowd;
}

TEST(SVGGlyphIndex, ATextThatFindsNoPlaceIsLeftToTheMap) {
    constexpr std::ptrdiff_t longestSearch = 256;
    const std::vector<std::u16string> crowd = makeCrowd(600);
    IndexedMap texts;
    texts.index.follow(texts.map);
    for (const std::u16string& text : crowd) {
        texts.add(text);
    }
    ASSERT_EQ(texts.map.size(), crowd.size());
    EXPECT_EQ(std::ranges::count_if(crowd, [&](const auto& text) { return texts.knows(text); }),
              longestSearch);
}

} // namespace
} // namespace DrawmereTest
