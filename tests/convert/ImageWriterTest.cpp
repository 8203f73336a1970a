#include "tests/convert/Conversion.h"
#include "tests/convert/DrawnPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <string_view>

namespace DrawmereTest {
namespace {

using testing::HasSubstr;
using testing::StartsWith;

/// A page with an image of `entries` and `bytes`, drawn `content` times.
PageSource makeImage(const std::string& content, const std::string& entries,
                     const std::string& bytes) {
    return {content, "/XObject<</I 5 0 R>>", {{"/Type/XObject/Subtype/Image" + entries, bytes}}};
}

const std::string twoGrays = "/Width 2/Height 1/BitsPerComponent 8/ColorSpace/DeviceGray";

TEST(ImageWriter, AnImageIsStoredOnceAPage) {
    const DrawnPage page(
        makeImage("q 20 0 0 20 0 0 cm /I Do Q q 20 0 0 20 50 0 cm /I Do Q", twoGrays, "\x10\xF0"));
    EXPECT_EQ(page.count("image"), 1);
    EXPECT_EQ(page.count("use"), 2);
    EXPECT_THAT(page.attribute("image", "xlink:href"), StartsWith("data:image/png;base64,"));
}

TEST(ImageWriter, AnUprightImageNeedsNoMatrix) {
    const DrawnPage page(makeImage("40 0 0 30 10 20 cm /I Do", twoGrays, "\x10\xF0"));
    EXPECT_THAT(page.body(), HasSubstr("<svg width=\"40\" height=\"30\" x=\"10\" y=\"50\">"));
    EXPECT_THAT(page.body(), testing::Not(HasSubstr("transform")));
}

TEST(ImageWriter, ATurnedImageHasItsMatrix) {
    const DrawnPage page(makeImage("0 40 -30 0 60 20 cm /I Do", twoGrays, "\x10\xF0"));
    EXPECT_THAT(page.body(), HasSubstr("transform=\"matrix(0,-1,1,0,30,80)\""));
}

TEST(ImageWriter, AClearImageIsClear) {
    PageSource source = makeImage("/G gs 40 0 0 30 10 20 cm /I Do", twoGrays, "\x10\xF0");
    source.resources += "/ExtGState<</G<</ca 0.5>>>>";
    EXPECT_EQ(DrawnPage(source).attribute("use", "opacity"), "0.502");
}

TEST(ImageWriter, ASmallStencilIsAPath) {
    // A square ring of three by three pixels: the hole runs the other way round.
    const DrawnPage page(makeImage("1 0 0 rg 30 0 0 30 10 20 cm /I Do",
                                   "/Width 3/Height 3/ImageMask true/BitsPerComponent 1",
                                   std::string("\x00\x40\x00", 3)));
    EXPECT_EQ(page.count("image"), 0);
    EXPECT_EQ(page.attribute("path", "fill"), "red");
    EXPECT_EQ(page.attribute("path", "fill-rule"), "nonzero");
}

TEST(ImageWriter, AStencilForAShadingIsAPathFilledWithIt) {
    PageSource source = makeImage("/Pattern cs /P scn 30 0 0 30 10 20 cm /I Do",
                                  "/Width 3/Height 3/ImageMask true/BitsPerComponent 1",
                                  std::string("\x00\x40\x00", 3));
    source.resources += "/Pattern<</P<</PatternType 2/Shading<</ShadingType 2/ColorSpace/DeviceRGB"
                        "/Coords[0 0 200 0]/Extend[true true]/Function<</FunctionType 2"
                        "/Domain[0 1]/C0[1 0 0]/C1[0 0 1]/N 1>>>>>>>>";
    const DrawnPage page(source);
    EXPECT_EQ(page.count("mask"), 0);
    EXPECT_EQ(page.attribute("path", "fill"), "url(#g0)");
}

TEST(ImageWriter, ASmallImageHasItsMaskInItself) {
    PageSource source =
        makeImage("40 0 0 30 10 20 cm /I Do", twoGrays + "/SMask 6 0 R", "\x10\xF0");
    source.objects.emplace_back("/Type/XObject/Subtype/Image" + twoGrays, "\x40\x80");
    const DrawnPage page(source);
    EXPECT_EQ(page.count("mask"), 0);
    EXPECT_EQ(page.count("image"), 1);
    EXPECT_EQ(page.count("pattern"), 0);
}

/// Returns: the bytes of the first image in a document of this type.
std::string findBytes(const std::string& svg, const std::string& type) {
    constexpr std::string_view digits =
        "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    const std::string opening = "data:image/" + type + ";base64,";
    std::size_t place = svg.find(opening);
    std::string bytes;
    unsigned rest = 0;
    int bits = 0;
    for (place += opening.size(); place < svg.size() && svg[place] != '"'; ++place) {
        if (svg.compare(place, 5, "&#10;") == 0) {
            place += 4;
            continue;
        }
        const auto digit = digits.find(svg[place]);
        if (digit == std::string_view::npos) {
            break;
        }
        rest = rest << 6U | static_cast<unsigned>(digit);
        bits += 6;
        if (bits >= 8) {
            bits -= 8;
            bytes.push_back(static_cast<char>(rest >> bits));
        }
    }
    return bytes;
}

TEST(ImageWriter, AnImageIsNotMadeFinerThanItsMask) {
    const std::string gray = "/BitsPerComponent 8/ColorSpace/DeviceGray";
    PageSource source =
        makeImage("200 0 0 100 0 0 cm /I Do", "/Width 1/Height 1/SMask 6 0 R" + gray, "\x10");
    std::string mask;
    for (int i = 0; i < 256 * 256; ++i) {
        mask.push_back(static_cast<char>(i % 256));
    }
    source.objects.emplace_back("/Type/XObject/Subtype/Image/Width 256/Height 256" + gray, mask);
    const std::string png = findBytes(DrawnPage(source).svg, "png");
    EXPECT_EQ(png.substr(16, 8), std::string("\0\0\1\0\0\0\1\0", 8)); // width and height
}

TEST(ImageWriter, AJpegOfGreyOrRgbGoesThroughByteForByte) {
    const std::string path = Conversion::document("image-streams-small.pdf");
    std::ifstream stream(path, std::ios::binary);
    const std::string file(std::istreambuf_iterator<char>(stream), {});
    int found = 0;
    for (int number = 0; number < 9; ++number) {
        const DrawnPage page(path, number);
        if (page.svg.find("data:image/jpeg") != std::string::npos) {
            const std::string bytes = findBytes(page.svg, "jpeg");
            found += file.find(bytes) != std::string::npos ? 1 : 0;
        }
    }
    EXPECT_EQ(found, 2); // one in grey, one in RGB; that in CMYK is written anew
}

} // namespace
} // namespace DrawmereTest
