// Documents of the small-device mode, from the calls to the saved text.
#include "Drawmere.h"
#include "tests/support/SvgPage.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using namespace DrawmereNS;

/// What draws a page.
using Draw = void (*)(Drawmere& page);

std::string drawBody(SVGConfig::SVGTYPE profile, bool wispMode, Draw draw) {
    SvgPage page(profile);
    page.config.wispMode = wispMode;
    draw(page.drawmere);
    return page.body();
}

std::string drawSmall(Draw draw) {
    return drawBody(SVGConfig::SVGTYPE_TINY, /*wispMode=*/true, draw);
}

void drawLink(Drawmere& page) {
    page.startLink(u"#x", MoxName());
    page.drawRect(pt(1), pt(2), pt(3), pt(4), pt(0), pt(0), PAINTMODE_NONE);
    page.endLink();
}

void drawLetters(Drawmere& page) {
    page.setFillColor(MoxColor(255, 0, 0));
    page.drawText(u"ab", {pt(1), pt(2)}, {pt(3)}, {}, PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

TEST(SmallDevice, LinksAreGroups) {
    EXPECT_EQ(drawSmall(drawLink),
              "<g>\n<g>\n<rect x=\"1\" y=\"2\" width=\"3\" height=\"4\" fill=\"none\"/>\n</g>\n"
              "</g>");
}

TEST(SmallDevice, LettersAreTextsWithNumbersForColors) {
    EXPECT_EQ(drawSmall(drawLetters), "<g font-size=\"medium\" font-weight=\"400\">\n"
                                      "<text x=\"1\" y=\"3\" fill=\"#f00\">a</text>\n"
                                      "<text x=\"2\" y=\"3\" fill=\"#f00\">b</text>\n</g>");
}

TEST(SmallDevice, IsTinyWithTheFlagAndNothingElse) {
    for (const int number : {0, 1, 3, 4}) {
        const auto profile = static_cast<SVGConfig::SVGTYPE>(number);
        for (const Draw draw : {drawLink, drawLetters}) {
            EXPECT_EQ(drawBody(profile, true, draw), drawBody(profile, false, draw)) << number;
        }
    }
    EXPECT_NE(drawBody(SVGConfig::SVGTYPE_TINY, false, drawLink), drawSmall(drawLink));
    EXPECT_NE(drawBody(SVGConfig::SVGTYPE_TINY, false, drawLetters), drawSmall(drawLetters));
}

TEST(SmallDevice, TextWithOnlyOneCoordinateInTheTreeGetsBoth) {
    const std::string body = drawSmall([](Drawmere& page) {
        page.drawText(u"a", pt(0), pt(7), PAINTMODE_NONE, nullptr, /*wholeRun=*/true,
                      /*leftToRight=*/true);
    });
    EXPECT_NE(body.find("<text x=\"0\" y=\"7\" fill=\"none\">a</text>"), std::string::npos) << body;
}

// The anchor of a page is a text without coordinates, so the pass replaces it before its id becomes
// the final one.
TEST(SmallDevice, AnchorsOfPagesGetTheirFinalIds) {
    const auto draw = [](bool wispMode) {
        SvgPage page(SVGConfig::SVGTYPE_TINY);
        page.config.wispMode = wispMode;
        page.config.singleFile = true;
        page->startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(9), pt(9)));
        page->endPage();
        return page.body();
    };
    const std::string plain = draw(false);
    const std::string id = plain.substr(plain.find("id="));
    EXPECT_EQ(plain.find("Mox-SVG-page"), std::string::npos) << plain;
    const std::string small = draw(true);
    EXPECT_NE(small.find("<text x=\"0\" y=\"0\" " + id.substr(0, id.find_first_of("/>"))),
              std::string::npos)
        << small;
}

} // namespace
} // namespace DrawmereTest
