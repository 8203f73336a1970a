#include "foundation/common/MoxKeptText.h"

#include "tests/support/OneValueDocument.h"
#include "tests/support/Utf8.h"

#include <atomic>
#include <gtest/gtest.h>
#include <sstream>
#include <thread>
#include <vector>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::makeDocument;
using DrawmereTest::saveWhole;
using DrawmereTest::utf8;

const MoxName href(u"href");

/// Lines of letters, with a line feed behind each; some of the last may be lost.
class Lines : public MoxKeptText {
public:
    explicit Lines(int count, int good = 1 << 30) : lines(count), goodLines(good) {}

    std::size_t getLength() const override { return lines * (line(0).size() + 1); }

    bool handOut(std::string_view lineFeed, const Taker& take) const override {
        ++readings;
        for (int i = 0; i < lines; ++i) {
            if (i == goodLines) {
                return false;
            }
            take(line(i));
            take(lineFeed);
        }
        return true;
    }

    /// Returns: all lines, each with `lineFeed` behind it.
    std::string write(const std::string& lineFeed) const {
        std::string text;
        for (int i = 0; i < lines; ++i) {
            text += line(i) + lineFeed;
        }
        return text;
    }

    mutable std::atomic<int> readings = 0;

private:
    static std::string line(int number) {
        return std::string(70, static_cast<char>('a' + number % 26));
    }

    int lines;
    int goodLines;
};

TEST(MoxKeptText, IsMadeOnceWhenItIsAskedFor) {
    const MoxPtr<Lines> lines(new Lines(3));
    EXPECT_EQ(lines->getText(), lines->write("\n"));
    EXPECT_EQ(lines->getText().data(), lines->getText().data());
    EXPECT_EQ(lines->readings, 1);
    EXPECT_EQ(MoxPtr<Lines>(new Lines(0))->getText(), "");
}

bool isLost(const MoxKeptText& text) {
    try {
        text.getText();
    } catch (const std::ios_base::failure&) {
        return true;
    }
    return false;
}

TEST(MoxKeptText, WhatIsLostIsThrownEachTime) {
    const MoxPtr<Lines> lines(new Lines(3, 2));
    EXPECT_TRUE(isLost(*lines));
    EXPECT_TRUE(isLost(*lines));
    EXPECT_FALSE(isLost(*MoxPtr<Lines>(new Lines(3, 3))));
}

TEST(MoxKeptText, IsMadeOnceForTwoThreads) {
    const MoxPtr<Lines> lines(new Lines(100));
    const auto ask = [value = MoxValue::fromKept(lines.get())](std::string_view* text) {
        const MoxValue copy(value); // NOLINT(performance-unnecessary-copy-initialization)
        *text = copy.getAsciiText();
    };
    std::string_view texts[2];
    std::thread one(ask, &texts[0]);
    std::thread other(ask, &texts[1]);
    one.join();
    other.join();
    EXPECT_EQ(texts[0].data(), texts[1].data());
    EXPECT_EQ(texts[0], lines->write("\n"));
    EXPECT_EQ(lines->readings, 1);
}

TEST(MoxKeptText, AValueOfItIsATextLikeAnyOther) {
    const MoxPtr<Lines> lines(new Lines(2));
    const MoxValue value = MoxValue::fromKept(lines.get());
    const std::string text = lines->write("\n");
    EXPECT_EQ(value.getType(), MOXVALUE_STRING);
    EXPECT_FALSE(value.isWideText());
    EXPECT_EQ(value.getKeptText(), lines.get());
    EXPECT_EQ(lines->readings, 0);
    EXPECT_EQ(value.getAsciiText(), text);
    EXPECT_EQ(utf8(value.toString()), text);
    EXPECT_EQ(value, MoxValue::fromAscii(text));
    EXPECT_EQ(MoxValue::fromAscii(text), value);
    EXPECT_NE(value, MoxValue::fromKept(new Lines(3)));
    EXPECT_NE(value, MoxValue());
    EXPECT_EQ(value.getRealValue(MOXUNIT_POINT), 0.0F);
}

TEST(MoxKeptText, OtherValuesKeepNone) {
    EXPECT_FALSE(MoxValue().getKeptText());
    EXPECT_FALSE(MoxValue(u"longer than what fits inside").getKeptText());
    EXPECT_FALSE(MoxValue(7).getKeptText());
}

TEST(MoxKeptText, CopiesOfAValueShareItAndOutliveTheFirst) {
    const MoxPtr<Lines> lines(new Lines(2));
    MoxValue copy;
    {
        MoxValue value = MoxValue::fromKept(lines.get());
        value.setKey(href);
        copy = value;
        EXPECT_EQ(copy, value);
        EXPECT_EQ(lines->readings, 0); // the same is the same, unread
        const MoxValue moved(std::move(value));
        EXPECT_EQ(lines->getReferenceCount(), 3);
    }
    EXPECT_EQ(lines->getReferenceCount(), 2);
    EXPECT_EQ(copy.getKeptText(), lines.get());
    EXPECT_EQ(copy.getKey(), href);
    copy = MoxValue(1);
    EXPECT_EQ(lines->getReferenceCount(), 1);
}

// In documents.

TEST(MoxKeptText, IsWrittenLikeTheWholeTextButNeverMade) {
    for (const char16_t* const encoding : {u"", u"UTF-16", u"US-ASCII", u"Shift_JIS"}) {
        for (const int count : {0, 1, 2, 70, 5000}) {
            const MoxPtr<Lines> lines(new Lines(count));
            const MoxValue whole = MoxValue::fromAscii(lines->write("\n"));
            const MoxPtr<MoxDocument> document =
                makeDocument(href, MoxValue::fromKept(lines.get()));
            EXPECT_EQ(saveWhole(*document, encoding),
                      saveWhole(*makeDocument(href, whole), encoding));
            EXPECT_EQ(lines->readings, 1);
        }
    }
}

TEST(MoxKeptText, ACloneOfItsDocumentOutlivesTheDocument) {
    const MoxPtr<Lines> lines(new Lines(9));
    MoxPtr<MoxDocument> document = makeDocument(href, MoxValue::fromKept(lines.get()));
    const MoxPtr<MoxNode> clone = document->cloneNode(/*deep=*/true);
    const std::string saved = saveWhole(*document);
    document = nullptr;
    EXPECT_EQ(lines->getReferenceCount(), 2);
    EXPECT_EQ(saveWhole(static_cast<const MoxDocument&>(*clone)), saved);
}

TEST(MoxKeptText, WhatIsLostFailsTheStreamAndEndsTheDocument) {
    for (const int good : {0, 1, 4999}) {
        const MoxPtr<MoxDocument> document =
            makeDocument(href, MoxValue::fromKept(new Lines(5000, good)));
        std::ostringstream stream;
        document->save(u"", u"", stream, nullptr, u"", u"");
        EXPECT_TRUE(stream.bad());
        EXPECT_EQ(stream.str().find("/>"), std::string::npos);
        std::ostringstream throwing;
        throwing.exceptions(std::ios::badbit);
        EXPECT_THROW(document->save(u"", u"", throwing, nullptr, u"", u""), std::ios_base::failure);
    }
}

} // namespace
