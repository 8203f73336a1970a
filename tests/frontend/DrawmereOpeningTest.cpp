// What is checked when a document is opened: before it for a path, behind it for a stream.
#include "tests/frontend/RunFiles.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

const std::string noCopyUri = "16411 It is necessary to specify the uri that copies image files.";

class DrawmerePaths : public testing::Test {
protected:
    DrawmerePaths() { run.config.checkPaths = true; }

    std::string open() {
        return errorOf([this] { run.open(); });
    }

    RunFiles run;
};

TEST_F(DrawmerePaths, ADirectoryThatExistsIsNoError) {
    EXPECT_EQ(open(), "");
    EXPECT_NE(run.drawmere.impl, nullptr);
}

TEST_F(DrawmerePaths, AMissingDirectoryIs16410) {
    run.uri.setText(run.directory.uri("missing/out.svg"));
    EXPECT_EQ(open(),
              "16410 The svg output path (" + run.directory.path("missing/") + ") doesn't exist.");
    EXPECT_EQ(run.drawmere.impl, nullptr);
}

TEST_F(DrawmerePaths, AUriThatNamesNoFileHasNoDirectoryThatExists) {
    run.uri.setText(u"http://example.com/pages/out.svg");
    EXPECT_EQ(open(), "16410 The svg output path (http://example.com/pages/) doesn't exist.");
}

TEST_F(DrawmerePaths, AMissingDirectoryIsNotAskedForWithoutTheCheckOrForAStream) {
    run.uri.setText(run.directory.uri("missing/out.svg"));
    run.config.imageCopyUri = run.directory.uri("missing too");
    run.config.checkPaths = false;
    EXPECT_EQ(open(), "");
    run.config.checkPaths = true;
    run.config.streamOutput = true;
    EXPECT_EQ(open(), "");
}

TEST_F(DrawmerePaths, ANameWithoutADirectoryIsNotAskedFor) {
    run.uri.setText(u"out.svg");
    EXPECT_EQ(open(), "");
}

TEST_F(DrawmerePaths, CopyingImagesNeedsADestination) {
    run.config.imageCopyUri.remove();
    for (const char16_t* const word : {u"copy", u"copy-all"}) {
        run.config.setImageProcessingType(MoxName(word));
        EXPECT_EQ(open(), noCopyUri);
    }
    for (const char16_t* const word : {u"link", u"embed-all", u"Copy"}) {
        run.config.setImageProcessingType(MoxName(word));
        EXPECT_EQ(open(), "");
    }
}

TEST_F(DrawmerePaths, TheDestinationIsAskedForWithoutTheCheckToo) {
    run.config.checkPaths = false;
    run.config.imageCopyUri.remove();
    run.config.setImageProcessingType(MoxName(u"copy"));
    EXPECT_EQ(open(), noCopyUri);
}

TEST_F(DrawmerePaths, ARelativeDestinationIsSoughtInTheOutputDirectory) {
    std::filesystem::create_directory(run.directory.path("images"));
    run.config.imageCopyUri = u"images";
    EXPECT_EQ(open(), "");
    run.config.imageCopyUri = u"pictures"; // the text names it as it was given
    EXPECT_EQ(open(), "16413 Specified uri that copies image files (pictures) doesn't exists.");
}

TEST_F(DrawmerePaths, AnAbsoluteDestinationIsSoughtWhereItIs) {
    run.config.imageCopyUri = run.directory.uri();
    EXPECT_EQ(open(), "");
    run.config.imageCopyUri = u"file://" + run.directory.uri();
    EXPECT_EQ(open(), "");
    run.config.imageCopyUri = run.directory.uri("missing");
    EXPECT_EQ(open(), "16413 Specified uri that copies image files (" +
                          run.directory.path("missing") + ") doesn't exists.");
}

TEST_F(DrawmerePaths, TheOutputDirectoryIsCheckedFirst) {
    run.uri.setText(run.directory.uri("missing/out.svg"));
    run.config.imageCopyUri.remove();
    run.config.setImageProcessingType(MoxName(u"copy"));
    EXPECT_EQ(open().substr(0, 5), "16410");
}

TEST_F(DrawmerePaths, AnErrorLeavesTheOpenDocumentAsItWas) {
    ASSERT_EQ(open(), "");
    DrawmereImpl* const open1 = run.drawmere.impl;
    run.config.imageCopyUri = u"pictures";
    EXPECT_NE(open(), "");
    EXPECT_EQ(run.drawmere.impl, open1);
}

TEST_F(DrawmerePaths, TheErrorHandlerIsNotAsked) {
    RememberingHandler handler;
    run.drawmere.setErrorHandler(&handler);
    run.config.imageCopyUri = u"pictures";
    EXPECT_NE(open(), "");
    EXPECT_EQ(handler.told, "");
}

class DrawmereStreams : public testing::Test {
protected:
    DrawmereStreams() {
        run.config.streamOutput = true;
        run.config.checkPaths = true;
        run.config.setImageProcessingType(MoxName(u"copy"));
    }

    std::string open() {
        return errorOf([this] { run.drawmere.initRootSvg(&stream); });
    }

    RunFiles run;
    std::ostringstream stream;
};

TEST_F(DrawmereStreams, CopyingImagesNeedsADestination) {
    run.config.imageCopyUri.remove();
    EXPECT_EQ(open(), noCopyUri);
    run.config.setImageProcessingType(MoxName(u"copy-all"));
    EXPECT_EQ(open(), noCopyUri);
}

TEST_F(DrawmereStreams, TheDestinationMustBeAbsoluteAndNeedsNotExist) {
    run.config.imageCopyUri = u"images/";
    EXPECT_EQ(open(),
              "16412 It is necessary to specify the uri that copies image files absolutely.");
    run.config.imageCopyUri = run.directory.uri("missing/");
    EXPECT_EQ(open(), "");
}

TEST_F(DrawmereStreams, ARelativeDestinationIsAllowedWithoutTheCheckAndForFiles) {
    run.config.imageCopyUri = u"images/";
    run.config.checkPaths = false;
    EXPECT_EQ(open(), "");
    run.config.checkPaths = true;
    run.config.streamOutput = false;
    EXPECT_EQ(open(), "");
}

TEST_F(DrawmereStreams, OnlyCopyingAsksForADestination) {
    run.config.setImageProcessingType(MoxName(u"embed-all"));
    run.config.imageCopyUri.remove();
    EXPECT_EQ(open(), "");
}

TEST_F(DrawmereStreams, TheChecksStandBehindTheOpening) {
    // On purpose: a stream is checked after the document was opened, a path before.
    run.config.imageCopyUri.remove();
    EXPECT_EQ(open(), noCopyUri);
    ASSERT_NE(run.drawmere.impl, nullptr);
    run.drawmere.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILL);
    run.drawmere.finishRootSvg();
    run.drawmere.finish();
    EXPECT_NE(stream.str().find("<circle cx=\"1\" cy=\"2\" r=\"3\""), std::string::npos);
}

} // namespace
} // namespace DrawmereTest
