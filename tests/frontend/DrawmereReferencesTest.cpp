// The page that links of a kept document are taken to be on: the one of the last page anchor in
// front of them, which may stand in the document before.
#include "foundation/records/TLMemoryImage.h"
#include "tests/frontend/RunFiles.h"
#include "tests/support/TinyImages.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

constexpr char onTheSamePage[] = "#here";
constexpr char onPageOne[] = "out1.svg";

/// Begins page 1, which has the destination "here", lets `draw` go on, and draws a second document
/// that has a link to "here" ahead of its own page. Returns: where that link leads in the end.
template <typename Draw> std::string linkBehind(Draw draw) {
    RunFiles run;
    std::ostringstream stream;
    run.config.streamOutput = true;
    run.config.setImageProcessingType(MoxName(u"embed-all"));
    run.drawmere.initRootSvg(&stream);
    run.begin(1);
    run.drawmere.setInternalLinkAnchor(u"here", 0, 0);
    draw(run.drawmere);
    run.drawmere.endPage();
    run.drawmere.finishRootSvg();
    run.drawmere.initRootSvg(&stream);
    run.drawmere.startLink(u"#here", MoxName());
    run.drawmere.endLink();
    run.begin(2);
    run.drawmere.finishRootSvg();
    run.drawmere.finish();
    std::ostringstream second;
    run.drawmere.saveDocument(run.drawmere.documents[2].get(), &second);
    return readXml(second.str()).element("a").attribute("xlink:href");
}

/// Draws an anchor of page 7.
void markPage(Drawmere& drawmere) { drawmere.setInternalLinkAnchor(u"Mox-SVG-page-7", 0, 0); }

TEST(DrawmereReferences, ThePageOfADocumentHoldsUntilTheFirstAnchorOfTheNext) {
    EXPECT_EQ(linkBehind([](Drawmere&) {}), onTheSamePage);
    EXPECT_EQ(linkBehind(markPage), onPageOne);
}

TEST(DrawmereReferences, AnAnchorInASavedStateIsThatOfThePageToo) {
    EXPECT_EQ(linkBehind([](Drawmere& drawmere) {
                  drawmere.pushState();
                  markPage(drawmere);
                  drawmere.popState();
              }),
              onPageOne);
}

TEST(DrawmereReferences, AnAnchorThatReachedNoTreeHasNoPage) {
    EXPECT_EQ(linkBehind([](Drawmere& drawmere) {
                  drawmere.startPathData();
                  markPage(drawmere);
                  drawmere.endPathData(PAINTMODE_FILL);
              }),
              onTheSamePage);
}

TEST(DrawmereReferences, AnAnchorInADefinitionStandsBeforeAllThatWasDrawnAheadOfIt) {
    EXPECT_EQ(linkBehind([](Drawmere& drawmere) {
                  drawmere.startMask(pt(0), pt(0), pt(1), pt(1), USERSPACEONUSE, USERSPACEONUSE);
                  markPage(drawmere);
                  drawmere.endMask();
              }),
              onTheSamePage);
}

TEST(DrawmereReferences, AnAnchorBehindAnEmbeddedImageStandsInTheDefinitionsAsTheCursorDoes) {
    EXPECT_EQ(linkBehind([](Drawmere& drawmere) {
                  const std::string bytes = makePng(2, 2);
                  TalGraphic::TLMemoryImage image(bytes, u"a.png");
                  drawmere.pushState(); // closes the group of the first anchor
                  drawmere.popState();
                  drawmere.drawImage(&image, TLGraphicType{}, pt(1), pt(1), pt(1), pt(1));
                  markPage(drawmere);
              }),
              onTheSamePage);
}

TEST(DrawmereReferences, ASecondDocumentOfAPageNumberLeavesTheFirstOneAsItWas) {
    RunFiles run;
    run.config.singleFile = true;
    run.drawPage(1, u"#nowhere");
    run.drawPage(1); // without links, and dropped
    run.drawmere.finish();
    EXPECT_EQ(readXml(run.directory.read("out.svg")).element("text").attribute("id"), "p1");
}

} // namespace
} // namespace DrawmereTest
