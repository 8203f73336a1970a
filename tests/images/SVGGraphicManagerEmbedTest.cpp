// Images that become part of the document.
#include "images/SVGGraphicManager.h"

#include "images/SVGBase64.h"
#include "refs/SVGRefIDManager.h"
#include "tests/images/FakeRaster.h"
#include "tests/images/ImagePage.h"
#include "tests/support/Golden.h"

#include <limits>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using TalGraphic::TLMemoryImage;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;
using testing::StartsWith;

std::string encode(const std::string& bytes) {
    std::string text(SVGBase64::CalculateRecquiredEncodeOutputBufferSize(bytes.size()), '\0');
    SVGBase64::EncodeBuffer(bytes.data(), bytes.size(), text.data());
    return text.c_str();
}

int countOf(const std::string& text, const std::string& part) {
    int count = 0;
    for (std::size_t i = text.find(part); i != std::string::npos; i = text.find(part, i + 1)) {
        ++count;
    }
    return count;
}

/// A page and the data URIs in it.
struct EmbedPage : ImagePage {
    /// Returns: the value of the data URI of the stored image with this number, from 0 on.
    std::string uri(int number) {
        const MoxNode* const defs = root()->getFirstChild();
        const MoxNode* image = defs ? defs->getFirstChild() : nullptr;
        for (int i = 0; i < number && image; ++i) {
            image = image->getNextSibling();
        }
        const auto* element = MoxCommonNS::narrow<MoxElement>(image);
        return element ? utf8(element->getAttribute(MoxName(u"xlink:href")).toString()) : "";
    }
};

// The structure in the document.

TEST(SVGGraphicManagerEmbed, ImageIsStoredOnceAndUsedWhereItIsDrawn) {
    SvgPage page;
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes, u"a.png");
    page->pushState();
    page->drawImage(&image, TalGraphic::TLGRAPHICTYPE_PNG, pt(30), pt(20), pt(1), pt(2));
    page->popState();
    page->pushState();
    page->drawImage(&image, TalGraphic::TLGRAPHICTYPE_PNG, pt(3), pt(2), pt(50), pt(60));
    page->popState();
    EXPECT_GOLDEN(page, "images/embedded-twice");
}

TEST(SVGGraphicManagerEmbed, DrawingBeforeAndBehindStaysInOrder) {
    SvgPage page;
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes, u"a.png");
    page->drawRect(pt(0), pt(0), pt(10), pt(10), pt(0), pt(0), PAINTMODE_FILL);
    page->pushState();
    page->drawImage(&image, TalGraphic::TLGRAPHICTYPE_PNG, pt(30), pt(20), pt(1), pt(2));
    page->popState();
    page->drawRect(pt(5), pt(5), pt(10), pt(10), pt(0), pt(0), PAINTMODE_FILL);
    EXPECT_GOLDEN(page, "images/embedded-between-shapes");
}

TEST(SVGGraphicManagerEmbed, TransformClipAndOpacityGoWithTheImage) {
    SvgPage page;
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes, u"a.png");
    page->pushState();
    page->setTransMatrix(SVGMatrix().translate(5, 6));
    page->setOpacity(0.5F, OPACITYDEST_FILL);
    page->drawImage(&image, TalGraphic::TLGRAPHICTYPE_PNG, pt(30), pt(20), pt(1), pt(2));
    page->popState();
    EXPECT_GOLDEN(page, "images/embedded-with-state");
}

TEST(SVGGraphicManagerEmbed, ImageUnderTheRootHasTheClipPathOnItsGroup) {
    EmbedPage page;
    page.impl.getGContext()->setClipPathID(u"c7");
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes);
    page.drawApart(image);
    EXPECT_THAT(page.content(), HasSubstr("<g clip-path=\"url(#c7)\">\n<svg "));
}

/// Returns: what a link holds in which an image is drawn behind a translation, between a push and a
/// pop when `isApart` is set.
std::string drawInLink(bool isApart) {
    EmbedPage page;
    page.impl.startLink(u"u", MoxName());
    page.impl.getGContext()->setClipPathID(u"c7");
    page.impl.getGContext()->setTransMatrix(SVGMatrix().translate(5, 6));
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes);
    isApart ? page.drawApart(image) : page.draw(image);
    return toXml(*page.impl.getDocument(), page.root()->getFirstChild()->getNextSibling());
}

TEST(SVGGraphicManagerEmbed, ImageInALinkHasTheMatrixOfTheGroupAndNoClipPath) {
    const std::string image =
        "<svg width=\"30\" height=\"20\" x=\"1\" y=\"2\">\n<use xlink:href=\"#i0\"/>\n</svg>\n";
    EXPECT_EQ(drawInLink(/*isApart=*/true),
              "<a xlink:href=\"u\">\n<g transform=\"translate(5,6)\">\n" + image + "</g>\n</a>");
    // On purpose: the matrix reaches the group by the push alone. Taking the current one would move
    // the images twice that are drawn as they should be.
    EXPECT_EQ(drawInLink(/*isApart=*/false), "<a xlink:href=\"u\">\n<g>\n" + image + "</g>\n</a>");
}

TEST(SVGGraphicManagerEmbed, OpacityThatTheGroupHasIsNotWrittenAgain) {
    // The first image takes the state over into the group, in a link as under the root.
    for (const bool isInLink : {false, true}) {
        EmbedPage page;
        if (isInLink) {
            page.impl.startLink(u"u", MoxName());
        }
        page.impl.getGContext()->setOpacity(0.5F, OPACITYDEST_FILL);
        page.manager().imageParent = page.impl.treeManager->getCurrentNode();
        page.manager().useEmbededImage(u"#a", pt(1), pt(1), pt(1), pt(1));
        page.manager().useEmbededImage(u"#b", pt(1), pt(1), pt(1), pt(1));
        EXPECT_THAT(page.content(), HasSubstr("xlink:href=\"#a\" opacity=\"0.5\"/>"));
        EXPECT_THAT(page.content(), HasSubstr("xlink:href=\"#b\"/>"));
    }
}

TEST(SVGGraphicManagerEmbed, CursorStaysInDefsUntilTheNextPop) {
    EmbedPage page;
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes);
    page.impl.pushState(ELEMENT_TYPE_PLAIN);
    page.draw(image);
    EXPECT_EQ(page.manager().imageParent.get(), page.root());
    EXPECT_EQ(page.impl.treeManager->getCurrentNode(), page.impl.treeManager->defsElement.get());
    page.impl.popState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(page.impl.treeManager->getCurrentNode(), page.root());
}

TEST(SVGGraphicManagerEmbed, ImagesWithoutANameAreStoredEachTime) {
    EmbedPage page;
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes);
    page.drawApart(image);
    page.drawApart(image);
    EXPECT_EQ(countOf(page.content(), "<image "), 2);
    EXPECT_TRUE(page.manager().embeddedImages.empty());
}

TEST(SVGGraphicManagerEmbed, OtherRecordOfTheSameNameUsesTheStoredImage) {
    EmbedPage page;
    const std::string first = makePng(2, 2);
    const std::string second = makePng(3, 3);
    TLMemoryImage one(first, u"a");
    TLMemoryImage other(second, u"a");
    page.drawApart(one);
    page.drawApart(other);
    EXPECT_EQ(countOf(page.content(), "<image "), 1);
    EXPECT_EQ(countOf(page.content(), "<use xlink:href=\"#i0\"/>"), 2);
    EXPECT_EQ(utf8(page.manager().embeddedImages[u"a"]), "#i0");
}

TEST(SVGGraphicManagerEmbed, KnownImageThatCannotBeLoadedIsNotUsed) {
    EmbedPage page;
    const std::string bytes = makePng(2, 2);
    TLMemoryImage good(bytes, u"a");
    TLMemoryImage broken("no image", u"a");
    page.drawApart(good);
    page.drawApart(broken);
    EXPECT_EQ(countOf(page.content(), "<use "), 1);
    EXPECT_THAT(page.errors(), ElementsAre(loadErrorText));
}

// The bytes.

TEST(SVGGraphicManagerEmbed, BytesThatNeedNoChangeGoInAsTheyAre) {
    EmbedPage page;
    const std::string bytes = makePng(20, 20);
    TLMemoryImage image(bytes);
    page.drawApart(image);
    EXPECT_EQ(page.uri(0), "data:image/png;base64,\n" + encode(bytes));
    EXPECT_THAT(page.errors(), IsEmpty());
    EXPECT_FALSE(page.manager().encodedText);
}

TEST(SVGGraphicManagerEmbed, OtherFormsAreConverted) {
    EmbedPage page;
    const std::string bytes = makeBmp(8, 8);
    TLMemoryImage image(bytes);
    page.drawApart(image);
    page.config.setImageConversion(MoxName(u"jpg"));
    page.drawApart(image);
    EXPECT_THAT(page.uri(0), StartsWith("data:image/png;base64,\niVBORw0KGgo"));
    EXPECT_THAT(page.uri(1), StartsWith("data:image/jpeg;base64,\n/9j/"));
}

TEST(SVGGraphicManagerEmbed, PngUnderJpgAllBecomesJpeg) {
    EmbedPage page;
    page.config.setImageConversion(MoxName(u"jpg-all"));
    const std::string bytes = makePng(20, 20, /*hasAlpha=*/true);
    TLMemoryImage image(bytes);
    page.drawApart(image);
    EXPECT_THAT(page.uri(0), StartsWith("data:image/jpeg;base64,\n/9j/"));
}

TEST(SVGGraphicManagerEmbed, QualityIsTheOneOfTheConfiguration) {
    EmbedPage page; // its manager noted another quality when the document began
    page.config.setImageConversion(MoxName(u"jpg-all"));
    const std::string bytes = makePng(64, 64);
    TLMemoryImage image(bytes);
    page.config.jpegQuality = 5;
    page.drawApart(image);
    page.config.jpegQuality = 95;
    page.drawApart(image);
    EXPECT_GT(page.uri(1).size(), page.uri(0).size());
}

TEST(SVGGraphicManagerEmbed, DownsampledImageIsWrittenAnew) {
    EmbedPage page;
    page.config.downsampleDpi = 72;
    page.config.downsampleThreshold = 1000;
    const std::string bytes = makePng(120, 80);
    TLMemoryImage image(bytes); // drawn at 30 by 20 points
    page.drawApart(image);
    // The header of a PNG of 30 by 20 pixels begins so.
    EXPECT_THAT(page.uri(0),
                StartsWith("data:image/png;base64,\niVBORw0KGgoAAAANSUhEUgAAAB4AAAAU"));
}

TEST(SVGGraphicManagerEmbed, WhatIsNoImageIsQueuedAndTheRestStays) {
    EmbedPage page;
    TLMemoryImage broken("no image", u"a.png");
    TLMemoryImage drawing("<svg xmlns=\"http://www.w3.org/2000/svg\"/>", u"a.svg");
    LostImage lost(2, u"b.png");
    page.impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE);
    page.draw(broken);
    page.draw(drawing);
    page.draw(lost);
    page.impl.finishRootSvg();
    EXPECT_THAT(page.errors(), ElementsAre(loadErrorText, rasterErrorText, loadErrorText));
    EXPECT_EQ(page.content(), "<g>\n<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>\n</g>\n");
}

TEST(SVGGraphicManagerEmbed, DamagedPixelsAreQueuedAndNothingIsStored) {
    EmbedPage page;
    const std::string whole = makeBmp(64, 64);
    const std::string bytes = whole.substr(0, whole.size() / 2);
    TLMemoryImage image(bytes, u"a");
    page.drawApart(image);
    EXPECT_THAT(page.errors(), ElementsAre(loadErrorText));
    EXPECT_EQ(page.content(), "");
    EXPECT_TRUE(page.manager().embeddedImages.empty());
}

// Encoding.

/// A stream whose length is a lie.
class EndlessBuffer : public std::streambuf {
protected:
    pos_type seekoff(off_type offset, std::ios_base::seekdir from,
                     std::ios_base::openmode /*which*/) override {
        return from == std::ios_base::end ? pos_type(2000000000) : pos_type(offset);
    }
};

TEST(SVGGraphicManagerEmbed, TextBeyondAnIntIsThrown) {
    EmbedPage page;
    EndlessBuffer buffer;
    std::istream stream(&buffer);
    try {
        page.manager().base64Encoding(stream);
        FAIL();
    } catch (const MoxError& error) {
        EXPECT_EQ(error.getCode(), 16405);
        EXPECT_EQ(utf8(error.getMessage()), "Create an encoding buffer error.");
    }
    EXPECT_FALSE(page.manager().encodedText);
}

TEST(SVGGraphicManagerEmbed, StreamsAndFilesAreEncodedIntoTheMember) {
    EmbedPage page;
    const std::string bytes = makePng(20, 20);
    std::istringstream stream(bytes);
    EXPECT_EQ(page.manager().base64Encoding(stream), encode(bytes));
    EXPECT_EQ(page.manager().encodedText, encode(bytes));
    page.directory.write("a.png", "abc");
    const char* const text = page.manager().base64Encoding(page.directory.path("a.png").c_str());
    EXPECT_STREQ(text, "YWJj");
    EXPECT_EQ(page.manager().encodedText, text);
}

TEST(SVGGraphicManagerEmbed, StreamThatCannotBeReadGivesAnEmptyText) {
    EmbedPage page;
    std::istringstream empty;
    EXPECT_STREQ(page.manager().base64Encoding(empty), "");
    std::istream broken(nullptr);
    EXPECT_STREQ(page.manager().base64Encoding(broken), "");
}

TEST(SVGGraphicManagerEmbed, FileThatCannotBeReadIsThrown) {
    EmbedPage page;
    EXPECT_THROW(page.manager().base64Encoding(page.directory.path("missing").c_str()), MoxError);
    EXPECT_FALSE(page.manager().encodedText);
}

TEST(SVGGraphicManagerEmbed, UriTellsTheType) {
    const char* const expected[] = {"data:image/png;base64,\nYWJj", "data:image/jpeg;base64,\nYWJj",
                                    "data:image/base64,\nYWJj"};
    EmbedPage page;
    for (int type = 0; type < 3; ++type) {
        std::istringstream bytes("abc");
        page.manager().base64Encoding(bytes);
        const UnicodeString reference =
            page.manager().embedImage(pt(1), pt(1), static_cast<GS_GraphicType>(type));
        EXPECT_EQ(utf8(reference), "#i" + std::to_string(type));
        EXPECT_EQ(page.uri(type), expected[type]);
        EXPECT_FALSE(page.manager().encodedText);
    }
}

TEST(SVGGraphicManagerEmbed, DrawnImageReplacesATextThatWaits) {
    EmbedPage page;
    std::istringstream waiting("abc");
    page.manager().base64Encoding(waiting);
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes);
    page.drawApart(image);
    EXPECT_FALSE(page.manager().encodedText);
    EXPECT_EQ(page.uri(0), "data:image/png;base64,\n" + encode(bytes));
}

TEST(SVGGraphicManagerEmbed, IdsShareTheirSeriesWithMasks) {
    EmbedPage page;
    page.impl.refIdManager->createReferenceID(SVGRefIDManager::REFIMAGE);
    EXPECT_EQ(utf8(page.manager().embedImage(pt(1), pt(1), GRAPHICTYPE_PNG)), "#i1");
}

TEST(SVGGraphicManagerEmbed, StoredImageHasItsAttributesInOrder) {
    EmbedPage page;
    page.manager().embedImage(pt(1), pt(1), GRAPHICTYPE_PNG);
    EXPECT_EQ(page.content(),
              "<defs>\n<image id=\"i0\" width=\"100%\" height=\"100%\" preserveAspectRatio=\"none "
              "meet\" xlink:href=\"data:image/png;base64,&#10;\"/>\n</defs>\n");
}

// Downsampling.

struct SizeRow {
    int dpi;
    int threshold;
    float width; // in inches
    float height;
    int columns; // of the source
    int rows;
    int targetColumns; // 0 for no downsampling
    int targetRows;
};

class SVGGraphicManagerDownsampling : public testing::TestWithParam<SizeRow> {};

INSTANTIATE_TEST_SUITE_P(
    , SVGGraphicManagerDownsampling,
    testing::Values(
        SizeRow{0, 1000, 1, 1, 100, 50, 0, 0}, SizeRow{-5, 1000, 1, 1, 100, 50, 0, 0},
        SizeRow{1, 0, 200, 100, 100, 50, 0, 0},   // larger: the same after all
        SizeRow{1, 0, 200, 50, 100, 50, 100, 25}, // only one axis was above
        SizeRow{1, 0, 50, 100, 100, 50, 25, 50}, SizeRow{1, 0, 100, 50, 100, 50, 0, 0},
        SizeRow{1, 0, 60, 20, 100, 50, 60, 20},
        SizeRow{1, 1, 60, 20, 100, 50, 1, 1}, // the default limit is one pixel
        SizeRow{1, 1, 20, 20, 100, 50, 1, 1}, SizeRow{1, 30, 60, 20, 100, 50, 30, 10},
        SizeRow{1, 30, 20, 40, 100, 50, 15, 30}, SizeRow{1, 30, 30, 30, 100, 50, 0 + 30, 30},
        SizeRow{1, 30, 60, 0.6F, 100, 50, 30, 1}, SizeRow{1, -1, 60, 20, 100, 50, 60, 20},
        SizeRow{1, 0, 0, 0, 100, 50, 1, 1}, SizeRow{1, 0, -9, 20, 100, 50, 1, 20},
        SizeRow{1, 0, 10.5F, 10.4F, 100, 50, 11, 10}, SizeRow{1, 0, 1e30F, 20, 100, 50, 100, 1}));

TEST_P(SVGGraphicManagerDownsampling, LeavesThePixelsThatThePlaceCanShow) {
    const SizeRow& row = GetParam();
    ImagePage page;
    page.config.downsampleDpi = row.dpi;
    page.config.downsampleThreshold = row.threshold;
    FakeRaster raster(RASTERKIND_PNG, row.columns, row.rows);
    EXPECT_EQ(page.manager().execDownsample(&raster,
                                            MoxLength(row.width, MoxCommonNS::MOXUNIT_INCH),
                                            MoxLength(row.height, MoxCommonNS::MOXUNIT_INCH)),
              row.targetColumns > 0);
    EXPECT_EQ(raster.targetColumns, row.targetColumns);
    EXPECT_EQ(raster.targetRows, row.targetRows);
}

TEST(SVGGraphicManagerEmbed, DownsamplingTypesAreThoseOfTheService) {
    // On purpose: the options 2 and 3 are the other way round in the graphic service.
    const std::pair<int, int> rows[] = {{0, 1}, {1, 1}, {2, 3}, {3, 2}, {4, 1}, {-1, 1}};
    for (const auto& [option, type] : rows) {
        ImagePage page;
        page.config.downsampleDpi = 72;
        page.config.downsampleThreshold = 0;
        page.config.downsampleType = option;
        FakeRaster raster(RASTERKIND_PNG);
        EXPECT_TRUE(page.manager().execDownsample(&raster, pt(10), pt(10)));
        EXPECT_EQ(raster.samplingType, type) << option;
    }
}

TEST(SVGGraphicManagerEmbed, ResolutionIsWhatThePlaceGets) {
    ImagePage page;
    page.config.downsampleDpi = 72;
    page.config.downsampleThreshold = 5;
    FakeRaster raster(RASTERKIND_PNG);
    EXPECT_TRUE(page.manager().execDownsample(&raster, pt(20), pt(10)));
    EXPECT_EQ(raster.targetColumns, 5);
    EXPECT_EQ(raster.targetRows, 3); // half of 5, rounded away from zero
    EXPECT_EQ(raster.xResolution, 18.0);
    EXPECT_EQ(raster.yResolution, 22.0); // 3 pixels on 10 points: 21.6
}

TEST(SVGGraphicManagerEmbed, ScaleOfTheStateEnlargesThePlace) {
    ImagePage page;
    page.config.downsampleDpi = 72;
    page.config.downsampleThreshold = 0;
    page.impl.setScale(2);
    FakeRaster raster(RASTERKIND_PNG);
    EXPECT_TRUE(page.manager().execDownsample(&raster, pt(20), pt(10)));
    EXPECT_EQ(raster.targetColumns, 40);
    EXPECT_EQ(raster.targetRows, 20);
    EXPECT_EQ(raster.xResolution, 72.0);
}

// Any other order of the factors, and any other precision, gives other numbers here.

TEST(SVGGraphicManagerEmbed, PixelsOfThePlaceAreCountedInTheOrderOfTheFactors) {
    ImagePage page;
    page.config.downsampleDpi = 150;
    page.config.downsampleThreshold = 0;
    page.impl.setScale(1.3F);
    FakeRaster raster(RASTERKIND_PNG, 5000, 5000);
    EXPECT_TRUE(page.manager().execDownsample(&raster, MoxLength(10.1F, MoxCommonNS::MOXUNIT_INCH),
                                              MoxLength(10.1F, MoxCommonNS::MOXUNIT_INCH)));
    EXPECT_EQ(raster.targetColumns, 1969);
    EXPECT_EQ(raster.targetRows, 1969);
}

TEST(SVGGraphicManagerEmbed, SidesAreMultipliedBeforeTheyAreDivided) {
    const SizeRow rows[] = {
        {1, 3089, 4667, 3657, 5000, 5000, 3089, 2421}, // the limit for a wide image
        {1, 3089, 3657, 4667, 5000, 5000, 2421, 3089}, // for a high one
        {1, 0, 4667, 3657, 3089, 5000, 3089, 2421},    // the pixels there are, in width
        {1, 0, 3657, 4667, 5000, 3089, 2421, 3089},    // in height
    };
    for (const SizeRow& row : rows) {
        ImagePage page;
        page.config.downsampleDpi = row.dpi;
        page.config.downsampleThreshold = row.threshold;
        FakeRaster raster(RASTERKIND_PNG, row.columns, row.rows);
        EXPECT_TRUE(
            page.manager().execDownsample(&raster, MoxLength(row.width, MoxCommonNS::MOXUNIT_INCH),
                                          MoxLength(row.height, MoxCommonNS::MOXUNIT_INCH)));
        EXPECT_EQ(raster.targetColumns, row.targetColumns);
        EXPECT_EQ(raster.targetRows, row.targetRows);
    }
}

TEST(SVGGraphicManagerEmbed, ResolutionIsDividedByTheScaledPlace) {
    ImagePage page;
    page.config.downsampleDpi = 10000;
    page.config.downsampleThreshold = 0;
    page.impl.setScale(0.3F);
    FakeRaster raster(RASTERKIND_PNG, 543, 10000);
    EXPECT_TRUE(page.manager().execDownsample(&raster, MoxLength(20.0F, MoxCommonNS::MOXUNIT_INCH),
                                              MoxLength(20.0F, MoxCommonNS::MOXUNIT_INCH)));
    EXPECT_EQ(raster.targetColumns, 543);
    EXPECT_EQ(raster.targetRows, 543);
    EXPECT_EQ(raster.xResolution, 91.0);
    EXPECT_EQ(raster.yResolution, 91.0);
}

TEST(SVGGraphicManagerEmbed, LengthsOfNoUseStateNoResolution) {
    constexpr float infinite = std::numeric_limits<float>::infinity();
    constexpr float nan = std::numeric_limits<float>::quiet_NaN();
    for (const float length : {0.0F, nan, infinite, -infinite}) {
        ImagePage page;
        page.config.downsampleDpi = 72;
        page.config.downsampleThreshold = 0;
        FakeRaster raster(RASTERKIND_PNG);
        raster.xResolution = 5.0;
        EXPECT_TRUE(page.manager().execDownsample(&raster, pt(length), pt(10)));
        EXPECT_EQ(raster.xResolution, 0.0) << length;
        EXPECT_GE(raster.targetColumns, 1);
    }
}

} // namespace
} // namespace DrawmereTest
