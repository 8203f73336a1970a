#include "draw/DrawmereImpl.h"
#include "foundation/common/MoxNameEnum.h"
#include "foundation/records/TLStringWithGlyphInfo.h"
#include "state/SVGGroupManager.h"
#include "tests/support/Golden.h"
#include "tests/support/Utf8.h"
#include "tests/support/XmlReader.h"

#include <cmath>
#include <limits>

namespace DrawmereTest {
namespace {

using namespace DrawmereNS;

constexpr float largest = std::numeric_limits<float>::max();
constexpr float infinite = std::numeric_limits<float>::infinity();
constexpr float undefined = std::numeric_limits<float>::quiet_NaN();

std::vector<MoxLength> lengthsOf(const std::vector<float>& numbers) {
    std::vector<MoxLength> lengths;
    lengths.reserve(numbers.size());
    for (const float number : numbers) {
        lengths.push_back(pt(number));
    }
    return lengths;
}

std::string lengthText(const std::vector<MoxLength>& positions) {
    SVGConfig config;
    return utf8(DrawmereImpl(&config).makePositionAttributeString(positions));
}

std::string positionText(const std::vector<float>& numbers) {
    return lengthText(lengthsOf(numbers));
}

void drawText(SvgPage& page, const UnicodeString& text, float x = 10, float y = 20) {
    page->drawText(text, pt(x), pt(y), PAINTMODE_FILL, nullptr, false, true);
}

void drawPlaced(SvgPage& page, const UnicodeString& text, const std::vector<float>& x,
                const std::vector<float>& y, const std::vector<float>& rotation = {}) {
    page->drawText(text, lengthsOf(x), lengthsOf(y), rotation, PAINTMODE_FILL, nullptr, false,
                   true);
}

void drawBox(SvgPage& page, float x) {
    page->drawRect(pt(x), pt(10), pt(20), pt(20), pt(0), pt(0), PAINTMODE_FILL);
}

void setFont(SvgPage& page, const UnicodeString& name, float size, FONTWEIGHT weight,
             FSTYLE style = FSTYLE_NORMAL) {
    SVGFont font;
    font.setFontAttribute(name, pt(size), weight, style, name, true);
    page->setFont(&font, nullptr);
}

/// Returns: what a reader gets for the drawn text, behind the fault when the document has one.
std::string readBack(const UnicodeString& text) {
    SvgPage page;
    drawText(page, text);
    const XmlReading reading = readXml(page.document());
    return reading.error + reading.text();
}

TEST(DrawmereImplText, PositionsThatAreAllTheSameAreOneNumber) {
    EXPECT_EQ(positionText({10}), "10");
    EXPECT_EQ(positionText({10, 10, 10}), "10");
    EXPECT_EQ(positionText({-0.5F, -0.5F}), "-.5");
    EXPECT_EQ(positionText({0.001F}), "0");
    EXPECT_EQ(positionText({12.34567F}), "12.346");
}

TEST(DrawmereImplText, PositionsThatAreAllZeroAreNone) {
    EXPECT_EQ(positionText({0}), "");
    EXPECT_EQ(positionText({0, 0}), "");
    EXPECT_EQ(positionText({-0.0F, 0, -0.0F}), "");
    EXPECT_EQ(positionText({}), "");
}

TEST(DrawmereImplText, OtherPositionsAreAllWrittenWithABlankBetween) {
    EXPECT_EQ(positionText({0, 5}), "0 5");
    EXPECT_EQ(positionText({5, 0}), "5 0");
    EXPECT_EQ(positionText({10, 10, 11}), "10 10 11");
    EXPECT_EQ(positionText({1.5F, -0.25F, 100}), "1.5 -.25 100");
    EXPECT_EQ(positionText({10, std::nextafter(10.0F, 11.0F)}), "10 10");
}

TEST(DrawmereImplText, APositionThatIsNoNumberIsLikeNoOther) {
    EXPECT_EQ(positionText({undefined}), "0");
    EXPECT_EQ(positionText({undefined, undefined}), "0 0");
    EXPECT_EQ(positionText({5, undefined}), "5 0");
    EXPECT_EQ(positionText({5, 5, undefined}), "5 5 0");
}

TEST(DrawmereImplText, PositionsThatAreNotFiniteAreZeroAndTheLargestKeepTheirDigits) {
    EXPECT_EQ(positionText({infinite, infinite}), "0");
    EXPECT_EQ(positionText({infinite, -infinite}), "0 0");
    EXPECT_EQ(positionText({-largest}), "-340282346638528859811704183484516925440");
}

TEST(DrawmereImplText, PositionsAreWrittenInPoints) {
    const MoxLength inch(1, MoxCommonNS::MOXUNIT_INCH);
    const MoxLength millimetre(1, MoxCommonNS::MOXUNIT_MM);
    EXPECT_EQ(lengthText({inch, millimetre}), "72 2.835");
}

TEST(DrawmereImplText, ARunIsOneElementWithItsPositionAndItsText) {
    SvgPage page;
    setFont(page, u"Courier", 12, FONTWEIGHT_NORMAL);
    drawText(page, u"Plain words", 10.25F, -0.5F);
    drawPlaced(page, u"abc", {10, 20, 30.5F}, {40, 40, 40});
    EXPECT_GOLDEN(page, "text/runs");
}

TEST(DrawmereImplText, AnEmptyTextLeavesTheTreeAndTheOpenGroupAsTheyWere) {
    SvgPage page;
    setFont(page, u"Courier", 12, FONTWEIGHT_NORMAL);
    drawBox(page, 0);
    drawText(page, u"");
    drawPlaced(page, u"", {1, 2}, {3, 4});
    EXPECT_EQ(page.drawmere.impl->groupManager->font.fontSize, FONTSIZE_MEDIUM);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "text/empty");
}

TEST(DrawmereImplText, ATextAtTheOriginHasNoPosition) {
    SvgPage page;
    drawText(page, u"origin", 0, 0);
    drawText(page, u"below", 0, 5);
    drawText(page, u"beside", 5, 0);
    drawPlaced(page, u"ab", {0, 0}, {0, 5});
    EXPECT_GOLDEN(page, "text/origin");
}

// On purpose: rotations are taken and never written. A rotated run comes through the matrix.
TEST(DrawmereImplText, RotationsOfAnyKindChangeNothing) {
    SvgPage plain;
    drawPlaced(plain, u"abc", {1, 2, 3}, {4});
    for (const std::vector<float>& rotation :
         {std::vector<float>{0}, {90}, {10, 20, 30}, {1, 2, 3, 4, 5}, {undefined, infinite}}) {
        SvgPage rotated;
        drawPlaced(rotated, u"abc", {1, 2, 3}, {4}, rotation);
        EXPECT_EQ(rotated.document(), plain.document());
    }
}

TEST(DrawmereImplText, TheFormWithOnePositionIsTheFormWithLists) {
    SVGConfig config;
    std::string documents[2];
    for (std::string& document : documents) {
        DrawmereImpl impl(&config);
        impl.initRootSvg();
        if (&document == documents) {
            impl.drawText(u"abc", pt(1.5F), pt(2), PAINTMODE_STROKE, nullptr, true, false);
        } else {
            impl.drawText(u"abc", lengthsOf({1.5F}), lengthsOf({2}), {}, PAINTMODE_STROKE, nullptr,
                          true, false);
        }
        impl.finishRootSvg();
        std::ostringstream stream;
        impl.outputStream(impl.getDocument(), u"", &stream, u"");
        document = stream.str();
    }
    EXPECT_NE(documents[0].find("<text x=\"1.5\" y=\"2\" direction=\"rtl\""), std::string::npos);
    EXPECT_EQ(documents[0], documents[1]);
}

TEST(DrawmereImplText, ATextFromRightToLeftSaysSoAndKeepsItsOrder) {
    SvgPage page;
    page->drawText(u"\u05d0\u05d1 12", pt(10), pt(20), PAINTMODE_FILL, nullptr, false, false);
    EXPECT_GOLDEN(page, "text/right-to-left");
}

TEST(DrawmereImplText, BlanksReachTheDocumentUnchanged) {
    EXPECT_EQ(readBack(u"  two  and   three "), "  two  and   three ");
    EXPECT_EQ(readBack(u" "), " ");
    EXPECT_EQ(readBack(u"\u00a0x\u2003"), "\u00a0x\u2003");
    SvgPage page;
    drawText(page, u"  a  b ");
    EXPECT_NE(page.rootTag().find("xml:space=\"preserve\""), std::string::npos);
    EXPECT_NE(page.body().find(">  a  b </text>"), std::string::npos);
}

TEST(DrawmereImplText, MarkupIsText) {
    EXPECT_EQ(readBack(u"<a b=\"c\">&amp;'</a>]]>"), "<a b=\"c\">&amp;'</a>]]>");
}

TEST(DrawmereImplText, TabsLineFeedsAndCharactersBeyondTheBasicPlaneStay) {
    EXPECT_EQ(readBack(u"a\tb\nc"), "a\tb\nc");
    EXPECT_EQ(readBack(u"\U0001F600\U0010FFFD"), "\U0001F600\U0010FFFD");
}

TEST(DrawmereImplText, LoneSurrogatesAndForbiddenCharactersAreReplaced) {
    const char16_t lone[] = {u'a', 0xD83D, u'b', 0xDE00, u'c', 0xDE00, 0xD83D, u'd', 0xD83D};
    EXPECT_EQ(readBack(UnicodeString(lone, 9)), "a\uFFFDb\uFFFDc\uFFFD\uFFFDd\uFFFD");
    const char16_t control[] = {u'a', 0, 1, 8, 11, 12, 27, 31, u'b', 0xFFFE, 0xFFFF, u'c'};
    EXPECT_EQ(readBack(UnicodeString(control, 12)),
              "a\uFFFD\uFFFD\uFFFD\uFFFD\uFFFD\uFFFD\uFFFDb\uFFFD\uFFFDc");
}

TEST(DrawmereImplText, PositionListsMayBeShorterOrLongerThanTheText) {
    SvgPage page;
    drawPlaced(page, u"four", {1, 2}, {3, 4, 5});
    drawPlaced(page, u"a", {1, 2, 3}, {4, 5});
    drawPlaced(page, u"none", {}, {});
    drawPlaced(page, u"one", {}, {7});
    EXPECT_GOLDEN(page, "text/lists-of-other-lengths");
}

TEST(DrawmereImplText, AListOfAHundredThousandPositionsIsWrittenWhole) {
    constexpr std::size_t many = 100'000;
    std::vector<float> positions(many, -largest);
    positions[0] = 0;
    SvgPage page;
    drawPlaced(page, UnicodeString(many, u'x', many), positions, {5});
    const XmlReading reading = readXml(page.document());
    EXPECT_EQ(reading.error, "");
    EXPECT_EQ(reading.element("text").attribute("x").size(), 1U + 41U * (many - 1));
    EXPECT_EQ(reading.text().size(), many);
}

// On purpose: a text gets its paint when it stands in its group already, so the paint follows what
// the state wrote. Shapes have it before.
TEST(DrawmereImplText, ThePaintStandsBehindTheAttributesOfTheState) {
    SvgPage page;
    page->setStrokeColor(MoxColor(0, 0, 255));
    page->setFillColor(MoxColor(255, 0, 0));
    page->setFillRule(FILLRULE_NONZERO);
    page->setWordSpacing(pt(2));
    page->setTextAnchor(TEXTANCHOR_MIDDLE);
    page->setTextDecoration(TEXTDECORATION_UNDERLINE);
    page->setTransMatrix(SVGMatrix(0, 1, -1, 0, 5, 6));
    page->drawText(u"abc", pt(1), pt(2), PAINTMODE_FILLSTROKE, nullptr, false, true);
    EXPECT_GOLDEN(page, "text/paint-behind-state");
}

TEST(DrawmereImplText, TheModeDecidesThePaint) {
    SvgPage page;
    page->setStrokeColor(MoxColor(0, 0, 255));
    page->setFillColor(MoxColor(255, 0, 0));
    for (const PAINTMODE mode :
         {PAINTMODE_NONE, PAINTMODE_FILL, PAINTMODE_STROKE, PAINTMODE_FILLSTROKE}) {
        page->drawText(u"abc", pt(1), pt(2), mode, nullptr, false, true);
    }
    EXPECT_GOLDEN(page, "text/modes");
}

TEST(DrawmereImplText, EachTextHasItsFontOnAGroupOfItsOwn) {
    SvgPage page;
    setFont(page, u"Courier", 12, FONTWEIGHT_NORMAL);
    drawText(page, u"first", 10, 10);
    drawText(page, u"same font", 10, 20);
    setFont(page, u"Times New Roman", 9.5F, FONTWEIGHT_BOLD, FSTYLE_ITALIC);
    drawText(page, u"other font", 10, 30);
    drawBox(page, 40);
    drawText(page, u"behind a shape", 10, 50);
    EXPECT_NE(page.rootTag().find("font-family=\"Courier\""), std::string::npos);
    EXPECT_GOLDEN(page, "text/fonts-on-groups");
}

TEST(DrawmereImplText, TextsOfSizeZeroInOneFontShareAGroup) {
    SvgPage page;
    SVGFont font;
    font.setFontAttribute(u"Courier", pt(0), FONTWEIGHT_NORMAL, FSTYLE_NORMAL, u"", false);
    font.setFontAdjust(pt(0));
    font.setFontStretch(static_cast<FONTSTRECH>(0));
    page->setFont(&font, nullptr);
    drawText(page, u"first", 10, 10);
    drawText(page, u"second", 10, 20);
    drawText(page, u"third", 10, 30);
    EXPECT_GOLDEN(page, "text/size-zero");
}

TEST(DrawmereImplText, VerticalTextSaysSo) {
    SvgPage page;
    page->setWritingMode(MoxCommonNS::MOXNAME_TB_RL);
    drawText(page, u"\u7e26\u66f8");
    EXPECT_GOLDEN(page, "text/vertical");
}

TEST(DrawmereImplText, TinyWritesNoWordSpacingDecorationOrWritingMode) {
    SvgPage page(SVGConfig::SVGTYPE_TINY);
    setFont(page, u"Courier", 12, FONTWEIGHT_BOLD);
    page->setWordSpacing(pt(2));
    page->setTextDecoration(TEXTDECORATION_UNDERLINE);
    page->setWritingMode(MoxCommonNS::MOXNAME_TB_RL);
    page->setTextAnchor(TEXTANCHOR_END);
    drawText(page, u"abc");
    EXPECT_GOLDEN(page, "text/tiny");
}

TEST(DrawmereImplText, GlyphsOfAFontThatIsNotCarriedChangeNothing) {
    SvgPage plain;
    drawText(plain, u"abc");
    TalFont::TLStringWithGlyphInfo glyphs({{3, 7}, {0, 9}});
    for (const bool wholeRun : {false, true}) {
        SvgPage page;
        page->drawText(u"abc", pt(10), pt(20), PAINTMODE_FILL, &glyphs, wholeRun, true);
        EXPECT_EQ(page.document(), plain.document());
    }
}

TEST(DrawmereImplText, ATextInALinkStaysInTheLink) {
    SvgPage page;
    page->startLink(u"other.svg", MoxName());
    drawText(page, u"inside");
    page->endLink();
    drawText(page, u"outside");
    EXPECT_GOLDEN(page, "text/in-link");
}

TEST(DrawmereImplText, AHundredThousandTextsAreWrittenWhole) {
    constexpr std::size_t many = 100'000;
    SvgPage page;
    for (std::size_t i = 0; i < many; ++i) {
        drawText(page, u"word");
    }
    const XmlReading reading = readXml(page.document());
    EXPECT_EQ(reading.error, "");
    EXPECT_EQ(reading.text().size(), 4 * many);
}

} // namespace
} // namespace DrawmereTest
