// Where each form of link leads in a browser, those that can't arrive among them.
#include "foundation/common/MoxNameTable.h"
#include "tests/browser/Clicks.h"
#include "tests/frontend/RunFiles.h"
#include "tests/support/Command.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

/// A run in which each page says its number.
struct ReadableRun : RunFiles {
    void drawLine(const UnicodeString& text, float y) {
        drawmere.drawText(text, pt(5), pt(y), PAINTMODE_FILL, nullptr, true, true);
    }

    void beginPage(int number) {
        drawmere.startPage(number, MoxRectT<MoxLength>(pt(0), pt(0), pt(100), pt(100)));
        drawmere.setCanvasSize(pt(100), pt(100));
        drawmere.setFillColor(MoxColor()); // text without a paint can't be clicked
        drawLine(u"Page " + UnicodeString::fromUTF8(std::to_string(number)), 20);
    }

    void drawLink(const UnicodeString& target, const MoxName& show = MoxName(), float y = 50) {
        drawmere.startLink(target, show);
        drawLine(u"link", y);
        drawmere.endLink();
    }

    void endDocument() {
        drawmere.endPage();
        drawmere.finishRootSvg();
    }

    /// Draws a page with an anchor, "anchor1" on page 1, a view, "view1", and perhaps a link.
    void drawReadablePage(int number, const UnicodeString& link = UnicodeString()) {
        const UnicodeString digits = UnicodeString::fromUTF8(std::to_string(number));
        open();
        beginPage(number);
        drawmere.setInternalLinkAnchor(u"anchor" + digits, 0, 0);
        drawmere.setInternalView(u"view" + digits, 0, 0, 50, 25);
        if (!link.isEmpty()) {
            drawLink(link);
        }
        endDocument();
    }

    /// Clicks the first link of `file`.
    Click click(const std::string& file) const {
        const std::vector<Click> clicks = followLinks(directory.path(file), {"0"});
        EXPECT_EQ(clicks.size(), 1U);
        return clicks.empty() ? Click() : clicks.front();
    }
};

/// Clicks the link of page 1 of two pages.
Click followFromFirst(const UnicodeString& link) {
    ReadableRun run;
    run.drawReadablePage(1, link);
    run.drawReadablePage(2);
    run.drawmere.finish();
    return run.click("out1.svg");
}

/// Clicks the link of page 2 of two pages.
Click followFromLast(const UnicodeString& link) {
    ReadableRun run;
    run.drawReadablePage(1);
    run.drawReadablePage(2, link);
    run.drawmere.finish();
    return run.click("out2.svg");
}

TEST(LinkForms, AForwardLinkArrivesAtThePageOfItsDestination) {
    for (const char16_t* const link : {u"#anchor2", u"#view2"}) {
        const Click click = followFromFirst(link);
        EXPECT_EQ(click.where, "out2.svg"); // at its top, not at the place itself
        EXPECT_TRUE(click.sees("Page 2"));
        EXPECT_FALSE(click.inNewWindow);
    }
}

TEST(LinkForms, ABackwardLinkOfAPageThatWaitsArrives) {
    ReadableRun run;
    run.drawReadablePage(1);
    run.open();
    run.beginPage(2);
    run.drawLink(u"#anchor1");
    run.drawLink(u"#anchor3", MoxName(), 80);
    run.endDocument();
    run.drawReadablePage(3);
    run.drawmere.finish();
    const Click click = run.click("out2.svg");
    EXPECT_EQ(click.where, "out1.svg");
    EXPECT_TRUE(click.sees("Page 1"));
}

// On purpose: a page without open links is written as it stands.
TEST(LinkForms, ABackwardLinkOfAPageThatIsWrittenAtOnceStaysOnIt) {
    const Click click = followFromLast(u"#anchor1");
    EXPECT_EQ(click.where, "out2.svg#anchor1");
    EXPECT_TRUE(click.sees("Page 2"));
}

TEST(LinkForms, ALinkToAViewOfItsOwnPageShowsTheView) {
    for (const Click& click : {followFromFirst(u"#view1"), followFromLast(u"#view2")}) {
        EXPECT_TRUE(click.where == "out1.svg#view1" || click.where == "out2.svg#view2");
        EXPECT_GT(click.scale, 2.6); // twice as large as the page itself
    }
}

TEST(LinkForms, ALinkToAnAnchorOfItsOwnPageStaysOnIt) {
    const Click click = followFromFirst(u"#anchor1");
    EXPECT_EQ(click.where, "out1.svg#anchor1");
    EXPECT_TRUE(click.sees("Page 1"));
}

TEST(LinkForms, ALinkThatNamesTheFileArrivesAndMayNameAViewToo) {
    EXPECT_TRUE(followFromLast(u"out1.svg").sees("Page 1"));
    const Click click = followFromLast(u"out1.svg#view1");
    EXPECT_EQ(click.where, "out1.svg#view1");
    EXPECT_GT(click.scale, 2.6);
}

// On purpose: a link by page number keeps the mark of the page, and there is no such file.
TEST(LinkForms, ALinkByPageNumberLeadsNowhere) {
    EXPECT_EQ(followFromFirst(u"Mox-SVG-page-2").where, "nowhere");
}

TEST(LinkForms, ALinkToWhatIsDeclaredNowhereStaysOnItsPage) {
    const Click click = followFromFirst(u"#nowhere");
    EXPECT_EQ(click.where, "out1.svg#nowhere");
    EXPECT_TRUE(click.sees("Page 1"));
}

TEST(LinkForms, ALinkThatShowsANewWindowOpensOne) {
    ReadableRun run;
    run.drawReadablePage(1);
    run.open();
    run.beginPage(2);
    run.drawLink(u"out1.svg", MoxName(MoxCommonNS::MOXNAME_NEW));
    run.endDocument();
    const Click click = run.click("out2.svg");
    EXPECT_TRUE(click.inNewWindow);
    EXPECT_TRUE(click.sees("Page 1"));
}

// In one document a page can be reached by a view alone: its anchors are empty texts, to which a
// browser doesn't go.
TEST(LinkForms, InOneDocumentALinkToAViewArrivesAndOneToAnAnchorDoesNot) {
    for (const bool toView : {true, false}) {
        ReadableRun run;
        run.config.singleFile = true;
        run.open();
        run.beginPage(1);
        run.drawLink(toView ? u"#view2" : u"#p2");
        run.drawmere.endPage();
        run.drawmere.pushState();
        run.drawmere.setTransMatrix(SVGMatrix(1, 0, 0, 1, 0, 2000));
        run.beginPage(2);
        run.drawmere.setInternalView(u"view2", 0, 2000, 100, 100);
        run.drawmere.popState();
        run.endDocument();
        run.drawmere.finish();
        const Click click = run.click("out.svg");
        EXPECT_EQ(click.where, toView ? "out.svg#view2" : "out.svg#p2");
        EXPECT_EQ(click.sees("Page 2"), toView);
        EXPECT_EQ(click.sees("Page 1"), !toView);
    }
}

} // namespace
} // namespace DrawmereTest
