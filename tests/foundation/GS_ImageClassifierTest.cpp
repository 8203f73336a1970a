#include "foundation/graphicservice/GS_ImageClassifier.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

struct Known {
    const char* name;
    GS_ImageClass result;
};

TEST(GS_ImageClassifier, PhotographsAndDrawingsOfTheCollectionAreToldApart) {
    for (const Known& known : {
             Known{"tower_progressive.jpg", IMAGECLASS_PHOTOGRAPH},
             Known{"tower_grayscale.jpg", IMAGECLASS_PHOTOGRAPH},
             Known{"tiled-jpeg-ycbcr.tif", IMAGECLASS_PHOTOGRAPH},
             Known{"cmyk-4c-8b.tiff", IMAGECLASS_PHOTOGRAPH},
             Known{"portrait_2.jpg", IMAGECLASS_PHOTOGRAPH},
             Known{"test.webp", IMAGECLASS_PHOTOGRAPH},
             Known{"interlaced.gif", IMAGECLASS_DRAWING},
             Known{"lossless1.webp", IMAGECLASS_DRAWING},
             Known{"anim.webp", IMAGECLASS_DRAWING},
             Known{"BigTIFF.tif", IMAGECLASS_DRAWING},
             Known{"palette-1c-4b.tiff", IMAGECLASS_DRAWING}, // a photograph, of 16 colours
             Known{"fax4.tiff", IMAGECLASS_BILEVEL},
             Known{"Core_1_Bit.bmp", IMAGECLASS_BILEVEL},
         }) {
        EXPECT_EQ(classifyBitmap(decodeImage(readTestImage(known.name)).bitmap), known.result)
            << known.name;
    }
}

TEST(GS_ImageClassifier, GradientIsADrawing) {
    GS_Bitmap bitmap = makeBitmap(256, 256, 3, {});
    for (std::size_t i = 0; i < std::size_t{256} * 256; ++i) {
        bitmap.pixels[i * 3] = static_cast<std::uint8_t>(i / 256);
    }
    EXPECT_EQ(classifyBitmap(bitmap), IMAGECLASS_DRAWING);
}

TEST(GS_ImageClassifier, SmallestImagesAreSafe) {
    EXPECT_EQ(classifyBitmap(makeBitmap(1, 1, 3, {})), IMAGECLASS_BILEVEL);
    EXPECT_EQ(classifyBitmap(makeBitmap(1, 3, 1, {1, 2, 3})), IMAGECLASS_DRAWING);
}

} // namespace
