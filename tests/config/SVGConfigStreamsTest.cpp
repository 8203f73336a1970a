#include "SVGConfig.h"

#include "tests/support/TempDir.h"
#include "tests/support/Utf8.h"

#include <memory>
#include <sstream>

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::TempDir;
using DrawmereTest::utf8;

namespace {

/// A configuration whose `renameOStream` is switched on.
std::unique_ptr<SVGConfig> makeRenamingConfig() {
    auto config = std::make_unique<SVGConfig>();
    config->ownsObject = true;
    return config;
}

std::string renamed(const std::string& content) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostream* stream = config->createOStream(dir.uri("a"));
    *stream << content;
    config->renameOStream(stream, dir.uri("b"));
    config->releaseOStream();
    EXPECT_FALSE(dir.has("a"));
    return dir.read("b");
}

} // namespace

TEST(SVGConfigStreams, CreatedStreamWritesItsFileAndIsInTheBooks) {
    const TempDir dir;
    SVGConfig config;
    std::ostream* stream = config.createOStream(dir.uri("ä b.svg"));
    ASSERT_NE(stream, nullptr);
    EXPECT_TRUE(config.isCreatedOStream(dir.uri("ä b.svg")));
    EXPECT_FALSE(config.isCreatedOStream(dir.uri("other.svg")));
    EXPECT_EQ(config.streamsByName.at(dir.uri("ä b.svg")), stream);
    EXPECT_EQ(utf8(config.namesByStream.at(stream)), dir.path("ä b.svg"));
    *stream << "text";
    config.releaseOStream(stream);
    EXPECT_EQ(dir.read("ä b.svg"), "text");
    EXPECT_FALSE(config.isCreatedOStream(dir.uri("ä b.svg")));
    EXPECT_TRUE(config.namesByStream.empty());
}

TEST(SVGConfigStreams, FileUriOpensItsLocalFile) {
    const TempDir dir;
    SVGConfig config;
    const UnicodeString name = u"file://" + dir.uri() + u"/a%20b.svg";
    *config.createOStream(name) << "text";
    EXPECT_TRUE(config.isCreatedOStream(name));
    config.releaseOStream();
    EXPECT_EQ(dir.read("a b.svg"), "text");
}

TEST(SVGConfigStreams, FileThatCannotBeMadeGivesNullAndNoEntry) {
    const TempDir dir;
    SVGConfig config;
    EXPECT_EQ(config.createOStream(dir.uri("missing/a.svg")), nullptr);
    EXPECT_EQ(config.createOStream(dir.uri()), nullptr);
    EXPECT_EQ(config.createOStream(u""), nullptr);
    EXPECT_EQ(config.createOStream(u"http://www.example.com/a.svg"), nullptr);
    EXPECT_TRUE(config.streamsByName.empty());
    EXPECT_TRUE(config.namesByStream.empty());
}

TEST(SVGConfigStreams, NamesAreComparedExactly) {
    const TempDir dir;
    SVGConfig config;
    config.createOStream(dir.uri("a"));
    EXPECT_FALSE(config.isCreatedOStream(dir.uri("A")));
    EXPECT_FALSE(config.isCreatedOStream(dir.uri("./a")));
    config.releaseOStream();
}

TEST(SVGConfigStreams, SecondStreamOfANameLeavesTheNameToTheFirst) {
    const TempDir dir;
    SVGConfig config;
    std::ostream* first = config.createOStream(dir.uri("a"));
    std::ostream* second = config.createOStream(dir.uri("a"));
    ASSERT_NE(second, nullptr);
    EXPECT_NE(first, second);
    EXPECT_EQ(config.streamsByName.at(dir.uri("a")), first);
    EXPECT_EQ(config.namesByStream.size(), 2U);
    EXPECT_TRUE(config.isCreatedOStream(dir.uri("a")));
    config.releaseOStream();
    EXPECT_FALSE(config.isCreatedOStream(dir.uri("a")));
    EXPECT_TRUE(config.namesByStream.empty());
}

// On purpose: strikes the name out even when it means an earlier stream of the same name; that one
// is then found by its address alone.
TEST(SVGConfigStreams, ReleaseOfASecondStreamStrikesOutTheSharedName) {
    const TempDir dir;
    SVGConfig config;
    std::ostream* first = config.createOStream(dir.uri("a"));
    std::ostream* second = config.createOStream(dir.uri("a"));
    config.releaseOStream(second);
    EXPECT_FALSE(config.isCreatedOStream(dir.uri("a")));
    EXPECT_TRUE(config.namesByStream.contains(first));
    *first << "text";
    config.releaseOStream(first);
    EXPECT_TRUE(config.namesByStream.empty());
    EXPECT_EQ(dir.read("a"), "text");
}

TEST(SVGConfigStreams, ReleaseOfAnUnknownStreamDoesNothing) {
    const TempDir dir;
    SVGConfig config;
    config.createOStream(dir.uri("a"));
    std::ostringstream other;
    config.releaseOStream(&other);
    config.releaseOStream(nullptr);
    EXPECT_TRUE(config.isCreatedOStream(dir.uri("a")));
    other << "still there";
    EXPECT_EQ(other.str(), "still there");
    config.releaseOStream();
}

TEST(SVGConfigStreams, ReleaseWithoutAStreamClosesAll) {
    const TempDir dir;
    SVGConfig config;
    *config.createOStream(dir.uri("a")) << "one";
    *config.createOStream(dir.uri("b")) << "two";
    config.releaseOStream();
    EXPECT_EQ(dir.read("a"), "one");
    EXPECT_EQ(dir.read("b"), "two");
    EXPECT_TRUE(config.streamsByName.empty());
    config.releaseOStream();
}

// On purpose: init forgets the streams without deleting them.
TEST(SVGConfigStreams, InitForgetsOpenStreamsWithoutDeletingThem) {
    const TempDir dir;
    SVGConfig config;
    const std::unique_ptr<std::ostream> stream(config.createOStream(dir.uri("a")));
    config.init();
    EXPECT_FALSE(config.isCreatedOStream(dir.uri("a")));
    *stream << "text" << std::flush;
    EXPECT_EQ(dir.read("a"), "text");
}

// On purpose: leaves the streams that are still open alone.
TEST(SVGConfigStreams, DestructorLeavesOpenStreamsAlone) {
    const TempDir dir;
    std::unique_ptr<std::ostream> stream;
    {
        SVGConfig config;
        stream.reset(config.createOStream(dir.uri("a")));
    }
    *stream << "text" << std::flush;
    EXPECT_EQ(dir.read("a"), "text");
}

TEST(SVGConfigStreams, FailedWriteShowsWhenTheStreamIsFlushed) {
    SVGConfig config;
    std::ostream* stream = config.createOStream(u"/dev/full");
    ASSERT_NE(stream, nullptr);
    *stream << "text";
    stream->flush();
    EXPECT_TRUE(stream->fail());
    config.releaseOStream();
}

// On purpose: the read that meets the end leaves the byte as it was, and it is written again; a
// renamed file is one byte longer, and an empty one becomes a null byte.
TEST(SVGConfigStreams, RenamedFileHasItsLastByteTwice) {
    EXPECT_EQ(renamed("<svg/>"), "<svg/>>");
    EXPECT_EQ(renamed("\n"), "\n\n");
    EXPECT_EQ(renamed(std::string(100000, 'x') + "y"), std::string(100000, 'x') + "yy");
    EXPECT_EQ(renamed(std::string("\xFF\0", 2)), std::string("\xFF\0\0", 3));
    EXPECT_EQ(renamed(""), std::string(1, '\0'));
}

TEST(SVGConfigStreams, RenameGivesAStreamThatGoesOnBehindTheContent) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostream* stream = config->createOStream(dir.uri("a"));
    *stream << "one";
    std::ostream* fresh = config->renameOStream(stream, dir.uri("b"));
    ASSERT_NE(fresh, nullptr);
    EXPECT_NE(fresh, stream);
    EXPECT_TRUE(config->isCreatedOStream(dir.uri("b")));
    *fresh << "two";
    config->releaseOStream();
    EXPECT_EQ(dir.read("b"), "oneetwo");
}

TEST(SVGConfigStreams, OldStreamStaysEnteredUntilItIsReleased) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostream* stream = config->createOStream(dir.uri("a"));
    config->renameOStream(stream, dir.uri("b"));
    EXPECT_TRUE(config->isCreatedOStream(dir.uri("a")));
    *stream << "into a closed file" << std::flush;
    EXPECT_TRUE(stream->fail());
    config->releaseOStream(stream);
    EXPECT_FALSE(config->isCreatedOStream(dir.uri("a")));
    EXPECT_FALSE(dir.has("a"));
    config->releaseOStream();
}

TEST(SVGConfigStreams, RenameIsOffWithoutAnOwnedObject) {
    const TempDir dir;
    SVGConfig config;
    std::ostream* stream = config.createOStream(dir.uri("a"));
    EXPECT_EQ(config.renameOStream(stream, dir.uri("b")), stream);
    config.releaseOStream();
    EXPECT_TRUE(dir.has("a"));
    EXPECT_FALSE(dir.has("b"));
}

TEST(SVGConfigStreams, RenameToTheSameNameDoesNotEvenFlush) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostream* stream = config->createOStream(dir.uri("a"));
    *stream << "text";
    EXPECT_EQ(config->renameOStream(stream, dir.uri("a")), stream);
    EXPECT_EQ(dir.read("a"), "");
    config->releaseOStream();
    EXPECT_EQ(dir.read("a"), "text");
}

TEST(SVGConfigStreams, RenameToTheSameFileByAnotherNameKeepsIt) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostream* stream = config->createOStream(dir.uri("a"));
    *stream << "text";
    EXPECT_EQ(config->renameOStream(stream, dir.uri("./a")), stream);
    config->releaseOStream();
    EXPECT_EQ(dir.read("a"), "text");
}

TEST(SVGConfigStreams, RenameOfAnUnknownStreamGivesItBack) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostringstream other;
    EXPECT_EQ(config->renameOStream(&other, dir.uri("b")), &other);
    EXPECT_EQ(config->renameOStream(nullptr, dir.uri("b")), nullptr);
    EXPECT_FALSE(dir.has("b"));
}

TEST(SVGConfigStreams, RenameOfAFileThatIsGoneCopiesNothing) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostream* stream = config->createOStream(dir.uri("a"));
    *stream << "text";
    std::filesystem::remove(dir.path("a"));
    ASSERT_NE(config->renameOStream(stream, dir.uri("b")), nullptr);
    config->releaseOStream();
    EXPECT_EQ(dir.read("b"), "");
    EXPECT_TRUE(dir.has("b"));
}

TEST(SVGConfigStreams, RenameToAFileThatCannotBeMadeKeepsTheOldFile) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostream* stream = config->createOStream(dir.uri("a"));
    *stream << "text";
    EXPECT_EQ(config->renameOStream(stream, dir.uri("missing/b")), nullptr);
    EXPECT_EQ(dir.read("a"), "text");
    config->releaseOStream();
}

TEST(SVGConfigStreams, RenameThatCannotBeWrittenKeepsTheOldFile) {
    const TempDir dir;
    const auto config = makeRenamingConfig();
    std::ostream* stream = config->createOStream(dir.uri("a"));
    *stream << "text";
    std::ostream* fresh = config->renameOStream(stream, u"/dev/full");
    ASSERT_NE(fresh, nullptr);
    EXPECT_TRUE(fresh->fail());
    EXPECT_EQ(dir.read("a"), "text");
    config->releaseOStream();
}

TEST(SVGConfigStreams, CreatedFilesAreRemovedAndForgotten) {
    const TempDir dir;
    SVGConfig config;
    config.streamOutput = false;
    dir.write("ä.svg", "text");
    dir.write("kept.svg", "text");
    config.entryCreatedFile(dir.uri("ä.svg"));
    config.entryCreatedFile(dir.uri("ä.svg"));
    config.entryCreatedFile(dir.uri("missing.svg"));
    EXPECT_EQ(config.createdFiles.size(), 2U);
    config.deleteEntryeFiles();
    EXPECT_FALSE(dir.has("ä.svg"));
    EXPECT_TRUE(dir.has("kept.svg"));
    EXPECT_TRUE(config.createdFiles.empty());
}

TEST(SVGConfigStreams, StreamOutputEntersNoFileAndDeletesNone) {
    const TempDir dir;
    SVGConfig config;
    dir.write("a.svg", "text");
    config.entryCreatedFile(dir.uri("a.svg"));
    EXPECT_TRUE(config.createdFiles.empty());
    config.streamOutput = false;
    config.entryCreatedFile(dir.uri("a.svg"));
    config.streamOutput = true;
    config.deleteEntryeFiles();
    EXPECT_TRUE(dir.has("a.svg"));
    EXPECT_EQ(config.createdFiles.size(), 1U);
}

TEST(SVGConfigStreams, NameWithANullCharacterRemovesNoOtherFile) {
    const TempDir dir;
    SVGConfig config;
    config.streamOutput = false;
    dir.write("a.svg", "text");
    config.entryCreatedFile(dir.uri("a.svg") + UnicodeString(char16_t(0)) + u"b");
    config.deleteEntryeFiles();
    EXPECT_TRUE(dir.has("a.svg"));
}

TEST(SVGConfigStreams, FirstImageNameForAKeyStays) {
    SVGConfig config;
    config.enterImageName(u"source", u"key", u"a.png");
    config.enterImageName(u"source", u"key", u"b.png");
    EXPECT_EQ(utf8(config.getEnteredImageName(u"key")), "a.png");
    EXPECT_TRUE(config.isEnteredImagename(u"a.png"));
    EXPECT_TRUE(config.isEnteredImagename(u"b.png"));
    EXPECT_FALSE(config.isEnteredImagename(u"A.png"));
}

TEST(SVGConfigStreams, ImageNameWithoutASourceIsUsedButNotRemembered) {
    SVGConfig config;
    config.enterImageName(u"", u"key", u"a.png");
    EXPECT_TRUE(config.isEnteredImagename(u"a.png"));
    EXPECT_EQ(utf8(config.getEnteredImageName(u"key")), "");
}

TEST(SVGConfigStreams, UnknownAndEmptyKeysHaveNoImageName) {
    SVGConfig config;
    config.enterImageName(u"source", u"", u"a.png");
    EXPECT_EQ(config.imageNameMap.size(), 1U);
    EXPECT_EQ(utf8(config.getEnteredImageName(u"")), "");
    EXPECT_EQ(utf8(config.getEnteredImageName(u"unknown")), "");
}

TEST(SVGConfigStreams, ImageNamesCanBeForgotten) {
    SVGConfig config;
    config.enterImageName(u"source", u"key", u"a.png");
    config.copyNameCounter = 5;
    config.initImageName();
    EXPECT_FALSE(config.isEnteredImagename(u"a.png"));
    EXPECT_EQ(utf8(config.getEnteredImageName(u"key")), "");
    EXPECT_EQ(config.copyNameCounter, 0);
}
