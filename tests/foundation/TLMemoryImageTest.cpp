#include "foundation/records/TLMemoryImage.h"

#include "tests/support/Utf8.h"

#include <istream>
#include <iterator>

#include <gtest/gtest.h>

using namespace TalGraphic;
using DrawmereTest::utf8;

namespace {

constexpr std::string_view jpegBytes = "\xFF\xD8\xFF.abc";

} // namespace

TEST(TLMemoryImage, NameIsOptional) {
    EXPECT_TRUE(TLMemoryImage(jpegBytes).getOrgFileName().isEmpty());
    EXPECT_EQ(utf8(TLMemoryImage(jpegBytes, u"logo").getOrgFileName()), "logo");
}

TEST(TLMemoryImage, StreamHasTheBytes) {
    TLMemoryImage image(jpegBytes);
    std::istream& stream = *image.getStream();
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(stream), {}), jpegBytes);
    EXPECT_EQ(image.getGraphicType(), TLGRAPHICTYPE_JPEG);
}

TEST(TLMemoryImage, StreamCanBeRepositionedWithinTheBytes) {
    TLMemoryImage image(jpegBytes);
    std::istream& stream = *image.getStream();
    stream.seekg(0, std::ios::end);
    EXPECT_EQ(stream.tellg(), std::streampos(jpegBytes.size()));
    EXPECT_EQ(stream.get(), std::char_traits<char>::eof());
    stream.clear();
    stream.seekg(-3, std::ios::end);
    EXPECT_EQ(stream.get(), 'a');
    stream.seekg(1, std::ios::cur);
    EXPECT_EQ(stream.get(), 'c');
    stream.seekg(4);
    EXPECT_EQ(stream.get(), 'a');
    for (const int outside : {-1, 8}) {
        stream.seekg(outside, std::ios::beg);
        EXPECT_TRUE(stream.fail()) << outside;
        stream.clear();
    }
    EXPECT_EQ(stream.get(), 'b');
}

TEST(TLMemoryImage, NoBytesMakeAnEmptyStream) {
    TLMemoryImage image({});
    EXPECT_EQ(image.getGraphicType(), TLGRAPHICTYPE_OTHER);
    EXPECT_EQ(image.getStream()->get(), std::char_traits<char>::eof());
}
