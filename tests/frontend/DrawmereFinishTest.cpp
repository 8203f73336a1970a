// Finishing documents and runs: what is written when, under which name, and what fails how.
#include "draw/DrawmereImpl.h"
#include "tests/frontend/RunFiles.h"
#include "tests/support/Gunzip.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

namespace fs = std::filesystem;

TEST(DrawmereFinish, APageIsWrittenAtOnceAndNothingOfItIsKept) {
    RunFiles run;
    run.drawPage(1);
    EXPECT_EQ(run.list(), "out1.svg");
    EXPECT_TRUE(run.holdsPage("out1.svg", 1));
    EXPECT_EQ(run.drawmere.impl, nullptr);
    EXPECT_TRUE(run.drawmere.documents.empty());
    EXPECT_TRUE(run.config.streamsByName.empty());
}

TEST(DrawmereFinish, PageFilesHaveTheNumberFormat) {
    RunFiles run;
    run.uri.numberFormat = u"001";
    run.drawPage(1);
    run.drawPage(12);
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out001.svg out012.svg");
}

TEST(DrawmereFinish, ARunOfOnePageEndsUnderThePlainName) {
    RunFiles run;
    run.drawPage(7);
    EXPECT_EQ(run.list(), "out7.svg");
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out.svg");
    EXPECT_TRUE(run.holdsPage("out.svg", 7));
}

TEST(DrawmereFinish, ARunOfOnePageKeepsItsNumberWhenAskedTo) {
    RunFiles run;
    run.config.keepPageNumber = true;
    run.drawPage(1);
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out1.svg");
}

TEST(DrawmereFinish, ARunOfTwoPagesKeepsBothNumbers) {
    RunFiles run;
    run.drawPage(1);
    run.drawPage(2);
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out1.svg out2.svg");
    EXPECT_TRUE(run.holdsPage("out1.svg", 1) && run.holdsPage("out2.svg", 2));
}

TEST(DrawmereFinish, APageThatWaitedIsRenamedToo) {
    RunFiles run;
    run.drawPage(1, u"#nowhere");
    EXPECT_EQ(run.list(), "");
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out.svg");
}

TEST(DrawmereFinish, ARenamingThatFailsLeavesTheNumberAndSaysNothing) {
    RunFiles run;
    fs::create_directories(run.directory.path("out.svg/full"));
    run.drawPage(1);
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }), "");
    EXPECT_TRUE(run.holdsPage("out1.svg", 1));
}

TEST(DrawmereFinish, APageThatCouldNotBeWrittenTakesNoOlderFilesPlace) {
    RunFiles run;
    RememberingHandler handler;
    std::ofstream(run.directory.path("out.svg")) << "older";
    fs::create_symlink("/dev/full", run.directory.path("out1.svg"));
    run.drawmere.setErrorHandler(&handler);
    run.drawPage(1);
    run.drawmere.finish();
    EXPECT_EQ(handler.told.substr(0, 5), "16414");
    EXPECT_EQ(run.directory.read("out.svg"), "older");
    EXPECT_TRUE(fs::is_symlink(run.directory.path("out1.svg")));
}

TEST(DrawmereFinish, APlainNameWithANullCharacterIsNotRenamedTo) {
    RunFiles run;
    run.drawPage(1);
    run.uri.setText(run.directory.uri("ou") + UnicodeString(u'\0') + u"t.svg");
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out1.svg");
}

TEST(DrawmereFinish, APageOfAFileUriIsWrittenAndKeepsItsNumber) {
    // On purpose: the text of the URI as the caller gave it, so a "file:" URI names no file here.
    RunFiles run;
    run.uri.setText(u"file://" + run.directory.uri("out.svg"));
    run.drawPage(1);
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out1.svg");
}

TEST(DrawmereFinish, APageWithAForwardLinkWaitsAndLeadsToTheFileInTheEnd) {
    RunFiles run;
    run.drawPage(1, u"#there");
    EXPECT_EQ(run.list(), "");
    EXPECT_EQ(run.drawmere.documents.size(), 1U);
    run.drawPage(2, u"", u"there");
    EXPECT_EQ(run.list(), "out2.svg");
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out1.svg out2.svg");
    const std::string text = run.directory.read("out1.svg");
    EXPECT_NE(text.find("<a xlink:href=\"out2.svg\">"), std::string::npos);
    EXPECT_NE(text.find("<text id=\"p1\"/>"), std::string::npos);
}

TEST(DrawmereFinish, APageWithABackwardLinkIsWrittenAtOnceAsItStands) {
    RunFiles run;
    run.drawPage(1, u"", u"there");
    run.drawPage(2, u"#there");
    EXPECT_EQ(run.list(), "out1.svg out2.svg");
    const std::string text = run.directory.read("out2.svg");
    EXPECT_NE(text.find("<a xlink:href=\"#there\">"), std::string::npos);
    EXPECT_NE(text.find("<text id=\"Mox-SVG-page-2\"/>"), std::string::npos);
}

TEST(DrawmereFinish, ALinkThatLeadsNowhereIsKeptInTheEnd) {
    RunFiles run;
    run.drawPage(1, u"#nowhere");
    run.drawPage(2);
    run.drawmere.finish();
    EXPECT_NE(run.directory.read("out1.svg").find("<a xlink:href=\"#nowhere\">"),
              std::string::npos);
}

TEST(DrawmereFinish, TheFirstDocumentOfAPageNumberIsKept) {
    RunFiles run;
    run.drawPage(1, u"#nowhere");
    run.drawPage(1, u"#elsewhere");
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out1.svg"); // two pages were begun, so nothing is renamed
    const std::string text = run.directory.read("out1.svg");
    EXPECT_NE(text.find("#nowhere"), std::string::npos);
    EXPECT_EQ(text.find("#elsewhere"), std::string::npos);
}

TEST(DrawmereFinish, AnEmptyRunWritesNothingAndFailsNowhere) {
    RunFiles run;
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }), "");
    run.config.singleFile = true;
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }), "");
    run.config.streamOutput = true;
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }), "");
    EXPECT_EQ(run.list(), "");
}

// One document for the whole run.

TEST(DrawmereFinish, ASingleFileHoldsAllPagesUnderItsOwnName) {
    RunFiles run;
    run.config.singleFile = true;
    run.open();
    for (const int number : {1, 2}) {
        run.begin(number);
        run.drawmere.startLink(u"#nowhere", MoxName());
        run.drawmere.endLink();
        run.drawmere.endPage();
    }
    run.drawmere.finishRootSvg();
    EXPECT_EQ(run.list(), "");
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out.svg");
    const std::string text = run.directory.read("out.svg");
    for (const char* const part : {"id=\"p1\"", "id=\"p2\"", "r=\"1\"", "r=\"2\"", "#nowhere"}) {
        EXPECT_NE(text.find(part), std::string::npos) << part;
    }
    EXPECT_TRUE(run.config.streamsByName.empty());
}

std::string finishSingleFile(RunFiles& run) {
    run.drawmere.finishRootSvg();
    run.drawmere.finish();
    return run.directory.read("out.svg");
}

TEST(DrawmereFinish, PagesWithoutLinksGetTheFinalIdsOfTheirAnchorsToo) {
    RunFiles run;
    run.config.singleFile = true;
    run.open();
    run.begin(1);
    run.drawmere.endPage();
    run.drawmere.pushState();
    run.begin(2);
    run.drawmere.popState();
    run.drawmere.endPage();
    const std::string text = finishSingleFile(run);
    EXPECT_NE(text.find("id=\"p1\""), std::string::npos);
    EXPECT_NE(text.find("id=\"p2\""), std::string::npos);
    EXPECT_EQ(text.find("Mox-SVG-page-"), std::string::npos);
}

TEST(DrawmereFinish, AnAnchorWithTheMarkOfAPageIsAPageAnchorToo) {
    RunFiles run;
    run.config.singleFile = true;
    run.open();
    run.begin(1);
    run.drawmere.setInternalLinkAnchor(u"Mox-SVG-page-7", 0, 0);
    run.drawmere.endPage();
    EXPECT_NE(finishSingleFile(run).find("id=\"p7\""), std::string::npos);
}

TEST(DrawmereFinish, AnAnchorThatReachedNoTreeChangesNothing) {
    RunFiles run;
    run.config.singleFile = true;
    run.open();
    run.begin(1);
    run.drawmere.startPathData();
    run.drawmere.setInternalLinkAnchor(u"Mox-SVG-page-7", 0, 0);
    run.drawmere.endPathData(PAINTMODE_FILL);
    run.drawmere.endPage();
    const std::string text = finishSingleFile(run);
    EXPECT_EQ(text.find("p7"), std::string::npos);
    EXPECT_NE(text.find("id=\"p1\""), std::string::npos);
}

TEST(DrawmereFinish, ALinkThatACallerHangsIntoTheTreeIsFoundToo) {
    RunFiles run;
    run.open();
    run.begin(1);
    SVGDocument* document = run.drawmere.impl->getDocument();
    const MoxPtr<SVGElement> link = document->createSVGElement(SVGName::a);
    link->setAttribute(MoxName(u"xlink:href"), MoxValue(u"#later"));
    document->getDocumentElement()->appendChild(link.get());
    run.drawmere.endPage();
    run.drawmere.finishRootSvg();
    EXPECT_EQ(run.drawmere.documents.size(), 1U);
}

TEST(DrawmereFinish, ASingleFileOfOnePageIsNotRenamed) {
    RunFiles run;
    run.config.singleFile = true;
    run.drawmere.initRootSvg(run.directory.uri("other1.svg"));
    run.begin(1);
    run.drawmere.finishRootSvg();
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "other1.svg");
}

TEST(DrawmereFinish, ASingleFileThatCannotBeMadeIs16414) {
    RunFiles run("missing/out.svg");
    run.config.singleFile = true;
    run.drawPage(1);
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }),
              unwritable(run.directory.path("missing/out.svg")));
}

TEST(DrawmereFinish, OfSeveralDocumentsTheOneOfTheLowestPageIsWritten) {
    RunFiles run;
    run.config.singleFile = true;
    run.drawPage(5);
    run.drawPage(2);
    run.drawmere.finish();
    EXPECT_TRUE(run.holdsPage("out.svg", 2));
    EXPECT_EQ(run.directory.read("out.svg").find("r=\"5\""), std::string::npos);
}

TEST(DrawmereFinish, AStreamGetsOneDocumentAndStaysTheCallers) {
    RunFiles run;
    std::ostringstream stream;
    run.config.streamOutput = true;
    run.config.singleFile = true; // plays no part
    run.drawmere.initRootSvg(&stream);
    run.begin(1);
    run.drawmere.endPage();
    run.drawmere.finishRootSvg();
    EXPECT_EQ(stream.str(), "");
    run.drawmere.finish();
    EXPECT_TRUE(stream.str().ends_with("</svg>\n"));
    EXPECT_TRUE(stream.good());
    EXPECT_EQ(run.list(), ""); // nothing is renamed either
    stream << "more";
    EXPECT_TRUE(stream.str().ends_with("more"));
}

TEST(DrawmereFinish, LinksBetweenPagesOfAStreamStayInTheDocumentWithTheSingleFileFlagAlone) {
    for (const bool singleFile : {false, true}) {
        RunFiles run;
        std::ostringstream stream;
        run.config.streamOutput = true;
        run.config.singleFile = singleFile;
        run.drawmere.initRootSvg(&stream);
        run.begin(1);
        run.drawmere.setInternalLinkAnchor(u"there", 0, 0);
        run.drawmere.endPage();
        run.begin(2);
        run.drawmere.startLink(u"#there", MoxName());
        run.drawmere.endLink();
        run.drawmere.endPage();
        run.drawmere.finishRootSvg();
        run.drawmere.finish();
        const char* const link = singleFile ? "xlink:href=\"#there\"" : "xlink:href=\"out1.svg\"";
        EXPECT_NE(stream.str().find(link), std::string::npos) << stream.str();
    }
}

TEST(DrawmereFinish, AStreamGetsTheFirstOfTwoDocuments) {
    RunFiles run;
    std::ostringstream stream;
    run.config.streamOutput = true;
    for (const int number : {1, 2}) {
        run.drawmere.initRootSvg(&stream);
        run.begin(number);
        run.drawmere.finishRootSvg();
    }
    EXPECT_EQ(run.drawmere.documents.size(), 2U);
    run.drawmere.finish();
    EXPECT_NE(stream.str().find("r=\"1\""), std::string::npos);
    EXPECT_EQ(stream.str().find("r=\"2\""), std::string::npos);
}

TEST(DrawmereFinish, WithoutAStreamToWriteToARunFails) {
    RunFiles run;
    run.config.streamOutput = true;
    run.open();
    run.drawmere.finishRootSvg();
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }),
              unwritable(run.directory.path("out.svg")));
    run.drawmere.initRootSvg(static_cast<std::ostream*>(nullptr));
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }),
              "16414 Specified uri that svg output couldn't create.");
}

// What a document looks like in the file.

TEST(DrawmereSave, IsUtf8WithADeclaration) {
    SvgPage page;
    page->setFillColorName(u"\u00E9");
    page->drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILL);
    EXPECT_EQ(page.document().substr(0, 39), "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n");
    EXPECT_NE(page.document().find("fill=\"\u00E9\""), std::string::npos);
}

TEST(DrawmereSave, TakesTheEncodingOfTheConfiguration) {
    SvgPage page;
    page.config.encoding = u"ISO-8859-1";
    page->setFillColorName(u"\u00E9\u4E00");
    page->drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILL);
    EXPECT_NE(page.document().find("encoding=\"ISO-8859-1\""), std::string::npos);
    EXPECT_NE(page.document().find("fill=\"\xE9&#"), std::string::npos);
}

TEST(DrawmereSave, TakesTheSaveOptionsOfTheConfiguration) {
    SvgPage page;
    page.config.saveOption = u"decimals=1,indent";
    page->drawCircle(pt(1.26F), pt(2), pt(0.04F), PAINTMODE_FILL);
    EXPECT_NE(page.document().find("cx=\"1.3\" cy=\"2\" r=\"0.04\""), std::string::npos)
        << page.document();
    EXPECT_NE(page.document().find("\n  "), std::string::npos);
}

TEST(DrawmereSave, CompressesWhenAskedTo) {
    RunFiles run("out.svgz");
    run.config.gzip = true;
    run.drawPage(3);
    run.drawmere.finish();
    const std::string text = gunzip(run.directory.read("out.svgz"));
    EXPECT_NE(text.find("r=\"3\""), std::string::npos);
    EXPECT_TRUE(text.ends_with("</svg>\n"));
}

TEST(DrawmereSave, CompressesForAStreamToo) {
    SvgPage page;
    page.config.gzip = true;
    page->drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILL);
    EXPECT_TRUE(gunzip(page.document()).ends_with("</svg>\n"));
}

TEST(DrawmereSave, IgnoresNulls) {
    SvgPage page;
    page->saveDocument(nullptr, &page.stream);
    const MoxPtr<MoxDocument> document(new MoxDocument);
    page->saveDocument(document.get(), nullptr);
    EXPECT_EQ(page.stream.str(), "");
}

} // namespace
} // namespace DrawmereTest
