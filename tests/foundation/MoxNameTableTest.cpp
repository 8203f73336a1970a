#include "foundation/common/MoxNameTable.h"

#include "foundation/names/SVGName.h"
#include "tests/support/Utf8.h"

#include <array>
#include <gtest/gtest.h>
#include <set>
#include <string>
#include <thread>
#include <vector>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::utf8;

TEST(MoxNameTable, AllNamesWithoutAFixedNumberStartAt4096) {
    EXPECT_EQ(MoxNameTable::firstFreeNumber, 4096U);
    EXPECT_EQ(utf8(MoxNameTable::getSharedNameString(MoxName::fromNumber(4096))), "a");
    EXPECT_GE(MoxName(u"quite a new name").number, 4096U + TalCommon::SVGName::count_ - 1);
}

TEST(MoxNameTable, EachNewTextGetsTheNextNumber) {
    const MoxName one(u"counted one");
    const MoxName two(u"counted two");
    EXPECT_EQ(two.number, one.number + 1);
    EXPECT_EQ(MoxName(u"counted one"), one);
}

TEST(MoxNameTable, ANumberThatWasNeverGivenOutHasNoText) {
    // The first block of numbers, the next one, blocks that don't exist yet, and the last number.
    for (const std::uint32_t number :
         {1U, 185U, 4095U, 12000U, 100000U, 0x80000000U, 0xFFFFFFFFU}) {
        const MoxName name = MoxName::fromNumber(number);
        EXPECT_EQ(utf8(MoxNameTable::getSharedNameString(name)), "") << number;
        EXPECT_EQ(MoxNameTable::getEntry(name).xmlName, "") << number;
        EXPECT_FALSE(MoxNameTable::getEntry(name).isPlain) << number;
    }
}

TEST(MoxNameTable, KeepsTextsWhenTheCallersStringChanges) {
    UnicodeString text(u"a text that is long enough to be shared between copies of a string");
    const UnicodeString expected(text);
    const MoxName name(text);
    text.setTo(u"something else");
    EXPECT_EQ(MoxNameTable::getSharedNameString(name), expected);
}

TEST(MoxNameTable, HoldsManyNames) {
    constexpr int count = 50000; // beyond the first three blocks of numbers
    std::vector<MoxName> names;
    names.reserve(count);
    for (int i = 0; i < count; ++i) {
        names.emplace_back(UnicodeString::fromUTF8("name" + std::to_string(i)));
    }
    for (int i = 0; i < count; ++i) {
        ASSERT_EQ(utf8(MoxNameTable::getSharedNameString(names[i])), "name" + std::to_string(i));
        ASSERT_EQ(MoxName(UnicodeString::fromUTF8("name" + std::to_string(i))), names[i]);
    }
}

TEST(MoxNameTable, FourThreadsAgreeOnEveryNumber) {
    constexpr int count = 5000;
    std::array<std::vector<MoxName>, 4> names;
    std::vector<std::thread> threads;
    threads.reserve(names.size());
    for (std::vector<MoxName>& own : names) {
        threads.emplace_back([&own] {
            own.reserve(count);
            for (int i = 0; i < count; ++i) {
                own.emplace_back(UnicodeString::fromUTF8("shared" + std::to_string(i)));
                // Reading goes on while others write.
                const UnicodeString& text = MoxNameTable::getSharedNameString(own.back());
                own.back() = text.startsWith(u"shared") ? own.back() : MoxName();
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    std::set<std::uint32_t> numbers;
    for (int i = 0; i < count; ++i) {
        for (const std::vector<MoxName>& own : names) {
            ASSERT_EQ(own[i], names[0][i]);
        }
        ASSERT_EQ(utf8(MoxNameTable::getSharedNameString(names[0][i])),
                  "shared" + std::to_string(i));
        numbers.insert(names[0][i].number);
    }
    EXPECT_EQ(numbers.size(), static_cast<std::size_t>(count));
}

struct XmlNameRow {
    std::u16string_view text;
    const char* xmlName;
    bool isPlain;
};

constexpr XmlNameRow xmlNameRows[] = {
    {u"fill-rule", "fill-rule", true},
    {u"xlink:href", "xlink:href", true},
    {u"_a.b", "_a.b", true},
    {u"a1", "a1", true},
    {u":a", ":a", true},
    {u"1a", "_a", false},
    {u"-a", "_a", false},
    {u"a b", "a_b", false},
    {u"a<b>&\"c\"", "a_b___c_", false},
    {u"\n", "_", false},
    {u"a/b", "a_b", false},
    {u"http://www.w3.org/2000/svg", "http:__www.w3.org_2000_svg", false},
    {u"\u00E9t\u00E9", "\xC3\xA9t\xC3\xA9", false},
    {u"\u4E00", "\xE4\xB8\x80", false},
    {u"\u00D7", "_", false}, // a multiplication sign between letters of the same block
    {u"\xD83D\xDE00", "\xF0\x9F\x98\x80", false},
    {u"a\xD83D", "a_", false}, // half a surrogate pair
    {u"\xDE00\xD83D", "__", false},
    {u"xmlns", "xmlns", false},
    {u"xmlns:a", "xmlns:a", false},
    {u"xmlnsa", "xmlnsa", true},
};

TEST(MoxNameTable, MakesEveryTextFitToStandAsAnXmlName) {
    for (const XmlNameRow& row : xmlNameRows) {
        const UnicodeString text(row.text.data(), static_cast<int>(row.text.size()));
        const MoxNameTable::Entry& entry = MoxNameTable::getEntry(MoxName(text));
        EXPECT_EQ(entry.xmlName, row.xmlName);
        EXPECT_EQ(entry.isPlain, row.isPlain) << row.xmlName;
        EXPECT_EQ(entry.text, text) << row.xmlName;
    }
}

TEST(MoxNameTable, TextsWithEmbeddedZerosAreNamesOfTheirOwn) {
    const UnicodeString text(u"a\0b", 3);
    EXPECT_NE(MoxName(text), MoxName(u"a"));
    EXPECT_EQ(MoxNameTable::getSharedNameString(MoxName(text)).length(), 3);
    EXPECT_EQ(MoxNameTable::getEntry(MoxName(text)).xmlName, "a_b");
}

} // namespace
