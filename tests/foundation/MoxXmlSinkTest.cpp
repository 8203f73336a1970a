#include "foundation/common/MoxXmlSink.h"

#include "tests/support/Utf8.h"

#include <fstream>
#include <gtest/gtest.h>
#include <memory>
#include <sstream>
#include <string>
#include <unicode/ucnv.h>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::utf8;

/// A sink on a string.
class SinkTest {
public:
    explicit SinkTest(const char16_t* encoding) : sink(new MoxXmlSink(stream, encoding)) {}

    std::string finish() {
        sink->finish();
        return stream.str();
    }

    std::ostringstream stream;
    std::unique_ptr<MoxXmlSink> sink;
};

/// `bytes` read by `converter`'s encoding.
std::string decode(const std::string& bytes, const char* encoding) {
    return utf8(UnicodeString(bytes.data(), static_cast<int>(bytes.size()), encoding));
}

TEST(MoxXmlSink, HandsNothingOnBeforeItMust) {
    SinkTest test(u"");
    test.sink->write("abc");
    test.sink->write('d');
    EXPECT_EQ(test.stream.str(), "");
    EXPECT_EQ(test.finish(), "abcd");
}

TEST(MoxXmlSink, NothingWrittenIsNothingHandedOn) {
    EXPECT_EQ(SinkTest(u"").finish(), "");
    EXPECT_EQ(SinkTest(u"ISO-8859-1").finish(), "");
}

TEST(MoxXmlSink, PiecesOfEveryLengthStayInOrder) {
    for (const char16_t* encoding : {u"", u"ISO-8859-1"}) {
        SinkTest test(encoding);
        std::string expected;
        for (std::size_t length = 0; length < 9000; length += 613) {
            const std::string piece(length, static_cast<char>('a' + expected.size() % 26));
            test.sink->write(piece);
            test.sink->write('.');
            expected += piece + '.';
        }
        EXPECT_TRUE(test.finish() == expected);
    }
}

TEST(MoxXmlSink, RoomIsThereAlsoAtTheEndOfTheBuffer) {
    SinkTest test(u"");
    std::string expected;
    for (int i = 0; i < 200; ++i) {
        const std::size_t length = static_cast<std::size_t>(i) * 20 + 1;
        char* out = test.sink->room(MoxXmlSink::maxRoom);
        std::fill_n(out, length, static_cast<char>('a' + i % 26));
        test.sink->advance(out + length);
        expected += std::string(length, static_cast<char>('a' + i % 26));
    }
    EXPECT_TRUE(test.finish() == expected);
}

TEST(MoxXmlSink, TellsTheNameThatReadersKnow) {
    const struct {
        const char16_t* encoding;
        const char* name;
        bool converts;
    } rows[] = {
        {u"", "UTF-8", false},
        {u"UTF-8", "UTF-8", false},
        {u"utf8", "UTF-8", false},
        {u"latin1", "ISO-8859-1", true},
        {u"iso-8859-1", "ISO-8859-1", true},
        {u"ascii", "US-ASCII", true},
        {u"utf-16", "UTF-16", true},
        {u"UTF-16LE", "UTF-16LE", true},
        {u"sjis", "Shift_JIS", true},
        {u"euc-jp", "EUC-JP", true},
        {u"windows-1252", "windows-1252", true},
        {u"GB18030", "GB18030", true},
        {u"no such encoding", "UTF-8", false},
        {u"\u00E9", "UTF-8", false},
    };

    for (const auto& row : rows) {
        const SinkTest test(row.encoding);
        EXPECT_STREQ(test.sink->getEncodingName(), row.name);
        EXPECT_EQ(test.sink->isConverting(), row.converts) << row.name;
    }
}

TEST(MoxXmlSink, WhatAnEncodingLacksBecomesAReference) {
    const std::string text = "a\xC3\xA9\xE2\x82\xAC\xE6\x97\xA5\xF0\x9F\x98\x80z"; // e' euro sun :)

    const struct {
        const char16_t* encoding;
        const char* bytes;
    } rows[] = {
        {u"UTF-8", "a\xC3\xA9\xE2\x82\xAC\xE6\x97\xA5\xF0\x9F\x98\x80z"},
        {u"US-ASCII", "a&#233;&#8364;&#26085;&#128512;z"},
        {u"ISO-8859-1", "a\xE9&#8364;&#26085;&#128512;z"},
        {u"windows-1252", "a\xE9\x80&#26085;&#128512;z"},
        {u"Shift_JIS", "a&#233;&#8364;\x93\xFA&#128512;z"},
    };

    for (const auto& row : rows) {
        SinkTest test(row.encoding);
        test.sink->write(text);
        EXPECT_EQ(test.finish(), row.bytes);
    }
}

TEST(MoxXmlSink, InvisibleCharactersAreNotLost) {
    SinkTest test(u"US-ASCII");
    test.sink->write("a\xC2\xAD"
                     "b\xE2\x80\x8D"
                     "c"); // a soft hyphen and a joiner
    EXPECT_EQ(test.finish(), "a&#173;b&#8205;c");
}

TEST(MoxXmlSink, CharactersAcrossTheEndOfTheBufferStayWhole) {
    for (int offset = 0; offset < 4; ++offset) {
        SinkTest test(u"US-ASCII");
        std::string expected(static_cast<std::size_t>(offset), 'x');
        test.sink->write(expected);
        for (int i = 0; i < 40000; ++i) {
            test.sink->write("\xF0\x9F\x98\x80"); // as one piece, or a byte at a time
            expected += "&#128512;";
        }
        for (int i = 0; i < 40000; ++i) {
            for (const char c : {'\xF0', '\x9F', '\x98', '\x80'}) {
                test.sink->write(c);
            }
            expected += "&#128512;";
        }
        EXPECT_TRUE(test.finish() == expected) << offset;
    }
}

TEST(MoxXmlSink, Utf16HasItsByteOrderMarkOnce) {
    SinkTest test(u"UTF-16");
    std::string expected;
    for (int i = 0; i < 30000; ++i) {
        test.sink->write("\xE6\x97\xA5\xF0\x9F\x98\x80");
        expected += "\xE6\x97\xA5\xF0\x9F\x98\x80";
    }
    const std::string bytes = test.finish();
    EXPECT_EQ(bytes.size(), 2U + 30000U * 6U);
    const std::string mark = bytes.substr(0, 2);
    EXPECT_TRUE(mark == "\xFE\xFF" || mark == "\xFF\xFE");
    EXPECT_TRUE(decode(bytes, "UTF-16") == expected);
}

TEST(MoxXmlSink, KnowsWhatAnEncodingCanCarry) {
    EXPECT_TRUE(SinkTest(u"").sink->canCarry(0x1F600));
    EXPECT_TRUE(SinkTest(u"UTF-16").sink->canCarry(0x1F600));
    EXPECT_TRUE(SinkTest(u"ISO-8859-1").sink->canCarry(0xE9));
    EXPECT_FALSE(SinkTest(u"ISO-8859-1").sink->canCarry(0x20AC));
    EXPECT_TRUE(SinkTest(u"US-ASCII").sink->canCarry('a'));
    EXPECT_FALSE(SinkTest(u"US-ASCII").sink->canCarry(0xE9));
    EXPECT_TRUE(SinkTest(u"Shift_JIS").sink->canCarry(0x65E5));
}

bool isEncodingName(const std::string& name) {
    return !name.empty() && std::isalpha(static_cast<unsigned char>(name[0])) &&
           name.find_first_not_of("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789"
                                  "._-") == std::string::npos;
}

TEST(MoxXmlSink, EveryEncodingThereIsCarriesMarkup) {
    const std::string markup = "<?xml version=\"1.0\"?>\n<a b='!#$%&()*+,-./:;=?@[\\]^_`{|}~'/>";
    for (int i = 0; i < ucnv_countAvailable(); ++i) {
        const std::string name = ucnv_getAvailableName(i);
        SinkTest test(UnicodeString::fromUTF8(name).getTerminatedBuffer());
        test.sink->write(markup);
        const std::string bytes = test.finish();
        EXPECT_TRUE(isEncodingName(test.sink->getEncodingName())) << name;
        EXPECT_EQ(decode(bytes, test.sink->isConverting() ? name.c_str() : "UTF-8"), markup)
            << name;
    }
}

TEST(MoxXmlSink, AStreamThatFailsKeepsItsState) {
    for (const char16_t* encoding : {u"", u"UTF-16"}) {
        std::ofstream full("/dev/full", std::ios::binary);
        ASSERT_TRUE(full);
        MoxXmlSink sink(full, encoding);
        sink.write(std::string(3000000, 'x'));
        sink.write("further text");
        sink.finish();
        full.flush();
        EXPECT_FALSE(full);
    }
}

} // namespace
