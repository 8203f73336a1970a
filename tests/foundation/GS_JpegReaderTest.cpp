#include "foundation/graphicservice/GS_JpegReader.h"

#include "foundation/graphicservice/GS_JpegWriter.h"
#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

TEST(GS_JpegReader, DecodesAtTheNextSizeThatIsNotSmaller) {
    const std::string bytes = readTestImage("tower_progressive.jpg"); // 512 by 512

    struct Wanted {
        int columns;
        int rows;
        int result;
    };

    for (const Wanted& wanted : {Wanted{1, 1, 64}, Wanted{64, 64, 64}, Wanted{65, 1, 128},
                                 Wanted{1, 200, 256}, Wanted{449, 1, 512}, Wanted{512, 512, 512}}) {
        const DecodedImage image = decodeImage(bytes, wanted.columns, wanted.rows);
        ASSERT_TRUE(image.hasPixels);
        EXPECT_EQ(image.bitmap.columns, wanted.result);
        EXPECT_EQ(image.bitmap.rows, wanted.result);
    }
}

TEST(GS_JpegReader, InksOfAnAdobeFileAreInverted) {
    const DecodedImage image = decodeImage(readTestImage("jpg-cmyk-2.jpg"));
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(listPixels(image.bitmap)[0], 255); // white paper
    std::string plain = readTestImage("jpg-cmyk-2.jpg");
    const std::size_t adobe = plain.find("Adobe");
    ASSERT_NE(adobe, std::string::npos);
    plain[adobe] = 'a'; // now the inks count as they are
    const DecodedImage other = decodeImage(plain);
    ASSERT_TRUE(other.hasPixels);
    EXPECT_EQ(listPixels(other.bitmap)[0], 0);
}

TEST(GS_JpegReader, DataThatEndEarlyAreAFailure) {
    const std::string bytes = readTestImage("tower_grayscale.jpg");
    const std::string cut = bytes.substr(0, bytes.size() / 2) + bytesOf({0xFF, 0xD9});
    const DecodedImage image = decodeImage(cut);
    EXPECT_TRUE(image.hasInfo);
    EXPECT_FALSE(image.hasPixels);
}

TEST(GS_JpegReader, ProfileOfInksIsDropped) {
    const std::string colors = makeProfile("RGB ");
    GS_Bitmap bitmap = makeBitmap(1, 1, 3, {10, 20, 30});
    bitmap.profile.assign(colors.begin(), colors.end());
    std::string bytes = writeImage(writeJpeg, bitmap, {});
    EXPECT_EQ(decodeImage(bytes).bitmap.profile, bitmap.profile);
    bytes.replace(bytes.find("RGB "), 4, "CMYK");
    EXPECT_TRUE(decodeImage(bytes).hasPixels);
    EXPECT_TRUE(decodeImage(bytes).bitmap.profile.empty());
}

} // namespace
