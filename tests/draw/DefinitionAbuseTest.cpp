// Definitions that no caller should make: the document stays whole, and nothing else is lost.
#include "draw/DrawmereImpl.h"
#include "tests/draw/QueuedErrors.h"
#include "tests/support/Command.h"
#include "tests/support/Golden.h"
#include "tests/support/TempDir.h"
#include "tests/support/XmlReader.h"
#include "tree/SVGTreeManager.h"

#include <algorithm>

namespace DrawmereTest {
namespace {

constexpr int manyClips = 1000;
constexpr int manyStops = 100'000;
constexpr int manyDefinitions = 20'000;

void drawBox(SvgPage& page, float x) {
    page->drawRect(pt(x), pt(10), pt(20), pt(20), pt(0), pt(0), PAINTMODE_NONE);
}

std::string box(const std::string& x) {
    return "<rect x=\"" + x + "\" y=\"10\" width=\"20\" height=\"20\" fill=\"none\"/>";
}

void startClip(SvgPage& page) { page->startClipDef(USERSPACEONUSE); }

void startMask(SvgPage& page) {
    page->startMask(pt(0), pt(0), pt(1), pt(1), USERSPACEONUSE, USERSPACEONUSE);
}

void startPattern(SvgPage& page) {
    const MoxRectT<MoxLength> area(pt(0), pt(0), pt(1), pt(1));
    page->startPattern(area, area, SVGMatrix(), USERSPACEONUSE, USERSPACEONUSE);
}

void startGradient(SvgPage& page) {
    page->startLinearGradient(pt(0), pt(0), pt(1), pt(0), SVGMatrix(), USERSPACEONUSE, GRADPAD);
}

struct Kind {
    const char* name;
    void (*start)(SvgPage& page);
    void (Drawmere::*end)();
};

constexpr Kind kinds[] = {
    {"clipPath", startClip, &Drawmere::endClipDef},
    {"mask", startMask, &Drawmere::endMask},
    {"pattern", startPattern, &Drawmere::endPattern},
    {"linearGradient", startGradient, &Drawmere::endGradiant},
};

int countOf(const std::string& text, const std::string& part) {
    int count = 0;
    for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) {
        ++count;
    }
    return count;
}

/// Returns: what xmllint says against the text, nothing for XML without fault.
std::string findFault(const std::string& xml) {
    const TempDir directory;
    directory.write("page.svg", xml);
    return runCommand({"xmllint", "--noout", "--huge", directory.path("page.svg")}).output;
}

std::ptrdiff_t countTags(const XmlReading& reading, const std::string& name) {
    return std::count_if(reading.events.begin(), reading.events.end(), [&name](const XmlEvent& e) {
        return e.kind == XmlEvent::START && e.name == name;
    });
}

TEST(DefinitionAbuse, ADefinitionLeftOpenHoldsTheRestAndKeepsWhatWasThere) {
    for (const Kind& kind : kinds) {
        SvgPage page;
        drawBox(page, 0);
        kind.start(page);
        drawBox(page, 20);
        const XmlReading reading = readXml(page.document());
        EXPECT_EQ(reading.error, "") << kind.name;
        EXPECT_EQ(countTags(reading, kind.name), 1) << kind.name;
        EXPECT_TRUE(page.body().ends_with("</defs>\n<g>\n" + box("0") + "\n</g>")) << page.body();
    }
}

TEST(DefinitionAbuse, TheNextDocumentKnowsNothingOfADefinitionLeftOpen) {
    for (const Kind& kind : kinds) {
        SvgPage page;
        kind.start(page);
        page->finishRootSvg();
        page->initRootSvg(&page.stream);
        page->drawRect(pt(0), pt(10), pt(20), pt(20), pt(0), pt(0), PAINTMODE_NONE);
        EXPECT_TRUE(page->impl->treeManager->unlocked);
        EXPECT_FALSE(page->impl->inClipDef);
        EXPECT_EQ(page->impl->treeManager->nodeStack.size(), 0U);
    }
}

TEST(DefinitionAbuse, AnEndWithoutAStartIsAnErrorAndLosesNothing) {
    for (const Kind& kind : kinds) {
        SvgPage page;
        drawBox(page, 0);
        EXPECT_EQ(catchError([&] { (page.drawmere.*kind.end)(); }), otherTypeError) << kind.name;
        drawBox(page, 20);
        EXPECT_EQ(page.body(), "<g>\n" + box("0") + "\n</g>\n<g>\n" + box("20") + "\n</g>");
    }
}

TEST(DefinitionAbuse, AnotherEndThanThatOfTheStartIsAnErrorAndTheRightOneStillServes) {
    for (const Kind& kind : kinds) {
        for (const Kind& other : kinds) {
            SvgPage page;
            kind.start(page);
            if (other.end != kind.end) {
                EXPECT_EQ(catchError([&] { (page.drawmere.*other.end)(); }), otherTypeError);
            }
            EXPECT_EQ(catchError([&] { page->popState(); }), otherTypeError);
            EXPECT_EQ(catchError([&] { (page.drawmere.*kind.end)(); }), "nothing");
            drawBox(page, 0);
            EXPECT_TRUE(page.body().ends_with("</defs>\n<g>\n" + box("0") + "\n</g>"));
        }
    }
}

TEST(DefinitionAbuse, DefinitionsInDefinitionsStandBesideThem) {
    SvgPage page;
    startPattern(page);
    drawBox(page, 0);
    startMask(page);
    drawBox(page, 20);
    startGradient(page);
    page->setStopColor(MoxColor(), 0, 1);
    page->endGradiant();
    drawBox(page, 40);
    page->endMask();
    drawBox(page, 60);
    startClip(page);
    drawBox(page, 80);
    page->endClipDef();
    page->endPattern();
    drawBox(page, 100);
    EXPECT_GOLDEN(page, "paint/definitions-in-definitions");
}

TEST(DefinitionAbuse, AnyDefinitionInAnyOtherLeavesThePageWhole) {
    for (const Kind& outer : kinds) {
        for (const Kind& inner : kinds) {
            SvgPage page;
            outer.start(page);
            inner.start(page);
            page->setStopColor(MoxColor(), 0, 1);
            drawBox(page, 0);
            (page.drawmere.*inner.end)();
            page->setStopColor(MoxColor(), 0, 1);
            drawBox(page, 20);
            (page.drawmere.*outer.end)();
            drawBox(page, 40);
            EXPECT_EQ(readXml(page.document()).error, "");
            EXPECT_TRUE(page.body().ends_with("</defs>\n<g>\n" + box("40") + "\n</g>"))
                << page.body();
        }
    }
}

TEST(DefinitionAbuse, AClipInAClipDefinitionEndsItForBoth) {
    // On purpose: the rest of the outer definition is written as page content, in a group and with
    // its paint, as any pop leaves no type behind.
    SvgPage page;
    startClip(page);
    drawBox(page, 0);
    startClip(page);
    drawBox(page, 20);
    page->endClipDef();
    drawBox(page, 40);
    page->endClipDef();
    EXPECT_GOLDEN(page, "paint/clip-in-clip-definition");
}

TEST(DefinitionAbuse, AGradientInAGradientIsLostAndTheOuterOneIsNot) {
    SvgPage page;
    startGradient(page);
    page->setStopColor(MoxColor(255, 0, 0), 0, 1);
    startGradient(page);
    page->setStopColor(MoxColor(0, 0, 255), 0, 1);
    page->endGradiant();
    page->setStopColor(MoxColor(255, 0, 0), 1, 1);
    page->endGradiant();
    drawBox(page, 0);
    EXPECT_EQ(page.body(),
              "<defs>\n<linearGradient id=\"g0\" gradientUnits=\"userSpaceOnUse\" x1=\"0\" "
              "y1=\"0\" x2=\"1\" y2=\"0\">\n"
              "<stop stop-color=\"red\" offset=\"0\" stop-opacity=\"1\"/>\n"
              "<stop stop-color=\"red\" offset=\"1\" stop-opacity=\"1\"/>\n"
              "</linearGradient>\n</defs>\n<g>\n" +
                  box("0") + "\n</g>");
}

TEST(DefinitionAbuse, AThousandNestedClipsLoseNothing) {
    SvgPage page;
    for (int i = 0; i < manyClips; ++i) {
        page->pushState();
        startClip(page);
        drawBox(page, 0);
        page->endClipDef();
        page->doClip();
        drawBox(page, 20);
    }
    for (int i = 0; i < manyClips; ++i) {
        page->popState();
    }
    drawBox(page, 40);
    EXPECT_EQ(findFault(page.document()), "");
    EXPECT_EQ(countOf(page.document(), "<clipPath "), manyClips);
    EXPECT_EQ(countOf(page.document(), "<rect "), 2 * manyClips + 1);
    EXPECT_NE(page.document().find("clip-path=\"url(#c999)\""), std::string::npos);
    EXPECT_TRUE(page.body().ends_with("</g>\n<g>\n" + box("40") + "\n</g>"));
}

TEST(DefinitionAbuse, AHundredThousandStopsAreWrittenWhole) {
    SvgPage page;
    startGradient(page);
    for (int i = 0; i < manyStops; ++i) {
        page->setStopColor(MoxColor(), static_cast<float>(i) / manyStops, 1);
    }
    page->endGradiant();
    drawBox(page, 0);
    EXPECT_EQ(findFault(page.document()), "");
    EXPECT_EQ(countOf(page.document(), "<stop "), manyStops);
    EXPECT_TRUE(page.body().ends_with("<g>\n" + box("0") + "\n</g>"));
}

TEST(DefinitionAbuse, DefinitionsNestedTwentyThousandDeepLoseNothing) {
    SvgPage page;
    for (int i = 0; i < manyDefinitions; ++i) {
        startMask(page);
        drawBox(page, 0);
    }
    for (int i = 0; i < manyDefinitions; ++i) {
        page->endMask();
    }
    drawBox(page, 20);
    EXPECT_EQ(findFault(page.document()), "");
    EXPECT_EQ(countOf(page.document(), "<mask "), manyDefinitions);
    EXPECT_EQ(countOf(page.document(), "<rect "), manyDefinitions + 1);
}

} // namespace
} // namespace DrawmereTest
