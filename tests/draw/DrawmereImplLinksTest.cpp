// Links and their destinations.
#include "draw/DrawmereImpl.h"
#include "tests/draw/FilteringImpl.h"

#include <gtest/gtest.h>
#include <limits>

namespace DrawmereTest {
namespace {

void drawDot(DrawmereImpl& impl) { impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE); }

constexpr char dot[] = "<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>";

/// Returns: the content of a document with one link.
std::string drawLink(const UnicodeString& href, const MoxName& show) {
    DrawnTree tree;
    tree.impl.startLink(href, show);
    tree.impl.endLink();
    return tree.content();
}

TEST(DrawmereImplLinks, HoldWhatIsDrawnUntilTheirEnd) {
    DrawnTree tree;
    drawDot(tree.impl);
    tree.impl.startLink(u"#a", MoxName());
    drawDot(tree.impl);
    tree.impl.endLink();
    drawDot(tree.impl);
    tree.impl.finishRootSvg();
    const std::string group = std::string("<g>\n") + dot + "\n</g>\n";
    EXPECT_EQ(tree.content(), group + "<a xlink:href=\"#a\">\n" + group + "</a>\n" + group);
}

TEST(DrawmereImplLinks, KeepTheirTargetAsItStands) {
    EXPECT_EQ(drawLink(u"", MoxName()), "<a xlink:href=\"\"/>\n");
    EXPECT_EQ(drawLink(u"Mox-SVG-page-3", MoxName()), "<a xlink:href=\"Mox-SVG-page-3\"/>\n");
    EXPECT_EQ(drawLink(u"a b?c&d\u00E9", MoxName()), "<a xlink:href=\"a b?c&amp;d\u00E9\"/>\n");
}

TEST(DrawmereImplLinks, OpenANewWindowForTheNameNewAlone) {
    const char* const newWindow = "<a xlink:href=\"u\" xlink:show=\"new\" target=\"_blank\"/>\n";
    EXPECT_EQ(drawLink(u"u", MoxName(MoxCommonNS::MOXNAME_NEW)), newWindow);
    EXPECT_EQ(drawLink(u"u", MoxName(u"new")), newWindow);
    for (const char16_t* const show : {u"replace", u"New", u"", u"embed"}) {
        EXPECT_EQ(drawLink(u"u", MoxName(show)), "<a xlink:href=\"u\"/>\n");
    }
}

TEST(DrawmereImplLinks, AnEndWithoutAStartDoesNothing) {
    DrawnTree tree;
    EXPECT_NO_THROW(tree.impl.endLink());
    drawDot(tree.impl);
    tree.impl.finishRootSvg();
    EXPECT_EQ(tree.content(), std::string("<g>\n") + dot + "\n</g>\n");
}

TEST(DrawmereImplLinks, AViewHasItsBoxBeforeItsId) {
    DrawnTree tree;
    tree.impl.setInternalView(u"v", 1, 2.5F, -3, 0.1F);
    EXPECT_EQ(tree.shape(), "<view viewBox=\"1 2.5 -3 0.1\" id=\"v\"/>");
}

TEST(DrawmereImplLinks, AnAnchorIsAnEmptyTextInAGroupThatIsMovedByYAlone) {
    // On purpose: the translation holds y alone, which SVG takes as the horizontal offset.
    DrawnTree tree;
    tree.impl.setInternalLinkAnchor(u"a", 10, 20);
    EXPECT_EQ(tree.shape(), "<g transform=\"translate(20)\">\n<text id=\"a\"/>\n</g>");
}

TEST(DrawmereImplLinks, DestinationsArePageContent) {
    DrawnTree tree;
    tree.impl.startLink(u"u", MoxName());
    tree.impl.setInternalLinkAnchor(u"a", 0, 0);
    tree.impl.setInternalView(u"v", 1, 2, 3, 4);
    drawDot(tree.impl);
    tree.impl.endLink();
    EXPECT_EQ(tree.content(), std::string("<a xlink:href=\"u\">\n<g>\n"
                                          "<g transform=\"translate(0)\">\n<text id=\"a\"/>\n</g>\n"
                                          "<view viewBox=\"1 2 3 4\" id=\"v\"/>\n") +
                                  dot + "\n</g>\n</a>\n");
}

TEST(DrawmereImplLinks, GoThroughTheFilterOfTheProfile) {
    DrawnTree<FilteringImpl> tree;
    tree.impl.told.clear();
    tree.impl.startLink(u"u", MoxName());
    tree.impl.setInternalView(u"v", 1, 2, 3, 4);
    tree.impl.setInternalLinkAnchor(u"a", 0, 0);
    tree.impl.endLink();
    EXPECT_EQ(tree.impl.told, "a direct current\nview\ng\n");
}

TEST(DrawmereImplLinks, ALinkInALinkStandsInTheRootBesideIt) {
    DrawnTree tree;
    tree.impl.startLink(u"outer", MoxName());
    tree.impl.startLink(u"inner", MoxName());
    tree.impl.endLink();
    drawDot(tree.impl);
    tree.impl.endLink();
    EXPECT_EQ(tree.content(), std::string("<a xlink:href=\"outer\">\n<g>\n") + dot +
                                  "\n</g>\n</a>\n<a xlink:href=\"inner\"/>\n");
}

TEST(DrawmereImplLinks, DestinationsOfNoFiniteNumbersAreWrittenWithZeros) {
    constexpr float infinite = std::numeric_limits<float>::infinity();
    DrawnTree tree;
    tree.impl.setInternalView(u"v", std::numeric_limits<float>::quiet_NaN(), infinite, 1, 2);
    tree.impl.setInternalLinkAnchor(u"a", 1, -infinite);
    tree.impl.finishRootSvg();
    EXPECT_NE(tree.content().find("viewBox=\"0 0 1 2\""), std::string::npos);
    EXPECT_NE(tree.content().find("transform=\"translate(0)\""), std::string::npos);
}

} // namespace
} // namespace DrawmereTest
