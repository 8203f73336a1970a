#include "foundation/records/TLGraphicImage.h"

#include "tests/support/Utf8.h"

#include <sstream>

#include <gtest/gtest.h>

using namespace TalGraphic;
using DrawmereTest::utf8;

namespace {

class SmallImage : public TLGraphicImage {
public:
    SmallImage() = default;

    explicit SmallImage(const UnicodeString& fileName) : TLGraphicImage(fileName) {}

    ~SmallImage() override { ++destroyedCount; }

    TLGraphicType getGraphicType() override { return TLGRAPHICTYPE_PNG; }

    std::istream* getStream() override { return &bytes; }

    static inline int destroyedCount = 0;

private:
    std::istringstream bytes{"bytes"};
};

} // namespace

TEST(TLGraphicImage, ImageWithoutAFileHasNoFileName) {
    const SmallImage image;
    EXPECT_TRUE(image.getOrgFileName().isEmpty());
}

TEST(TLGraphicImage, FileNameIsKeptAsItIsGiven) {
    const SmallImage image(u"dir/a b.png");
    EXPECT_EQ(utf8(image.getOrgFileName()), "dir/a b.png");
}

TEST(TLGraphicImage, TypeAndStreamComeFromTheDerivedClass) {
    SmallImage image;
    TLGraphicImage& base = image;
    std::string word;
    *base.getStream() >> word;
    EXPECT_EQ(word, "bytes");
    EXPECT_EQ(base.getGraphicType(), TLGRAPHICTYPE_PNG);
}

TEST(TLGraphicImage, DerivedImageDiesThroughItsBase) {
    const int before = SmallImage::destroyedCount;
    const TLGraphicImage* image = new SmallImage;
    delete image;
    EXPECT_EQ(SmallImage::destroyedCount, before + 1);
}
