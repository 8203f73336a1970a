#include "foundation/common/MoxMemStreamBuf.h"

#include <climits>
#include <string>

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

constexpr auto in = std::ios::in;
constexpr auto out = std::ios::out;
const std::streambuf::pos_type noPosition(std::streambuf::off_type(-1));

std::string textOf(const MoxMemStreamBuf& buffer) {
    return buffer.getSize() > 0 ? std::string(buffer.getData(), buffer.getSize()) : std::string();
}

void write(MoxMemStreamBuf& buffer, const std::string& text) {
    ASSERT_EQ(buffer.sputn(text.data(), static_cast<std::streamsize>(text.size())),
              static_cast<std::streamsize>(text.size()));
}

TEST(MoxMemStreamBuf, NewBufferHoldsNothing) {
    MoxMemStreamBuf buffer(8192);
    EXPECT_EQ(buffer.getSize(), 0U);
    EXPECT_EQ(buffer.getData(), nullptr);
    EXPECT_EQ(buffer.sgetc(), EOF);
    EXPECT_EQ(buffer.in_avail(), -1);
}

TEST(MoxMemStreamBuf, WritesByCharacterAndByBlockInOrder) {
    MoxMemStreamBuf buffer(1);
    std::string expected;
    for (int i = 0; i < 1000; ++i) {
        const char character = static_cast<char>('a' + i % 26);
        ASSERT_EQ(buffer.sputc(character), character);
        write(buffer, std::string(static_cast<std::size_t>(i % 7), '.'));
        expected += character + std::string(static_cast<std::size_t>(i % 7), '.');
    }
    EXPECT_EQ(textOf(buffer), expected);
}

TEST(MoxMemStreamBuf, EveryByteValuePassesThrough) {
    MoxMemStreamBuf buffer(16);
    for (int i = 0; i < 256; ++i) {
        ASSERT_EQ(buffer.sputc(static_cast<char>(i)), i);
    }
    for (int i = 0; i < 256; ++i) {
        ASSERT_EQ(buffer.sbumpc(), i);
    }
    EXPECT_EQ(buffer.sbumpc(), EOF);
}

TEST(MoxMemStreamBuf, ReaderSeesWhatIsWrittenLater) {
    MoxMemStreamBuf buffer(8);
    write(buffer, "ab");
    EXPECT_EQ(buffer.sbumpc(), 'a');
    EXPECT_EQ(buffer.sbumpc(), 'b');
    EXPECT_EQ(buffer.sbumpc(), EOF);
    buffer.sputc('c');
    EXPECT_EQ(buffer.in_avail(), 1);
    EXPECT_EQ(buffer.sbumpc(), 'c');
}

TEST(MoxMemStreamBuf, PositionsOfReadingAndWritingMoveApart) {
    MoxMemStreamBuf buffer(8);
    write(buffer, "0123456789");
    EXPECT_EQ(buffer.pubseekoff(4, std::ios::beg, in), 4);
    EXPECT_EQ(buffer.pubseekoff(0, std::ios::cur, out), 10);
    EXPECT_EQ(buffer.pubseekoff(-2, std::ios::end, out), 8);
    write(buffer, "X");
    EXPECT_EQ(buffer.sbumpc(), '4');
    EXPECT_EQ(buffer.pubseekoff(2, std::ios::cur, in), 7);
    EXPECT_EQ(textOf(buffer), "01234567X9");
}

TEST(MoxMemStreamBuf, SeekingBackToWriteKeepsTheSize) {
    MoxMemStreamBuf buffer(8);
    buffer.sputc('a');
    buffer.sputc('b');
    EXPECT_EQ(buffer.pubseekpos(0), 0);
    EXPECT_EQ(buffer.getSize(), 2U);
    buffer.sputc('X');
    EXPECT_EQ(textOf(buffer), "Xb");
}

TEST(MoxMemStreamBuf, WritingOverTheEndExtends) {
    MoxMemStreamBuf buffer(4);
    write(buffer, "abc");
    buffer.pubseekpos(1, out);
    write(buffer, std::string(200, 'x'));
    EXPECT_EQ(textOf(buffer), "a" + std::string(200, 'x'));
}

TEST(MoxMemStreamBuf, SeekOutsideTheBytesFailsAndMovesNothing) {
    MoxMemStreamBuf buffer(8);
    write(buffer, "abc");
    EXPECT_EQ(buffer.pubseekoff(-1, std::ios::beg, in), noPosition);
    EXPECT_EQ(buffer.pubseekoff(1, std::ios::end, in), noPosition);
    EXPECT_EQ(buffer.pubseekoff(LLONG_MAX, std::ios::end, in), noPosition);
    EXPECT_EQ(buffer.pubseekoff(LLONG_MIN, std::ios::end, in), noPosition);
    EXPECT_EQ(buffer.pubseekoff(LLONG_MAX, std::ios::cur, out), noPosition);
    EXPECT_EQ(buffer.pubseekpos(4, in | out), noPosition);
    EXPECT_EQ(buffer.pubseekoff(0, std::ios::cur, in), 0);
    EXPECT_EQ(buffer.pubseekoff(0, std::ios::cur, out), 3);
}

TEST(MoxMemStreamBuf, SeekFromTheCurrentPositionHasToSayWhich) {
    MoxMemStreamBuf buffer(8);
    write(buffer, "abc");
    EXPECT_EQ(buffer.pubseekoff(0, std::ios::cur, in | out), noPosition);
    EXPECT_EQ(buffer.pubseekoff(0, std::ios::beg, std::ios::openmode()), noPosition);
    EXPECT_EQ(buffer.pubseekoff(0, std::ios::end, in | out), 3);
}

TEST(MoxMemStreamBuf, RemoveGivesTheBytesAndLeavesTheBufferAsNew) {
    MoxMemStreamBuf buffer(8);
    buffer.sputc('a');
    buffer.sputc('b');
    const MoxMemBytes bytes = buffer.remove();
    EXPECT_EQ(std::string(bytes.data.get(), bytes.size), "ab");
    EXPECT_EQ(buffer.getSize(), 0U);
    EXPECT_EQ(buffer.sgetc(), EOF);
    write(buffer, "again");
    EXPECT_EQ(textOf(buffer), "again");
    EXPECT_EQ(std::string(bytes.data.get(), bytes.size), "ab");
}

TEST(MoxMemStreamBuf, RemoveFromAnEmptyBufferGivesNull) {
    MoxMemStreamBuf buffer(8);
    const MoxMemBytes bytes = buffer.remove();
    EXPECT_EQ(bytes.data, nullptr);
    EXPECT_EQ(bytes.size, 0U);
}

TEST(MoxMemStreamBuf, AbsurdBlockSizesAreBroughtIntoBounds) {
    for (unsigned long size : {0UL, 1UL, ULONG_MAX}) {
        MoxMemStreamBuf buffer(size);
        write(buffer, std::string(300, 'x'));
        EXPECT_EQ(textOf(buffer), std::string(300, 'x'));
    }
}

TEST(MoxMemStreamBuf, WriteOfMoreThanCanBeWritesNothing) {
    MoxMemStreamBuf buffer(8);
    write(buffer, "abc");
    // The bytes are never touched, as the room for them is sought first.
    EXPECT_EQ(buffer.sputn("x", LLONG_MAX), 0);
    EXPECT_EQ(buffer.sputn("x", -1), 0);
    EXPECT_EQ(textOf(buffer), "abc");
}

TEST(MoxMemStreamBuf, WritingTheEndMarkWritesNothing) {
    MoxMemStreamBuf buffer(8);

    struct Opened : MoxMemStreamBuf {
        using MoxMemStreamBuf::MoxMemStreamBuf;
        using MoxMemStreamBuf::overflow;
    } opened(8);

    EXPECT_NE(opened.overflow(EOF), EOF);
    EXPECT_EQ(opened.getSize(), 0U);
}

} // namespace
