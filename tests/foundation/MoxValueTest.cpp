#include "foundation/common/MoxValue.h"

#include "foundation/common/MoxNamedValueMap.h"
#include "tests/support/Utf8.h"

#include <climits>
#include <cmath>
#include <gtest/gtest.h>
#include <limits>
#include <new>
#include <vector>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::utf8;

constexpr float notANumber = std::numeric_limits<float>::quiet_NaN();
constexpr float infinity = std::numeric_limits<float>::infinity();

const char16_t* const tenCharacters = u"0123456789";
const char16_t* const elevenCharacters = u"0123456789A";
const char16_t* const wideText = u"\u65E5\u672C\u8A9E";

MoxNamedValueMap makeMap() {
    MoxNamedValueMap map;
    map.setNamedItem(MOXNAME_ID, u"an identifier of more than ten characters");
    map.setNamedItem(MOXNAME_PAGE, 12);
    return map;
}

/// One value of every kind and of every way to keep it; no two are equal.
std::vector<MoxValue> makeAllKinds() {
    return {
        MoxValue(),
        MoxValue(0),
        MoxValue(7),
        MoxValue(7.0F),
        MoxValue(0.5F),
        MoxValue(MoxLength::fromRaw(7.0F)),
        MoxValue(MoxColor(7U)),
        MoxValue(MoxColor(255, 0, 0)),
        MoxValue(MoxName::fromNumber(7)),
        MoxValue(MoxName(MOXNAME_SVG)),
        MoxValue(u""),
        MoxValue(u"svg"),
        MoxValue(tenCharacters),
        MoxValue(elevenCharacters),
        MoxValue(wideText),
        MoxValue(MoxNamedValueMap()),
        MoxValue(makeMap()),
    };
}

TEST(MoxValue, HasSixteenBytes) { EXPECT_EQ(sizeof(MoxValue), 16U); }

TEST(MoxValue, HoldsWhatItIsMadeFrom) {
    const struct {
        MoxValue value;
        int type;
        const char* text;
    } rows[] = {
        {MoxValue(), 0, ""},
        {MoxValue(12), 1, "12"},
        {MoxValue(INT_MIN), 1, "-2147483648"},
        {MoxValue(0.1F), 2, "0.1"},
        {MoxValue(0.1), 2, "0.1"}, // a double is rounded to a float
        {MoxValue(-0.0F), 2, "0"},
        {MoxValue(notANumber), 2, "0"},
        {MoxValue(1e20F), 2, "100000002004087734272"},
        {MoxValue(MoxName(MOXNAME_TB_RL)), 3, "tb-rl"},
        {MoxValue(MoxName()), 3, ""},
        {MoxValue(UnicodeString(u"some text")), 4, "some text"},
        {MoxValue(std::u16string_view(u"view")), 4, "view"},
        {MoxValue(u"literal"), 4, "literal"},
        {MoxValue(UnicodeString()), 4, ""},
        {MoxValue(MoxLength(1.0F, MOXUNIT_INCH)), 5, "72pt"},
        {MoxValue(MoxLength::fromRaw(-0.5F)), 5, "-0.5pt"},
        {MoxValue(MoxColor()), 6, "#000"},
        {MoxValue(MoxColor(255, 0, 0)), 6, "red"},
        {MoxValue(MoxColor(1, 2, 3)), 6, "#010203"},
        {MoxValue(makeMap()), 7, ""},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(row.value.getType(), row.type) << row.text;
        EXPECT_EQ(utf8(row.value.toString()), row.text);
        EXPECT_EQ(row.value.getKey(), MoxName()) << row.text;
    }
}

TEST(MoxValue, TheTagsOfNamesAndStringsAreThreeAndFour) {
    EXPECT_EQ(MoxValue(MoxName(MOXNAME_SVG)).getType(), 3);
    EXPECT_EQ(MoxValue(u"svg").getType(), 4);
}

TEST(MoxValue, ABogusTextIsAnEmptyOne) {
    UnicodeString bogus;
    bogus.setToBogus();
    EXPECT_EQ(MoxValue(bogus), MoxValue(u""));
}

TEST(MoxValue, OwnsItsText) {
    UnicodeString text(wideText);
    const MoxValue value(text);
    text.setTo(u"changed");
    EXPECT_EQ(value.toString(), UnicodeString(wideText));
}

TEST(MoxValue, KeepsTextsOfAnyLengthAndKind) {
    for (const char16_t unit :
         {u'a', u'\x7F', u'\x80', u'\u00E9', u'\u4E00', u'\xD800', u'\xFFFF'}) {
        for (int length = 0; length < 40; ++length) {
            const UnicodeString text(length, unit, length);
            const MoxValue value(text);
            ASSERT_EQ(value.toString(), text);
            ASSERT_EQ(value.isWideText(), length > 0 && unit >= 0x80);
            ASSERT_EQ(value.getWideText().size() + value.getAsciiText().size(),
                      static_cast<std::size_t>(length));
            ASSERT_EQ(MoxValue(value), value);
        }
    }
}

TEST(MoxValue, AZeroCharacterIsPartOfAText) {
    const UnicodeString text(u"a\0b", 3);
    EXPECT_EQ(MoxValue(text).toString(), text);
    EXPECT_NE(MoxValue(text), MoxValue(u"a"));
}

TEST(MoxValue, OneWideCharacterMakesTheWholeTextWide) {
    const UnicodeString text(u"plain until the last \u00E9");
    EXPECT_TRUE(MoxValue(text).isWideText());
    EXPECT_EQ(MoxValue(text).toString(), text);
}

TEST(MoxValue, IsMadeFromAsciiBytesToo) {
    EXPECT_EQ(MoxValue::fromAscii("M0 0"), MoxValue(u"M0 0"));
    EXPECT_EQ(MoxValue::fromAscii("0123456789"), MoxValue(tenCharacters));
    EXPECT_EQ(MoxValue::fromAscii("0123456789A"), MoxValue(elevenCharacters));
    EXPECT_EQ(MoxValue::fromAscii(""), MoxValue(u""));
    EXPECT_EQ(MoxValue::fromAscii("caf\xE9"), MoxValue(u"caf\u00E9"));
    EXPECT_TRUE(MoxValue::fromAscii("\x80").isWideText());
}

TEST(MoxValue, AsciiBytesBeyondWhatAStringCanCountAreRefusedUnread) {
    constexpr std::size_t tooMany = std::size_t{INT32_MAX} + 1;
    EXPECT_THROW(MoxValue::fromAscii({"", tooMany}), std::bad_alloc);
}

/// Returns: a value that took over a block with `text` in its middle.
MoxValue adopt(std::string_view text) {
    MoxByteBlock block = makeZeroBlock(text.size() + 8);
    std::copy(text.begin(), text.end(), block.get() + 5);
    return MoxValue::adoptAscii(std::move(block), 5, text.size());
}

TEST(MoxValue, TakesOverATextThatLiesReady) {
    MoxByteBlock block = makeZeroBlock(100);
    const char* const bytes = block.get();
    const MoxValue value = MoxValue::adoptAscii(std::move(block), 3, 50);
    EXPECT_EQ(value.getAsciiText().data(), bytes + 3);
    EXPECT_EQ(value.getAsciiText().size(), 50U);
    EXPECT_EQ(value.getType(), MOXVALUE_STRING);
    EXPECT_FALSE(value.isWideText());
}

TEST(MoxValue, AdoptedTextIsATextLikeAnyOther) {
    for (const char* const text : {"", "short", "0123456789", "longer than what fits inside"}) {
        EXPECT_EQ(adopt(text), MoxValue::fromAscii(text));
        EXPECT_EQ(adopt(text).toString(), UnicodeString(text));
    }
    EXPECT_NE(adopt("one"), MoxValue(u"other"));
    EXPECT_EQ(adopt("12pt").getRealValue(MOXUNIT_POINT), 12.0F);
}

TEST(MoxValue, CopyOfAnAdoptedTextOutlivesIt) {
    for (const char* const text : {"short", "longer than what fits inside"}) {
        MoxValue copy;
        {
            MoxValue original = adopt(text);
            copy = original;
            EXPECT_NE(copy.getAsciiText().data(), original.getAsciiText().data());
            const MoxValue moved(std::move(original));
            EXPECT_EQ(moved, copy);
        }
        EXPECT_EQ(copy, MoxValue::fromAscii(text));
    }
}

TEST(MoxValue, IsEqualWhenTypeAndContentAgree) {
    const std::vector<MoxValue> values = makeAllKinds();
    const std::vector<MoxValue> same = makeAllKinds();
    for (std::size_t i = 0; i < values.size(); ++i) {
        for (std::size_t k = 0; k < same.size(); ++k) {
            EXPECT_EQ(values[i] == same[k], i == k) << i << " and " << k;
            EXPECT_EQ(values[i] != same[k], i != k) << i << " and " << k;
        }
    }
}

TEST(MoxValue, TheKeyPlaysNoPartInEquality) {
    MoxValue value(7);
    value.setKey(MOXNAME_ID);
    EXPECT_EQ(value, MoxValue(7));
}

TEST(MoxValue, NaNDiffersFromEverything) {
    const MoxValue value(notANumber);
    EXPECT_TRUE(value != MoxValue(notANumber));
    EXPECT_TRUE(value != MoxValue(value));
    EXPECT_TRUE(MoxValue(0.0F) == MoxValue(-0.0F));
}

TEST(MoxValue, CopiesOfEveryKindOutliveTheirSource) {
    std::vector<MoxValue> values = makeAllKinds();
    const std::vector<MoxValue> copies(
        values); // NOLINT(performance-unnecessary-copy-initialization)
    for (std::size_t i = 0; i < values.size(); ++i) {
        EXPECT_EQ(values[i], copies[i]) << i;
        values[i] = MoxValue(u"something else altogether");
    }
    EXPECT_EQ(copies, makeAllKinds());
}

TEST(MoxValue, CopiesShareALongText) {
    for (const char16_t* text : {u"longer than a value", u"l\u00E4nger als ein Wert"}) {
        const MoxValue value(text);
        const MoxValue copy(value); // NOLINT(performance-unnecessary-copy-initialization)
        EXPECT_EQ(value.getAsciiText().data(), copy.getAsciiText().data());
        EXPECT_EQ(value.getWideText().data(), copy.getWideText().data());
    }
}

TEST(MoxValue, AssignsEveryKindOverEveryKind) {
    const std::vector<MoxValue> values = makeAllKinds();
    for (const MoxValue& source : values) {
        for (const MoxValue& before : values) {
            MoxValue target(before);
            target = source;
            EXPECT_EQ(target, source);
            MoxValue moved(before);
            moved = std::move(target);
            EXPECT_EQ(moved, source);
        }
    }
}

TEST(MoxValue, AMoveLeavesTheNullValue) {
    for (MoxValue& value : makeAllKinds()) {
        const MoxValue copy(value);
        const MoxValue moved(std::move(value));
        EXPECT_EQ(moved, copy);
        EXPECT_EQ(value.getType(), MOXVALUE_NULL); // NOLINT(bugprone-use-after-move): the claim
    }
}

TEST(MoxValue, AssigningToItselfChangesNothing) {
    for (MoxValue& value : makeAllKinds()) {
        const MoxValue copy(value);
        const MoxValue& same = value;
        value = same;
        EXPECT_EQ(value, copy);
        MoxValue& sameAgain = value;
        value = std::move(sameAgain);
        EXPECT_EQ(value, copy);
    }
}

TEST(MoxValue, CanTakeAnItemOfItsOwnMap) {
    MoxNamedValueMap outer;
    outer.setNamedItem(MOXNAME_INTERNAL, makeMap());
    MoxValue value(outer);
    value = value.getNamedItem(MOXNAME_INTERNAL);
    EXPECT_EQ(value, MoxValue(makeMap()));
    value = value.getNamedItem(MOXNAME_ID);
    EXPECT_EQ(utf8(value.toString()), "an identifier of more than ten characters");
}

TEST(MoxValue, ACopyCarriesTheKey) {
    MoxValue value(u"a text of more than ten characters");
    value.setKey(MOXNAME_ID);
    EXPECT_EQ(MoxValue(value).getKey(), MoxName(MOXNAME_ID));
    MoxValue assigned;
    assigned = value;
    EXPECT_EQ(assigned.getKey(), MoxName(MOXNAME_ID));
}

TEST(MoxValue, TheNullValueIsNullAndHasKeyZero) {
    EXPECT_EQ(MoxValue::NULL_VALUE.getType(), MOXVALUE_NULL);
    EXPECT_EQ(MoxValue::NULL_VALUE.getKey(), MoxName());
    EXPECT_EQ(MoxValue::NULL_VALUE, MoxValue());
    EXPECT_EQ(utf8(MoxValue::NULL_VALUE.toString()), "");
}

TEST(MoxValue, GivesAnInteger) {
    const struct {
        MoxValue value;
        int number;
    } rows[] = {
        {MoxValue(), 0},
        {MoxValue(-7), -7},
        {MoxValue(INT_MIN), INT_MIN},
        {MoxValue(2.9F), 2}, // towards zero
        {MoxValue(-2.9F), -2},
        {MoxValue(3e9F), INT_MAX}, // within the range
        {MoxValue(-3e9F), INT_MIN},
        {MoxValue(infinity), INT_MAX},
        {MoxValue(-infinity), INT_MIN},
        {MoxValue(notANumber), 0},
        {MoxValue(MoxLength::fromRaw(5.5F)), 5},
        {MoxValue(u"12"), 12},
        {MoxValue(u"-12"), -12},
        {MoxValue(u"+5"), 5},
        {MoxValue(u"12abc"), 12},
        {MoxValue(u" \t12 "), 12},
        {MoxValue(u"3.9"), 3},
        {MoxValue(u"1e3"), 1000},
        {MoxValue(u"99999999999"), INT_MAX},
        {MoxValue(u"-99999999999"), INT_MIN},
        {MoxValue(u""), 0},
        {MoxValue(u"abc"), 0},
        {MoxValue(u"+"), 0},
        {MoxValue(u"-"), 0},
        {MoxValue(u"+-5"), 0},
        {MoxValue(u"++5"), 0},
        {MoxValue(u"inf"), 0}, // words are no numbers
        {MoxValue(u"nan"), 0},
        {MoxValue(u"0x10"), 0},
        {MoxValue(u"1e999"), 0},        // beyond any number
        {MoxValue(u"\u0661\u0662"), 0}, // digits, but none of ASCII
        {MoxValue(MoxName(u"42nd")), 42},
        {MoxValue(MoxName(MOXNAME_SVG)), 0},
        {MoxValue(MoxColor(255, 0, 0)), 0},
        {MoxValue(makeMap()), 0},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(row.value.getIntegerValue(), row.number) << utf8(row.value.toString());
    }
}

TEST(MoxValue, GivesARealInAUnit) {
    const struct {
        MoxValue value;
        MoxUnitType unit;
        float number;
    } rows[] = {
        {MoxValue(), MOXUNIT_POINT, 0.0F},
        {MoxValue(7), MOXUNIT_INCH, 7.0F}, // a number has no unit to convert
        {MoxValue(0.5F), MOXUNIT_MM, 0.5F},
        {MoxValue(MoxLength::fromRaw(36.0F)), MOXUNIT_INCH, 0.5F},
        {MoxValue(MoxLength::fromRaw(36.0F)), MOXUNIT_POINT, 36.0F},
        {MoxValue(MoxLength::fromRaw(36.0F)), MOXUNIT_PICA, 3.0F},
        {MoxValue(MoxLength::fromRaw(36.0F)), MOXUNIT_MM, 12.7F},
        {MoxValue(MoxLength::fromRaw(36.0F)), MOXUNIT_CM, 1.27F},
        {MoxValue(MoxLength::fromRaw(36.0F)), MOXUNIT_NONE, 36.0F},
        {MoxValue(u"0.25"), MOXUNIT_NONE, 0.25F},
        {MoxValue(u"  .5"), MOXUNIT_NONE, 0.5F},
        {MoxValue(u"2in"), MOXUNIT_POINT, 144.0F},
        {MoxValue(u"2IN"), MOXUNIT_POINT, 144.0F},
        {MoxValue(u"2.54cm"), MOXUNIT_INCH, 1.0F},
        {MoxValue(u"25.4mm;"), MOXUNIT_INCH, 1.0F},
        {MoxValue(u"1pc"), MOXUNIT_POINT, 12.0F},
        {MoxValue(u"1pt"), MOXUNIT_POINT, 1.0F},
        {MoxValue(u"2in"), MOXUNIT_NONE, 2.0F}, // no unit asks for the number itself
        {MoxValue(u"2in"), static_cast<MoxUnitType>(3), 2.0F},
        {MoxValue(u"2inch"), MOXUNIT_POINT, 2.0F}, // a word that only begins like a unit
        {MoxValue(u"2 in"), MOXUNIT_POINT, 2.0F},
        {MoxValue(u"2px"), MOXUNIT_POINT, 2.0F},
        {MoxValue(u"2em"), MOXUNIT_POINT, 2.0F},
        {MoxValue(u"1e2pt"), MOXUNIT_POINT, 100.0F},
        {MoxValue(u"in"), MOXUNIT_POINT, 0.0F},
        {MoxValue(u"none"), MOXUNIT_POINT, 0.0F},
        {MoxValue(MoxName(u"3in")), MOXUNIT_POINT, 216.0F},
        {MoxValue(MoxColor()), MOXUNIT_POINT, 0.0F},
        {MoxValue(makeMap()), MOXUNIT_POINT, 0.0F},
    };

    for (const auto& row : rows) {
        EXPECT_FLOAT_EQ(row.value.getRealValue(row.unit), row.number)
            << utf8(row.value.toString()) << " in " << row.unit;
    }
}

TEST(MoxValue, GivesAColor) {
    const MoxColor red(255, 0, 0);
    const MoxColor transparent(0, 0, 0, 0);
    const MoxColor half(1, 2, 3, 128);
    EXPECT_EQ(MoxValue(red).getColorValue(), red);
    EXPECT_EQ(MoxValue(half).getColorValue(), half);
    EXPECT_EQ(MoxValue(u"red").getColorValue(), red);
    EXPECT_EQ(MoxValue(u"#F00").getColorValue(), red);
    EXPECT_EQ(MoxValue(u"rgb(100%,0%,0%)").getColorValue(), red);
    EXPECT_EQ(MoxValue(MoxName(u"red")).getColorValue(), red);
    EXPECT_EQ(MoxValue(u"no colour").getColorValue(), transparent);
    EXPECT_EQ(MoxValue(MoxName(MOXNAME_SVG)).getColorValue(), transparent);
    EXPECT_EQ(MoxValue().getColorValue(), transparent);
    EXPECT_EQ(MoxValue(0xFF0000).getColorValue(), transparent);
    EXPECT_EQ(MoxValue(makeMap()).getColorValue(), transparent);
}

TEST(MoxValue, GivesTheNameItHolds) {
    EXPECT_EQ(MoxValue(MoxName(MOXNAME_SVG)).getNameValue(), MoxName(MOXNAME_SVG));
    EXPECT_EQ(MoxValue(u"svg").getNameValue(), MoxName());
    EXPECT_EQ(MoxValue(1431).getNameValue(), MoxName());
}

TEST(MoxValue, GivesTheItemsOfAMap) {
    const MoxValue value(makeMap());
    EXPECT_EQ(value.getNamedValueMap().getLength(), 2);
    EXPECT_EQ(value.getNamedItem(MOXNAME_PAGE).getKey(), MoxName(MOXNAME_PAGE));
    EXPECT_EQ(value.getNamedItem(MOXNAME_PAGE).getIntegerValue(), 12);
    EXPECT_EQ(value.getNamedItem(MOXNAME_NAME).getKey(), MoxName());
    EXPECT_EQ(value.getNamedItem(MOXNAME_NAME), MoxValue::NULL_VALUE);
    EXPECT_EQ(value.getNamedItem(MoxName()), MoxValue::NULL_VALUE);
}

TEST(MoxValue, WhatIsNoMapHasNoItems) {
    for (const MoxValue& value : makeAllKinds()) {
        if (value.getType() != MOXVALUE_MAP) {
            EXPECT_EQ(value.getNamedValueMap().getLength(), 0);
            EXPECT_EQ(value.getNamedItem(MOXNAME_ID).getKey(), MoxName());
        }
    }
}

TEST(MoxValue, AMapMayHoldMaps) {
    MoxNamedValueMap outer;
    outer.setNamedItem(MOXNAME_INTERNAL, makeMap());
    const MoxValue value(outer);
    const MoxValue copy(value); // NOLINT(performance-unnecessary-copy-initialization)
    outer.setNamedItem(MOXNAME_INTERNAL, 1);
    EXPECT_EQ(copy, value);
    EXPECT_EQ(copy.getNamedItem(MOXNAME_INTERNAL).getNamedItem(MOXNAME_PAGE), MoxValue(12));
    EXPECT_NE(copy, MoxValue(outer));
}

TEST(MoxValue, EachUnitHasItsSuffix) {
    const char* const suffixes[] = {"", "", "", "", "", "", "cm", "mm", "in", "pt", "pc", "", ""};
    for (int unit = 0; unit <= 12; ++unit) {
        EXPECT_EQ(utf8(MoxValue::getUnitString(static_cast<MoxUnitType>(unit))), suffixes[unit]);
    }
    EXPECT_EQ(utf8(MoxValue::getUnitString(static_cast<MoxUnitType>(-1))), "");
}

} // namespace
