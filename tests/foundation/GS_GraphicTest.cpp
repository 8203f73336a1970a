#include "foundation/graphicservice/GS_Graphic.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

#include <random>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

/// One small file of each form.
constexpr const char* smallFiles[] = {
    "basi6a16.png", "tp1n3p08.png",         "restarts.jpg", "mixed-disposal.gif",
    "pal4rle.bmp",  "rgb16-565.bmp",        "test.webp",    "anim.webp",
    "BigTIFF.tif",  "Transparency-lzw.tif", "fax4.tiff",    "seq-1c-8b-multipage-adeefdcc.tiff",
};

/// Sets the limit of pixels for a test.
class PixelLimit {
public:
    explicit PixelLimit(std::int64_t pixels) { GS_Graphic::setPixelLimit(pixels); }

    PixelLimit(const PixelLimit&) = delete;
    PixelLimit& operator=(const PixelLimit&) = delete;

    ~PixelLimit() { GS_Graphic::setPixelLimit(before); }

private:
    std::int64_t before = GS_Graphic::getPixelLimit();
};

/// Opens `bytes` and writes what can be written. Returns: whether that went without a failure.
bool isUsable(const std::string& bytes) {
    std::istringstream source(bytes);
    const GS_Graphic graphic(source, 72.0F);
    if (!graphic.raster) {
        return false;
    }
    std::ostringstream target;
    graphic.raster->getImageClass();
    graphic.raster->gl_setDownsample(9, 9, SAMPLINGTYPE_CUBIC);
    graphic.raster->writeToStream(target, CONVERT_PNG_JPEG, 50);
    const bool isWritten = graphic.raster->getFailure() == FAILURE_NONE;
    EXPECT_EQ(isWritten, !target.str().empty());
    return isWritten;
}

TEST(GS_Graphic, FormIsToldByContent) {
    struct Known {
        const char* name;
        int kind;
    };

    for (const Known& known :
         {Known{"basn0g01.png", 0}, Known{"restarts.jpg", 1}, Known{"mixed-disposal.gif", 2},
          Known{"BigTIFF.tif", 3}, Known{"pal4rle.bmp", 4}, Known{"test.webp", 5}}) {
        std::istringstream source(readTestImage(known.name));
        const GS_Graphic graphic(source, 72.0F);
        EXPECT_TRUE(graphic.Loaded());
        ASSERT_TRUE(graphic.isRaster());
        EXPECT_EQ(graphic.raster->getRasterKind(), known.kind) << known.name;
    }
}

TEST(GS_Graphic, VectorsAreLoadedButAreNoRaster) {
    std::istringstream source("<svg xmlns='http://www.w3.org/2000/svg'/>");
    const GS_Graphic graphic(source, 72.0F);
    EXPECT_TRUE(graphic.Loaded());
    EXPECT_FALSE(graphic.isRaster());
    EXPECT_EQ(graphic.raster, nullptr);
}

TEST(GS_Graphic, WhatIsNoImageIsNotLoaded) {
    for (const std::string& bytes :
         {std::string(), std::string("no image"), std::string(5000, 'x')}) {
        std::istringstream source(bytes);
        const GS_Graphic graphic(source, 72.0F);
        EXPECT_FALSE(graphic.Loaded());
        EXPECT_FALSE(graphic.isRaster());
    }
    std::istream none(nullptr);
    EXPECT_FALSE(GS_Graphic(none, 72.0F).Loaded());
}

TEST(GS_Graphic, StreamIsReadFromItsStartAndLeftThere) {
    std::istringstream source(readTestImage("restarts.jpg"));
    source.seekg(0, std::ios::end);
    source.get();
    const GS_Graphic graphic(source, 72.0F);
    EXPECT_TRUE(graphic.Loaded());
    source.clear();
    EXPECT_EQ(source.tellg(), 0);
    EXPECT_TRUE(graphic.raster->load());
    EXPECT_EQ(source.tellg(), 0);
}

TEST(GS_Graphic, LimitIs256MegapixelsUnlessSet) {
    EXPECT_EQ(GS_Graphic::getPixelLimit(), std::int64_t{1} << 28);
    const std::string bytes = readTestImage("basn0g01.png"); // 32 by 32
    {
        const PixelLimit limit(1023);
        EXPECT_FALSE(isUsable(bytes));
        GS_Graphic::setPixelLimit(0);
        EXPECT_EQ(GS_Graphic::getPixelLimit(), 1023);
    }
    const PixelLimit limit(1024);
    EXPECT_TRUE(isUsable(bytes));
}

TEST(GS_Graphic, LimitHoldsForEveryForm) {
    const PixelLimit limit(100);
    for (const char* name : smallFiles) {
        EXPECT_FALSE(isUsable(readTestImage(name))) << name;
    }
}

TEST(GS_Graphic, FileThatIsCutIsUnusable) {
    for (const char* name : smallFiles) {
        const std::string bytes = readTestImage(name);
        ASSERT_TRUE(isUsable(bytes)) << name;
        for (std::size_t part = 0; part < 16; ++part) {
            isUsable(bytes.substr(0, bytes.size() * part / 16));
        }
        EXPECT_FALSE(isUsable(bytes.substr(0, bytes.size() / 8))) << name;
    }
}

TEST(GS_Graphic, ChangedBytesDoNoHarm) {
    constexpr int changesOfFile = 60;
    const PixelLimit limit(1 << 20);
    std::mt19937 random(7);
    for (const char* name : smallFiles) {
        const std::string bytes = readTestImage(name);
        for (int i = 0; i < changesOfFile; ++i) {
            std::string changed = bytes;
            // Headers take most of the changes, as they say how the rest is read.
            const std::size_t range =
                i % 3 == 0 ? bytes.size() : std::min<std::size_t>(bytes.size(), 200);
            for (int k = 0; k <= i % 4; ++k) {
                changed[random() % range] = static_cast<char>(random());
            }
            isUsable(changed);
        }
    }
}

TEST(GS_Graphic, LargestNumbersInHeadersDoNoHarm) {
    const PixelLimit limit(1 << 20);
    for (const char* name : smallFiles) {
        const std::string bytes = readTestImage(name);
        for (std::size_t i = 0; i + 4 <= std::min<std::size_t>(bytes.size(), 80); ++i) {
            for (const std::uint32_t value : {0U, 0xFFFFFFFFU, 0x7FFFFFFFU}) {
                std::string changed = bytes;
                changed.replace(i, 4, little(value, 4));
                isUsable(changed);
            }
        }
    }
}

} // namespace
