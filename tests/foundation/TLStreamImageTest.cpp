#include "foundation/records/TLStreamImage.h"

#include "tests/support/Utf8.h"

#include <sstream>

#include <gtest/gtest.h>

using namespace TalGraphic;
using DrawmereTest::utf8;

TEST(TLStreamImage, StreamIsTheCallers) {
    std::istringstream bytes("<svg/>");
    TLStreamImage image(&bytes, u"a.svg");
    EXPECT_EQ(image.getStream(), &bytes);
    EXPECT_EQ(image.getGraphicType(), TLGRAPHICTYPE_SVG);
    EXPECT_EQ(utf8(image.getOrgFileName()), "a.svg");
}

TEST(TLStreamImage, NameIsOptional) {
    std::istringstream bytes;
    EXPECT_TRUE(TLStreamImage(&bytes).getOrgFileName().isEmpty());
}

TEST(TLStreamImage, NoStreamHasNoType) {
    TLStreamImage image(nullptr);
    EXPECT_FALSE(image.getStream());
    EXPECT_EQ(image.getGraphicType(), TLGRAPHICTYPE_OTHER);
}
