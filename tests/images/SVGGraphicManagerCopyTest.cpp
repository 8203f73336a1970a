// Images that are copied or converted into files.
#include "images/SVGGraphicManager.h"

#include "foundation/records/TLFileImage.h"
#include "tests/images/ImagePage.h"

#include <filesystem>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using TalGraphic::TLFileImage;
using TalGraphic::TLMemoryImage;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

constexpr char pngStart[] = "\x89PNG";
constexpr char jpegStart[] = "\xFF\xD8\xFF";

/// A page with the processing word set.
struct CopyPage : ImagePage {
    explicit CopyPage(const char16_t* processing = u"copy") {
        config.setImageProcessingType(MoxName(processing));
    }

    /// Returns: the name that an image of this type and name gets, without its directory.
    std::string nameOf(int type, const UnicodeString& name,
                       const UnicodeString& extension = UnicodeString()) {
        TypedImage image(type, "", name);
        const std::string path = utf8(manager().makeCopyName(&image, target(), extension));
        EXPECT_THAT(path, StartsWith(directory.path() + "/"));
        return path.substr(directory.path().size() + 1);
    }

    std::string copy(TLGraphicImage& image) { return utf8(manager().copyImage(&image, target())); }

    std::string convert(TLGraphicImage& image) {
        return utf8(manager().convertImage(&image, target()));
    }
};

// Names.

TEST(SVGGraphicManagerCopy, OneFileKeepsOneName) {
    CopyPage page;
    EXPECT_EQ(page.nameOf(2, u"a/x.png"), "x.png");
    EXPECT_EQ(page.nameOf(2, u"a/x.png"), "x.png");
    EXPECT_EQ(page.nameOf(5, u"a/x.png", u".other"), "x.png");
    EXPECT_EQ(page.config.copyNameCounter, 0);
}

TEST(SVGGraphicManagerCopy, OwnStemGetsANumberOnlyWhenItIsTaken) {
    CopyPage page;
    EXPECT_EQ(page.nameOf(2, u"a/x.png"), "x.png");
    EXPECT_EQ(page.nameOf(2, u"b/x.png"), "x1.png");
    EXPECT_EQ(page.nameOf(2, u"c/x.png"), "x2.png");
    EXPECT_EQ(page.nameOf(5, u"c/x.jpg"), "x.jpg");
    EXPECT_EQ(page.config.copyNameCounter, 0);
}

TEST(SVGGraphicManagerCopy, CopyAllCountsAndLeavesTheStemOut) {
    CopyPage page(u"copy-all");
    page.config.copyNamePrefix = u"img";
    EXPECT_EQ(page.nameOf(2, u"a/x.png"), "img1.png");
    EXPECT_EQ(page.nameOf(2, u"a/x.png"), "img1.png");
    EXPECT_EQ(page.nameOf(5, u"b/x.jpg"), "img2.jpg");
    EXPECT_EQ(page.nameOf(2, u""), "img3.png");
    EXPECT_EQ(page.nameOf(2, u""), "img4.png");
    EXPECT_EQ(page.config.copyNameCounter, 4);
}

TEST(SVGGraphicManagerCopy, CounterPassesOverNamesThatAreTaken) {
    CopyPage page(u"copy-all");
    page.config.enterImageName(u"", u"", u"1.png");
    page.config.enterImageName(u"", u"", u"2.png");
    EXPECT_EQ(page.nameOf(2, u"x.png"), "3.png");
    EXPECT_EQ(page.config.copyNameCounter, 3);
}

TEST(SVGGraphicManagerCopy, ImagesWithoutALocalFileAreCounted) {
    CopyPage page;
    EXPECT_EQ(page.nameOf(2, u""), "1.png");
    EXPECT_EQ(page.nameOf(2, u"http://host/x.png"), "2.png");
    EXPECT_EQ(page.nameOf(2, u"http://host/x.png"), "3.png");
    EXPECT_EQ(page.nameOf(2, u"file:///a/x.png"), "x.png");
}

TEST(SVGGraphicManagerCopy, ExtensionIsThatOfTheType) {
    CopyPage page;
    EXPECT_EQ(page.nameOf(5, u"a.png"), "a.jpg");
    EXPECT_EQ(page.nameOf(9, u"b.png"), "b.svg");
    EXPECT_EQ(page.nameOf(2, u"c.jpg"), "c.png");
    EXPECT_EQ(page.nameOf(7, u"d.gif"), "d.jpg");
    EXPECT_EQ(page.nameOf(7, u"e.gif", u".png"), "e.png");
    EXPECT_EQ(page.nameOf(5, u"no-extension"), "no-extension.jpg");
    EXPECT_EQ(page.nameOf(5, u"two.dots.gif"), "two.dots.jpg");
}

TEST(SVGGraphicManagerCopy, NamesOutliveTheDocument) {
    CopyPage page;
    EXPECT_EQ(page.nameOf(2, u"a/x.png"), "x.png");
    SVGFullImpl next(&page.config);
    next.initRootSvg();
    TypedImage same(2, "", u"a/x.png");
    TypedImage other(2, "", u"b/x.png");
    EXPECT_EQ(utf8(next.graphicManager.makeCopyName(&same, page.target(), u"")),
              page.directory.path("x.png"));
    EXPECT_EQ(utf8(next.graphicManager.makeCopyName(&other, page.target(), u"")),
              page.directory.path("x1.png"));
}

TEST(SVGGraphicManagerCopy, DirectoryWithoutASlashBecomesPartOfTheName) {
    // On purpose: the name follows the text of the directory as it stands; one without a slash at
    // its end becomes part of the file name.
    CopyPage page;
    TypedImage image(2, "", u"x.png");
    const MoxUri bare(u"/dir", MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr);
    EXPECT_EQ(utf8(page.manager().makeCopyName(&image, bare, u"")), "/dirx.png");
}

TEST(SVGGraphicManagerCopy, DirectoryMayBeAUri) {
    CopyPage page;
    TypedImage image(2, "", u"x.png");
    const MoxUri uri(u"file:///a%20b/", MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr);
    EXPECT_EQ(utf8(page.manager().makeCopyName(&image, uri, u"")), "/a b/x.png");
}

// Copies.

TEST(SVGGraphicManagerCopy, FilesADocumentCanReferToAreCopiedByteForByte) {
    for (const int type : {2, 5, 9}) {
        CopyPage page;
        const std::string bytes("any\0bytes", 9);
        TypedImage image(type, bytes, u"in/x.dat");
        const std::string path = page.copy(image);
        EXPECT_EQ(page.directory.read(path.substr(path.rfind('/') + 1)), bytes);
        EXPECT_TRUE(page.config.streamsByName.empty());
        EXPECT_THAT(page.errors(), IsEmpty());
    }
}

TEST(SVGGraphicManagerCopy, AnEmptyFileIsCopiedToo) {
    CopyPage page;
    TypedImage image(2, "", u"x.png");
    EXPECT_EQ(page.copy(image), page.directory.path("x.png"));
    EXPECT_TRUE(page.directory.has("x.png"));
    EXPECT_THAT(page.errors(), IsEmpty());
}

TEST(SVGGraphicManagerCopy, StreamIsReadFromItsStartInWhateverState) {
    CopyPage page;
    TypedImage image(2, "bytes", u"x.png");
    std::string word;
    *image.getStream() >> word >> word;
    page.copy(image);
    EXPECT_EQ(page.directory.read("x.png"), "bytes");
}

TEST(SVGGraphicManagerCopy, FileInPlaceIsLeftAlone) {
    CopyPage page;
    page.directory.write("x.png", "old");
    TypedImage image(2, "new", page.directory.uri("x.png"));
    EXPECT_EQ(page.copy(image), page.directory.path("x.png"));
    EXPECT_EQ(page.directory.read("x.png"), "old");
}

TEST(SVGGraphicManagerCopy, FileThatIsBeingWrittenIsLeftAlone) {
    CopyPage page;
    *page.config.createOStream(page.directory.uri("x.png")) << "open";
    TypedImage image(2, "new", u"x.png");
    EXPECT_EQ(page.copy(image), page.directory.path("x.png"));
    page.config.releaseOStream();
    EXPECT_EQ(page.directory.read("x.png"), "open");
}

TEST(SVGGraphicManagerCopy, FileInPlaceUnderAnotherNameKeepsItsBytes) {
    CopyPage page;
    page.directory.write("x.png", "bytes");
    TLFileImage file(page.directory.uri("./x.png"));
    ASSERT_EQ(file.getStream()->peek(), 'b');
    TypedImage image(2, "bytes", page.directory.uri("./x.png"));
    page.copy(image);
    EXPECT_EQ(page.directory.read("x.png"), "bytes");
}

TEST(SVGGraphicManagerCopy, TargetThatCannotBeMadeIsQueued) {
    CopyPage page;
    std::filesystem::create_directory(page.directory.path("x.png"));
    TypedImage image(2, "bytes", u"x.png");
    EXPECT_EQ(page.copy(image), page.directory.path("x.png"));
    EXPECT_THAT(page.errors(), ElementsAre(copyErrorText(page.directory.path("x.png"))));
}

TEST(SVGGraphicManagerCopy, SourceThatCannotBeReadIsQueuedAndLeavesNoFile) {
    CopyPage page;
    LostImage image(2, u"x.png");
    EXPECT_EQ(page.copy(image), page.directory.path("x.png"));
    EXPECT_THAT(page.errors(), ElementsAre(copyErrorText(page.directory.path("x.png"))));
    EXPECT_FALSE(page.directory.has("x.png"));
}

TEST(SVGGraphicManagerCopy, FullDiskIsQueued) {
    CopyPage page;
    std::filesystem::create_symlink("/dev/full", page.directory.path("x.png"));
    TypedImage image(2, "bytes", u"x.png");
    page.copy(image);
    EXPECT_THAT(page.errors(), ElementsAre(copyErrorText(page.directory.path("x.png"))));
    EXPECT_TRUE(page.config.streamsByName.empty());
}

// Conversions.

TEST(SVGGraphicManagerCopy, OtherFilesAreConverted) {
    CopyPage page;
    const std::string bytes = makeBmp(8, 8);
    TypedImage image(7, bytes, u"in/x.bmp");
    EXPECT_EQ(page.copy(image), page.directory.path("x.png"));
    EXPECT_THAT(page.directory.read("x.png"), StartsWith(pngStart));
    EXPECT_THAT(page.errors(), IsEmpty());
}

TEST(SVGGraphicManagerCopy, ConversionFollowsTheOption) {
    CopyPage page;
    page.config.setImageConversion(MoxName(u"jpg"));
    const std::string bytes = makeBmp(8, 8);
    TypedImage image(7, bytes, u"in/x.bmp");
    EXPECT_EQ(page.copy(image), page.directory.path("x.jpg"));
    EXPECT_THAT(page.directory.read("x.jpg"), StartsWith(jpegStart));
}

TEST(SVGGraphicManagerCopy, QualityIsTheOneOfTheConfiguration) {
    std::size_t sizes[2] = {};
    for (const int i : {0, 1}) {
        CopyPage page;
        page.config.setImageConversion(MoxName(u"jpg-all"));
        page.config.jpegQuality = i == 0 ? 5 : 95;
        const std::string bytes = makePng(64, 64);
        TypedImage image(7, bytes, u"x.png");
        page.copy(image);
        sizes[i] = page.directory.read("x.jpg").size();
    }
    EXPECT_GT(sizes[1], sizes[0]);
}

TEST(SVGGraphicManagerCopy, DownsamplingIsNotForFiles) {
    CopyPage page;
    page.config.downsampleDpi = 72;
    const std::string bytes = makeBmp(64, 64);
    TypedImage image(7, bytes, u"x.bmp");
    page.copy(image);
    EXPECT_EQ(page.directory.read("x.png").substr(16, 8), std::string("\0\0\0\x40\0\0\0\x40", 8));
}

TEST(SVGGraphicManagerCopy, WhatIsNoImageKeepsItsName) {
    CopyPage page;
    TypedImage broken(7, "no image", u"in/x.bmp");
    EXPECT_EQ(page.copy(broken), "in/x.bmp");
    LostImage lost(7, u"in/y.bmp");
    EXPECT_EQ(page.copy(lost), "in/y.bmp");
    EXPECT_THAT(page.errors(), ElementsAre(loadErrorText, loadErrorText));
}

TEST(SVGGraphicManagerCopy, WhatIsNoRasterKeepsItsName) {
    CopyPage page;
    TypedImage image(7, "<svg xmlns=\"http://www.w3.org/2000/svg\"/>", u"in/x.eps");
    EXPECT_EQ(page.copy(image), "in/x.eps");
    EXPECT_THAT(page.errors(), ElementsAre(rasterErrorText));
}

TEST(SVGGraphicManagerCopy, WhatNeedsNoConversionIsCopiedAndKeepsItsName) {
    CopyPage page;
    const std::string bytes = makePng(3, 2);
    TypedImage image(2, bytes, u"in/x.png");
    EXPECT_EQ(page.convert(image), "in/x.png");
    EXPECT_EQ(page.directory.read("x.png"), bytes);
}

TEST(SVGGraphicManagerCopy, PngThatIsCalledSomethingElseIsCopiedByteForByte) {
    CopyPage page;
    const std::string bytes = makePng(3, 2);
    TypedImage image(7, bytes, u"in/x.gif");
    EXPECT_EQ(page.copy(image), page.directory.path("x.png"));
    EXPECT_EQ(page.directory.read("x.png"), bytes);
    EXPECT_THAT(page.errors(), IsEmpty());
}

TEST(SVGGraphicManagerCopy, DamagedPixelsAreQueued) {
    CopyPage page;
    const std::string whole = makeBmp(64, 64);
    page.config.setImageConversion(MoxName(u"png"));
    const std::string bytes = whole.substr(0, whole.size() / 2);
    TypedImage image(7, bytes, u"x.bmp");
    page.copy(image);
    EXPECT_THAT(page.errors(), ElementsAre(loadErrorText));
    EXPECT_FALSE(page.directory.has("x.png"));
}

TEST(SVGGraphicManagerCopy, ConvertedFileThatCannotBeMadeIsQueued) {
    CopyPage page;
    page.config.setImageConversion(MoxName(u"png"));
    std::filesystem::create_directory(page.directory.path("x.png"));
    const std::string bytes = makeBmp(8, 8);
    TypedImage image(7, bytes, u"x.bmp");
    EXPECT_EQ(page.copy(image), page.directory.path("x.png"));
    EXPECT_THAT(page.errors(), ElementsAre(copyErrorText(page.directory.path("x.png"))));
}

} // namespace
} // namespace DrawmereTest
