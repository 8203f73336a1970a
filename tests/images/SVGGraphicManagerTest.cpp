#include "images/SVGGraphicManager.h"

#include "images/SVGBase64Lines.h"
#include "images/SVGImageStore.h"
#include "tests/images/FakeRaster.h"
#include "tests/images/ImagePage.h"
#include "tests/support/OpenFiles.h"
#include "tests/support/TempVariable.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(SVGGraphicManager, IsEmptyAtFirst) {
    const SVGGraphicManager manager;
    EXPECT_FALSE(manager.treeManager);
    EXPECT_FALSE(manager.groupManager);
    EXPECT_FALSE(manager.config);
    EXPECT_TRUE(manager.embeddedImages.empty());
    EXPECT_FALSE(manager.encodedText);
    EXPECT_FALSE(manager.refIdManager);
    EXPECT_FALSE(manager.imageParent);
    EXPECT_EQ(manager.errorHandler, DrawmereErrHandler::getDefault());
    EXPECT_EQ(manager.quality, 0);
}

TEST(SVGGraphicManager, StartsOverForEachDocument) {
    ImagePage page;
    SVGGraphicManager& manager = page.manager();
    std::istringstream bytes("abc");
    manager.base64Encoding(bytes);
    manager.embeddedImages[u"a"] = u"#i0";
    manager.init(page.impl.groupManager, page.impl.refIdManager, &page.config, u"s", u"t",
                 MoxName(u"png"), 7, true, u"kept");
    EXPECT_FALSE(manager.encodedText);
    EXPECT_TRUE(manager.embeddedImages.empty());
    EXPECT_EQ(manager.treeManager, page.impl.treeManager);
    EXPECT_EQ(manager.groupManager, page.impl.groupManager);
    EXPECT_EQ(manager.refIdManager, page.impl.refIdManager);
    EXPECT_EQ(manager.config, &page.config);
    EXPECT_EQ(manager.sourceBase, UnicodeString(u"s"));
    EXPECT_EQ(manager.targetBase, UnicodeString(u"t"));
    EXPECT_EQ(manager.conversionName, MoxName(u"png"));
    EXPECT_EQ(manager.quality, 7);
    EXPECT_EQ(manager.unusedText, UnicodeString(u"kept"));
}

TEST(SVGGraphicManager, IsGivenTheBaseOfTheConfigurationTwice) {
    SVGConfig config;
    config.imageBaseUri = u"base/";
    config.jpegQuality = 33;
    config.setImageConversion(MoxName(u"jpg-all"));
    SVGFullImpl impl(&config);
    impl.initRootSvg();
    EXPECT_EQ(impl.graphicManager.sourceBase, UnicodeString(u"base/"));
    EXPECT_EQ(impl.graphicManager.targetBase, UnicodeString(u"base/"));
    EXPECT_EQ(impl.graphicManager.quality, 33);
    EXPECT_EQ(impl.graphicManager.conversionName, MoxName(u"jpg-all"));
}

struct ReferenceRow {
    const char16_t* source;
    const char16_t* target;
    const char* result; // for the file at "/in/a.png"
};

TEST(SVGGraphicManager, FilesAtTheTargetBaseAreKnownByTheirNamesAlone) {
    constexpr ReferenceRow rows[] = {
        {u"/in/", u"/in/", "a.png"},   {u"/in/", u"/out/", "/in/a.png"}, {u"/x/", u"/in/", "a.png"},
        {u"/x/", u"/y/", "/in/a.png"}, {u"/x/", u"/x/", "/in/a.png"},
    };
    for (const ReferenceRow& row : rows) {
        SVGGraphicManager manager;
        manager.sourceBase = row.source;
        manager.targetBase = row.target;
        EXPECT_EQ(utf8(manager.makeRefernceName(u"/in/a.png")), row.result);
    }
}

// Which form an image takes.

struct FormRow {
    const char16_t* conversion;
    int kind;
    bool isTransparent;
    int imageClass;
    GS_GraphicType form;
};

class SVGGraphicManagerForm : public testing::TestWithParam<FormRow> {};

constexpr auto png = GRAPHICTYPE_PNG;
constexpr auto jpeg = GRAPHICTYPE_JPEG;

INSTANTIATE_TEST_SUITE_P(
    , SVGGraphicManagerForm,
    testing::Values(FormRow{u"jpg-all", 0, true, 2, jpeg}, FormRow{u"jpg-all", 2, true, 2, jpeg},
                    FormRow{u"jpg", 0, false, 3, png}, FormRow{u"png-all", 1, false, 2, jpeg},
                    FormRow{u"jpg", 2, true, 3, png}, FormRow{u"auto", 2, true, 3, png},
                    FormRow{u"jpg", 2, false, 2, jpeg}, FormRow{u"png", 3, false, 3, png},
                    FormRow{u"png-all", 4, false, 3, jpeg}, FormRow{u"png-all", 4, false, 2, png},
                    FormRow{u"auto", 5, false, 3, jpeg}, FormRow{u"auto", 5, false, 2, png},
                    FormRow{u"auto", 5, false, 1, png}, FormRow{u"auto", 5, false, 0, png},
                    FormRow{u"jpeg", 4, false, 3, jpeg}, FormRow{u"jpeg", 4, false, 2, png},
                    FormRow{u"nonsense", 4, false, 3, jpeg}, FormRow{u"auto", 9, false, 3, jpeg}));

TEST_P(SVGGraphicManagerForm, IsDecidedByTheFirstRuleThatApplies) {
    const FormRow& row = GetParam();
    ImagePage page;
    page.config.setImageConversion(MoxName(row.conversion));
    FakeRaster raster(row.kind);
    raster.isTransparent = row.isTransparent;
    raster.imageClass = row.imageClass;
    EXPECT_EQ(page.manager().getCnvDstType(&raster), row.form);
}

TEST(SVGGraphicManager, JpegIsComparedAsItWasSet) {
    // On purpose: compares the keyword as it was set, so "jpeg" counts as "auto" here, although it
    // means the same to the configuration as "jpg".
    ImagePage page;
    FakeRaster raster(RASTERKIND_GIF);
    page.config.setImageConversion(MoxName(u"jpg"));
    const std::int32_t number = page.config.imageConversion;
    EXPECT_EQ(page.manager().getCnvDstType(&raster), jpeg);
    page.config.setImageConversion(MoxName(u"jpeg"));
    EXPECT_EQ(page.config.imageConversion, number);
    EXPECT_EQ(page.manager().getCnvDstType(&raster), png);
}

TEST(SVGGraphicManager, OptionsCountAsTheyAreAtEachUse) {
    ImagePage page; // its manager noted "auto" when the document began
    FakeRaster raster(RASTERKIND_PNG);
    page.config.setImageConversion(MoxName(u"jpg-all"));
    EXPECT_EQ(page.manager().getCnvDstType(&raster), jpeg);
    EXPECT_EQ(page.manager().conversionName, MoxName(u"auto"));
}

// Whether an image is written anew.

struct ConversionRow {
    int kind;
    int jpegType;
    bool jpegRequired;
    int pngType;
    bool pngRequired;
};

class SVGGraphicManagerConversion : public testing::TestWithParam<ConversionRow> {
protected:
    /// Expects `type` and `isRequired` for what `conversion` makes of the image.
    void expectConversion(const char16_t* conversion, int type, bool isRequired) {
        ImagePage page;
        page.config.setImageConversion(MoxName(conversion));
        FakeRaster raster(GetParam().kind);
        auto found = static_cast<IMAGE_CONVERT_TYPE>(-1);
        EXPECT_EQ(page.manager().isRequiredImageConvert(&raster, &found, false), isRequired);
        EXPECT_EQ(found, type);
        EXPECT_TRUE(page.manager().isRequiredImageConvert(&raster, &found, true));
        EXPECT_EQ(found, type);
        EXPECT_FALSE(page.config.hasError());
    }
};

INSTANTIATE_TEST_SUITE_P(
    , SVGGraphicManagerConversion,
    testing::Values(ConversionRow{0, 24, true, 25, false}, ConversionRow{1, 29, false, 29, false},
                    ConversionRow{2, 7, true, 8, true}, ConversionRow{3, 13, true, 14, true},
                    ConversionRow{4, 0, true, 1, true}, ConversionRow{5, 20, true, 21, true}));

TEST_P(SVGGraphicManagerConversion, DependsOnKindAndForm) {
    const ConversionRow& row = GetParam();
    expectConversion(u"jpg-all", row.jpegType, row.jpegRequired);
    expectConversion(u"png", row.pngType, row.pngRequired);
}

TEST(SVGGraphicManager, UnknownKindHasNoConversion) {
    for (const int kind : {-1, 6, 99}) {
        ImagePage page;
        FakeRaster raster(kind);
        auto type = CONVERT_PNG_PNG;
        EXPECT_FALSE(page.manager().isRequiredImageConvert(&raster, &type, true));
        EXPECT_EQ(static_cast<int>(type), 0);
        EXPECT_THAT(page.errors(), ElementsAre(kindErrorText));
    }
}

// Images that stay where they are.

TEST(SVGGraphicManager, ReferredImageIsPageContent) {
    ImagePage page;
    page.manager().referGraphic(u"a b.png", pt(30), pt(20), pt(1), pt(2));
    EXPECT_EQ(page.manager().imageParent.get(), page.root());
    EXPECT_EQ(page.shape(), "<image preserveAspectRatio=\"none meet\" x=\"1\" y=\"2\" width=\"30\" "
                            "height=\"20\" xlink:href=\"a b.png\"/>");
}

TEST(SVGGraphicManager, ReferredImageHasTheOpacityOfTheFillAsItsOwn) {
    ImagePage page;
    page.manager().referGraphic(u"a", pt(30), pt(20), pt(1), pt(2));
    page.impl.getGContext()->setOpacity(0.5F, OPACITYDEST_FILL);
    page.manager().referGraphic(u"b", pt(30), pt(20), pt(1), pt(2));
    page.impl.finishRootSvg();
    EXPECT_THAT(page.content(), testing::HasSubstr(" opacity=\"0.5\" xlink:href=\"b\""));
    EXPECT_THAT(page.errors(), IsEmpty());
}

TEST(SVGGraphicManager, ReferredImageClosesAGroupOfShapes) {
    ImagePage page;
    page.impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE);
    page.manager().referGraphic(u"a", pt(30), pt(20), pt(1), pt(2));
    page.manager().referGraphic(u"b", pt(30), pt(20), pt(1), pt(2));
    page.impl.finishRootSvg();
    const MoxNode* const shapes = page.root()->getFirstChild();
    const MoxNode* const images = shapes->getNextSibling();
    EXPECT_FALSE(shapes->getFirstChild()->getNextSibling());
    EXPECT_TRUE(images->getFirstChild()->getNextSibling());
    EXPECT_FALSE(images->getNextSibling());
}

// Where the bytes of embedded images wait.

/// Lets files without a name go into a directory of their own.
class OwnTempDir {
public:
    int countFiles() const { return countOpenFiles(directory.path()); }

private:
    TempDir directory;
    TempVariable variable{directory.path().c_str()};
};

TEST(SVGGraphicManager, BytesBeyondTheBudgetOfADocumentGoIntoAFile) {
    const OwnTempDir place;
    std::string bytes = makePng(2, 2);
    bytes.resize(SVGImageStore::memoryBudget); // a reader stops at the end of the image
    TalGraphic::TLMemoryImage whole(bytes);
    TalGraphic::TLMemoryImage part(std::string_view(bytes).substr(0, 1000));
    MoxPtr<MoxDocument> document;
    {
        ImagePage page;
        page.drawApart(whole);
        EXPECT_EQ(place.countFiles(), 0);
        page.drawApart(part);
        EXPECT_EQ(place.countFiles(), 1);
        EXPECT_THAT(page.errors(), IsEmpty());
        ImagePage other; // with a budget of its own
        other.drawApart(part);
        EXPECT_EQ(place.countFiles(), 1);
        document = page.impl.getDocument();
    }
    const MoxNode* const image =
        document->getDocumentElement()->getFirstChild()->getFirstChild()->getNextSibling();
    const MoxValue uri =
        MoxCommonNS::narrow<MoxElement>(image)->getAttribute(MoxName(u"xlink:href"));
    std::string text(SVGBase64Lines::countText(1000), '\0');
    SVGBase64Lines::encodeText(bytes.data(), 1000, text.data());
    EXPECT_EQ(uri.getAsciiText(), "data:image/png;base64,\n" + text);
    document = nullptr;
    EXPECT_EQ(place.countFiles(), 1); // the value is its last owner
}

TEST(SVGGraphicManager, ANewDocumentHasTheWholeBudgetAgain) {
    const OwnTempDir place;
    std::string bytes = makePng(2, 2);
    bytes.resize(SVGImageStore::memoryBudget);
    TalGraphic::TLMemoryImage image(bytes);
    ImagePage page;
    for (int document = 0; document < 2; ++document) {
        page.manager().init(page.impl.groupManager, page.impl.refIdManager, &page.config, u"", u"",
                            MoxName(), 7, true, u"");
        page.drawApart(image);
    }
    EXPECT_EQ(place.countFiles(), 0);
}

} // namespace
} // namespace DrawmereTest
