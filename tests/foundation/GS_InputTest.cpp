#include "foundation/graphicservice/GS_Input.h"

#include <gtest/gtest.h>

#include <sstream>
#include <stdexcept>

using namespace MoxGraphicService_NS;

namespace {

/// Throws whenever it is read or moved.
class ThrowingBuffer : public std::streambuf {
protected:
    pos_type seekoff(off_type offset, std::ios_base::seekdir from,
                     std::ios_base::openmode) override {
        if (isArmed) {
            throw std::runtime_error("moved");
        }
        return from == std::ios_base::end ? pos_type(100) : pos_type(offset);
    }

    std::streamsize xsgetn(char*, std::streamsize) override { throw std::runtime_error("read"); }

public:
    bool isArmed = false;
};

TEST(GS_Input, ReadsFromAnyPosition) {
    std::istringstream stream("0123456789");
    stream.setstate(std::ios::eofbit);
    GS_Input input(stream);
    EXPECT_EQ(input.getSize(), 10U);
    char bytes[8] = {};
    EXPECT_TRUE(input.readAll(bytes, 3));
    EXPECT_STREQ(bytes, "012");
    EXPECT_TRUE(input.seek(8));
    EXPECT_EQ(input.getRest(), 2U);
    EXPECT_EQ(input.read(bytes, 8), 2U);
    EXPECT_EQ(input.getPosition(), 10U);
    EXPECT_FALSE(input.readAll(bytes, 1));
    EXPECT_FALSE(input.seek(11));
}

TEST(GS_Input, StreamWithoutABufferIsEmpty) {
    std::istream stream(nullptr);
    GS_Input input(stream);
    char byte = 0;
    EXPECT_EQ(input.getSize(), 0U);
    EXPECT_EQ(input.read(&byte, 1), 0U);
    EXPECT_FALSE(input.seek(0));
}

TEST(GS_Input, ExceptionsOfTheStreamStayInside) {
    ThrowingBuffer buffer;
    std::istream stream(&buffer);
    GS_Input input(stream);
    char byte = 0;
    EXPECT_EQ(input.read(&byte, 1), 0U);
    buffer.isArmed = true;
    EXPECT_FALSE(input.seek(5));
    EXPECT_EQ(GS_Input(stream).getSize(), 0U);
}

} // namespace
