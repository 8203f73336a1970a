// Where an image goes, and by which path the document refers to it.
#include "draw/DrawmereImpl.h"
#include "foundation/common/MoxUri.h"
#include "tests/images/ImagePage.h"

#include <filesystem>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

/// A page that can say what it refers to.
struct HrefPage : ImagePage {
    /// Returns: the reference of the one image on the page.
    std::string href() {
        impl.finishRootSvg();
        const auto* image =
            MoxCommonNS::narrow<MoxElement>(root()->getFirstChild()->getFirstChild());
        return utf8(image->getAttribute(MoxName(u"xlink:href")).toString());
    }
};

/// Returns: the reference to the file `path` of a document at `output`, when files are linked to.
std::string link(const UnicodeString& path, const UnicodeString& output) {
    HrefPage page;
    page.config.setImageProcessingType(MoxName(u"link"));
    page.config.svgOutputUri = output;
    TypedImage image(2, "", path);
    page.draw(image);
    return page.href();
}

// The way an image goes.

struct WayRow {
    const char16_t* processing;
    int type;
    const char16_t* fileName;
    const char* way; // "embed", "copy" or "link"
};

class DrawmereImplImageWay : public testing::TestWithParam<WayRow> {};

INSTANTIATE_TEST_SUITE_P(
    , DrawmereImplImageWay,
    testing::Values(
        WayRow{u"embed-all", 2, u"in/a.png", "embed"}, WayRow{u"embed-all", 9, u"", "embed"},
        WayRow{u"no-word", 2, u"a", "embed"}, WayRow{u"link", 2, u"in/a.png", "link"},
        WayRow{u"link", 5, u"in/a.png", "link"}, WayRow{u"link", 9, u"in/a.png", "link"},
        WayRow{u"link", 2, u"", "embed"}, WayRow{u"link", 7, u"in/a.png", "embed"},
        WayRow{u"copy-all", 2, u"in/a.png", "copy"}, WayRow{u"copy-all", 2, u"", "copy"},
        WayRow{u"copy", 2, u"in/a.png", "copy"}, WayRow{u"copy", 2, u"", "embed"}));

TEST_P(DrawmereImplImageWay, IsChosenByTheWordAndTheImage) {
    const WayRow& row = GetParam();
    ImagePage page;
    page.config.setImageProcessingType(MoxName(row.processing));
    page.config.imageCopyUri = page.directory.uri() + u"/";
    const std::string bytes = makePng(2, 2);
    TypedImage image(row.type, bytes, row.fileName);
    page.drawApart(image);
    page.impl.finishRootSvg();
    const bool isEmbedded = page.content().find("<use ") != std::string::npos;
    const bool isCopied = !std::filesystem::is_empty(page.directory.path());
    EXPECT_STREQ(isEmbedded ? "embed" : isCopied ? "copy" : "link", row.way);
    EXPECT_THAT(page.errors(), IsEmpty());
}

TEST(DrawmereImplImages, ConvertedCopyIsReferredToByItsNewName) {
    HrefPage page;
    page.config.setImageProcessingType(MoxName(u"copy"));
    page.config.imageCopyUri = page.directory.uri() + u"/";
    const std::string bytes = makeBmp(8, 8);
    TypedImage image(7, bytes, u"in/a.bmp");
    page.draw(image);
    EXPECT_EQ(page.href(), page.directory.path("a.png"));
}

// Paths of files that stay where they are.

struct PathRow {
    const char16_t* path;
    const char16_t* output;
    const char* href;
};

class DrawmereImplImagePath : public testing::TestWithParam<PathRow> {};

INSTANTIATE_TEST_SUITE_P(
    , DrawmereImplImagePath,
    testing::Values(PathRow{u"/w/out/a.png", u"/w/out/p.svg", "a.png"},
                    PathRow{u"a.png", u"p.svg", "a.png"}, PathRow{u"a.png", u"", "a.png"},
                    PathRow{u"/w/img/a.png", u"/w/out/p.svg", "../img/a.png"},
                    PathRow{u"/w/a.png", u"/w/out/deep/p.svg", "../../a.png"},
                    PathRow{u"/w/out/sub/a.png", u"/w/out/p.svg", "./sub/a.png"},
                    PathRow{u"/w/out-b/a.png", u"/w/out-a/p.svg", "../out-b/a.png"},
                    PathRow{u"/w/outer/a.png", u"/w/out/p.svg", "../outer/a.png"},
                    PathRow{u"/img/a.png", u"/out/p.svg", "/img/a.png"},
                    PathRow{u"/a.png", u"/out/p.svg", "/a.png"},
                    PathRow{u"img/a.png", u"/w/out/p.svg", "img/a.png"},
                    PathRow{u"w/img/a.png", u"w/out/p.svg", "w/img/a.png"},
                    PathRow{u"v/w/img/a.png", u"v/w/out/p.svg", "../img/a.png"},
                    PathRow{u"http://host/img/a.png", u"http://host/out/p.svg", "../img/a.png"},
                    PathRow{u"http://host/a.png", u"http://other/p.svg", "../host/a.png"},
                    PathRow{u"http://host/a.png", u"/w/p.svg", "http://host/a.png"}));

TEST_P(DrawmereImplImagePath, IsRelativeToTheDocument) {
    EXPECT_EQ(link(GetParam().path, GetParam().output), GetParam().href);
}

TEST(DrawmereImplImages, KeepTheirPathWithoutAnOutput) {
    EXPECT_EQ(link(u"/w/a.png", SVGConfig().svgOutputUri), "/w/a.png");
}

// Paths of copies.

/// Returns: the reference to a copy of "in/a.png" with this `imageCopyUri`, of a document in a
/// directory that has the directory "img".
std::string copyReference(const UnicodeString& copyUri) {
    HrefPage page;
    std::filesystem::create_directory(page.directory.path("img"));
    page.config.setImageProcessingType(MoxName(u"copy"));
    page.config.svgOutputUri = page.directory.uri("p.svg");
    page.config.imageCopyUri = copyUri;
    TypedImage image(2, "bytes", u"in/a.png");
    page.draw(image);
    EXPECT_THAT(page.errors(), IsEmpty());
    return page.href();
}

TEST(DrawmereImplImages, CopiesAreReferredToAsTheirDirectoryIsGiven) {
    EXPECT_EQ(copyReference(u""), "a.png");
    EXPECT_EQ(copyReference(u"./"), "./a.png");
    EXPECT_EQ(copyReference(u"img/"), "img/a.png");
    const TempDir other;
    EXPECT_EQ(copyReference(other.uri() + u"/"), other.path("a.png"));
}

TEST(DrawmereImplImages, DirectoryWithoutASlashLeadsNowhere) {
    // On purpose: the name follows the text of the directory as it stands; one without a slash at
    // its end becomes part of the file name, while the reference has the slash.
    EXPECT_EQ(copyReference(u"img"), "img/imga.png");
}

TEST(DrawmereImplImages, CopiesGoWhereTheDocumentIs) {
    ImagePage page;
    std::filesystem::create_directory(page.directory.path("img"));
    page.config.setImageProcessingType(MoxName(u"copy"));
    page.config.svgOutputUri = page.directory.uri("p.svg");
    page.config.imageCopyUri = u"img/";
    TypedImage image(2, "bytes", u"in/a.png");
    EXPECT_EQ(utf8(page.impl.copyImage(&image)), page.directory.path("img/a.png"));
    EXPECT_EQ(page.directory.read("img/a.png"), "bytes");
}

TEST(DrawmereImplImages, OneFileDrawnTwiceHasOneCopy) {
    ImagePage page;
    page.config.setImageProcessingType(MoxName(u"copy"));
    page.config.imageCopyUri = page.directory.uri() + u"/";
    TypedImage image(2, "bytes", u"in/a.png");
    TypedImage other(2, "other", u"out/a.png");
    page.draw(image);
    page.draw(image);
    page.draw(other);
    page.impl.finishRootSvg();
    const std::string content = page.content();
    const std::string first = "xlink:href=\"" + page.directory.path("a.png") + "\"";
    EXPECT_NE(content.find(first), content.rfind(first));
    EXPECT_THAT(content, HasSubstr("xlink:href=\"" + page.directory.path("a1.png") + "\""));
    EXPECT_EQ(page.directory.read("a.png"), "bytes");
    EXPECT_EQ(page.directory.read("a1.png"), "other");
}

TEST(DrawmereImplImages, MissingDirectoryEndsTheRun) {
    for (const bool isRelative : {true, false}) {
        ImagePage page;
        page.config.setImageProcessingType(MoxName(u"copy"));
        page.config.svgOutputUri = page.directory.uri("p.svg");
        page.config.imageCopyUri = isRelative ? UnicodeString(u"img/") : page.directory.uri("img/");
        TypedImage image(2, "bytes", u"in/a.png");
        try {
            page.draw(image);
            FAIL();
        } catch (const MoxError& error) {
            EXPECT_EQ(error.getCode(), 16413);
            EXPECT_EQ(utf8(error.getMessage()), "Specified uri that copies image files (" +
                                                    utf8(page.config.imageCopyUri) +
                                                    ") doesn't exists.");
        }
    }
}

/// An implementation with copies of its own.
class CopyingImpl : public SVGFullImpl {
public:
    using SVGFullImpl::SVGFullImpl;

    UnicodeString copyImage(TLGraphicImage* /*image*/) override { return u"own/copy.png"; }
};

TEST(DrawmereImplImages, AnImplementationMayCopyInItsOwnWay) {
    DrawnTree<CopyingImpl> tree;
    tree.config.setImageProcessingType(MoxName(u"copy"));
    tree.config.imageCopyUri = u"img";
    TypedImage image(2, "bytes", u"in/a.png");
    tree.impl.drawImage(&image, pt(1), pt(1), pt(1), pt(1));
    tree.impl.finishRootSvg();
    EXPECT_THAT(tree.content(), HasSubstr("xlink:href=\"img/copy.png\""));
}

// Misuse.

TEST(DrawmereImplImages, NullImageIsIgnored) {
    for (const char16_t* const word : {u"embed-all", u"link", u"copy-all", u"copy"}) {
        ImagePage page;
        page.config.setImageProcessingType(MoxName(word));
        page.impl.drawImage(nullptr, pt(1), pt(1), pt(1), pt(1));
        EXPECT_TRUE(page.impl.copyImage(nullptr).isEmpty());
        page.impl.finishRootSvg();
        EXPECT_EQ(page.content(), "");
        EXPECT_THAT(page.errors(), IsEmpty());
    }
}

TEST(DrawmereImplImages, ImageBeforeTheDocumentBeginsIsIgnored) {
    SVGConfig config;
    SVGFullImpl impl(&config);
    TypedImage image(2, "bytes", u"in/a.png");
    impl.drawImage(&image, pt(1), pt(1), pt(1), pt(1));
    EXPECT_FALSE(config.hasError());
}

} // namespace
} // namespace DrawmereTest
