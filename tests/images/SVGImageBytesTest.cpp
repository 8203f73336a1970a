#include "images/SVGImageBytes.h"

#include "tests/support/BrittleBuffer.h"

#include <sstream>
#include <string>

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereNS::SVGImageBytes;

std::string readAll(std::istream& stream, std::size_t count) {
    std::string bytes(count, '#');
    bytes.resize(SVGImageBytes::read(stream, bytes.data(), count));
    return bytes;
}

TEST(SVGImageBytes, AreReadFromTheirStart) {
    std::istringstream stream("bytes");
    stream.seekg(3);
    EXPECT_EQ(SVGImageBytes::start(stream), 5);
    EXPECT_EQ(readAll(stream, 3), "byt");
    EXPECT_EQ(readAll(stream, 10), "es");
    EXPECT_EQ(readAll(stream, 10), "");
}

TEST(SVGImageBytes, AreReadInWhateverState) {
    std::istringstream stream("bytes");
    stream.exceptions(std::ios::badbit);
    stream.setstate(std::ios::failbit | std::ios::eofbit);
    EXPECT_EQ(SVGImageBytes::start(stream), 5);
    EXPECT_EQ(readAll(stream, 10), "bytes");
}

TEST(SVGImageBytes, StreamThatCannotTellItsLengthIsKnown) {
    std::istream broken(nullptr);
    EXPECT_EQ(SVGImageBytes::start(broken), -1);
    EXPECT_EQ(readAll(broken, 10), "");
    std::istringstream empty;
    EXPECT_EQ(SVGImageBytes::start(empty), 0);
}

TEST(SVGImageBytes, BufferThatThrowsHasNoBytes) {
    BrittleBuffer unsought("bytes", 5, BrittleBuffer::THROWS_WHEN_SOUGHT);
    std::istream first(&unsought);
    EXPECT_EQ(SVGImageBytes::start(first), -1);
    BrittleBuffer unread("bytes", 3, BrittleBuffer::THROWS);
    std::istream second(&unread);
    EXPECT_EQ(SVGImageBytes::start(second), 5);
    EXPECT_EQ(readAll(second, 3), "byt");
    EXPECT_EQ(readAll(second, 2), "");
}

TEST(SVGImageBytes, BufferThatCannotBeRepositionedHasNoLength) {
    BrittleBuffer buffer("bytes", 5, BrittleBuffer::REFUSES_TO_SEEK);
    std::istream stream(&buffer);
    EXPECT_EQ(SVGImageBytes::start(stream), -1);
}

} // namespace
} // namespace DrawmereTest
