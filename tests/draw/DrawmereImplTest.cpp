// The frame of a document: canvas, states, paint, its end.
#include "draw/DrawmereImpl.h"

#include "DrawmereErrHandler.h"
#include "fonts/SVGFontManager.h"
#include "state/SVGGManager.h"
#include "state/SVGGraphicContext.h"
#include "tests/draw/DrawnTree.h"
#include "tree/SVGTreeManager.h"

#include <gtest/gtest.h>
#include <limits>

namespace DrawmereTest {
namespace {

using MoxCommonNS::MOXUNIT_CM;
using MoxCommonNS::MOXUNIT_INCH;
using MoxCommonNS::MOXUNIT_MM;
using MoxCommonNS::MOXUNIT_PICA;
using MoxCommonNS::MOXUNIT_POINT;

TEST(DrawmereImpl, StartsWithOneSavedStateAndScaleAndNoPath) {
    SVGConfig config;
    const DrawmereImpl impl(&config);
    const auto* manager = dynamic_cast<SVGGManager*>(impl.groupManager);
    ASSERT_NE(manager, nullptr);
    ASSERT_EQ(manager->contextStack.size(), 1U);
    EXPECT_EQ(manager->contextStack.back()->getType(), ELEMENT_TYPE_NONE);
    EXPECT_EQ(manager->scaleStack, std::deque<float>{1.0F});
    EXPECT_EQ(manager->treeManager, impl.treeManager);
    EXPECT_EQ(impl.savedGroupManager, nullptr);
    EXPECT_EQ(utf8(impl.clipPathId), "");
    EXPECT_FALSE(impl.inClipDef);
    EXPECT_EQ(impl.config, &config);
    EXPECT_NE(impl.refIdManager, nullptr);
    EXPECT_EQ(impl.fontManager->treeManager, impl.treeManager);
}

TEST(DrawmereImpl, TheStateInForceIsThatOfTheManagerInPlace) {
    DrawnTree tree;
    EXPECT_EQ(tree.impl.getGContext(), tree.impl.groupManager->getGContext());
    SVGGManager other(&tree.config);
    SVGGroupManager* const own = tree.impl.groupManager;
    tree.impl.groupManager = &other;
    EXPECT_EQ(tree.impl.getGContext(), other.getGContext());
    tree.impl.groupManager = own;
}

TEST(DrawmereImpl, TheDocumentIsThatOfTheTreeAndOutlivesIt) {
    MoxPtr<SVGDocument> document;
    {
        DrawnTree tree;
        EXPECT_EQ(tree.impl.getDocument(), tree.impl.treeManager->document.get());
        document = tree.impl.getDocument();
    }
    EXPECT_NE(document->getDocumentElement(), nullptr);
}

TEST(DrawmereImpl, TheRootHasTheVersionOfTheConfiguration) {
    SVGConfig config;
    config.svgVersion = u"1.2";
    DrawmereImpl impl(&config);
    impl.initRootSvg();
    EXPECT_EQ(utf8(impl.getDocument()
                       ->getDocumentElement()
                       ->getAttribute(SVGName(SVGName::version))
                       .toString()),
              "1.2");
}

TEST(DrawmereImpl, AHandlerChangesNothing) {
    DrawnTree tree;
    tree.impl.setErrorHandler(DrawmereErrHandler::getDefault());
    EXPECT_THROW(tree.impl.popState(ELEMENT_TYPE_PLAIN), MoxError);
}

// The canvas.

TEST(DrawmereImplCanvas, IsWrittenInPointsWithAUnitAndAViewBoxWithout) {
    DrawnTree tree;
    tree.impl.setCanvasSize(pt(595.25F), pt(842));
    EXPECT_EQ(tree.rootAttribute(SVGName::width), "595.25pt");
    EXPECT_EQ(tree.rootAttribute(SVGName::height), "842pt");
    EXPECT_EQ(tree.rootAttribute(SVGName::viewBox), "0 0 595.25 842");
    EXPECT_EQ(tree.root()->getAttribute(SVGName(SVGName::width)).getType(),
              MoxCommonNS::MOXVALUE_LENGTH);
}

TEST(DrawmereImplCanvas, IsWrittenInTheUnitAskedForAndTheViewBoxInPoints) {
    const struct {
        int unit;
        const char* width;
        const char* height;
    } rows[] = {
        {MOXUNIT_CM, "2.54cm", "5.08cm"},
        {MOXUNIT_MM, "25.4mm", "50.8mm"},
        {MOXUNIT_INCH, "1in", "2in"},
        {MOXUNIT_POINT, "72pt", "144pt"},
        {MOXUNIT_PICA, "6pc", "12pc"},
        {0, "72", "144"},
        {5, "72", "144"},
        {11, "72", "144"},
        {-1, "72", "144"},
    };

    for (const auto& row : rows) {
        DrawnTree tree;
        tree.impl.setCanvasSize(pt(72), pt(144), static_cast<MoxUnitType>(row.unit));
        EXPECT_EQ(tree.rootAttribute(SVGName::width), row.width) << row.unit;
        EXPECT_EQ(tree.rootAttribute(SVGName::height), row.height) << row.unit;
        EXPECT_EQ(tree.rootAttribute(SVGName::viewBox), "0 0 72 144") << row.unit;
    }
}

TEST(DrawmereImplCanvas, OfNoFiniteSizeIsWrittenAsZero) {
    constexpr float infinite = std::numeric_limits<float>::infinity();
    DrawnTree tree;
    tree.impl.setCanvasSize(pt(std::numeric_limits<float>::quiet_NaN()), pt(infinite));
    EXPECT_EQ(tree.rootAttribute(SVGName::width), "0pt");
    EXPECT_EQ(tree.rootAttribute(SVGName::viewBox), "0 0 0 0");
    tree.impl.setCanvasSize(pt(-infinite), pt(2), MOXUNIT_CM);
    EXPECT_EQ(tree.rootAttribute(SVGName::width), "0cm");
    EXPECT_EQ(tree.rootAttribute(SVGName::viewBox), "0 0 0 2");
}

TEST(DrawmereImplCanvas, CanBeSetAgain) {
    DrawnTree tree;
    tree.impl.setCanvasSize(pt(72), pt(144), MOXUNIT_INCH);
    tree.impl.setCanvasSize(pt(10), pt(20));
    EXPECT_EQ(tree.rootAttribute(SVGName::width), "10pt");
    EXPECT_EQ(tree.rootAttribute(SVGName::viewBox), "0 0 10 20");
}

TEST(DrawmereImplCanvas, IsIgnoredBeforeThereIsARoot) {
    SVGConfig config;
    DrawmereImpl impl(&config);
    impl.setCanvasSize(pt(1), pt(2));
    impl.setCanvasSize(pt(1), pt(2), MOXUNIT_CM);
    impl.setComment();
    impl.initRootSvg();
    EXPECT_FALSE(impl.getDocument()->getDocumentElement()->hasAttribute(SVGName(SVGName::width)));
}

// States.

TEST(DrawmereImplStates, AnEndOfALinkWithNothingSavedSetsTheDefaultFont) {
    DrawnTree tree;
    SVGFont font;
    font.setFontAttribute(u"Serif", pt(12), 700, FSTYLE_NORMAL, u"", false);
    tree.impl.getGContext()->setFont(font);
    tree.impl.endLink();
    EXPECT_EQ(utf8(tree.impl.getGContext()->getFont()->fontName), "");
    EXPECT_EQ(tree.impl.getGContext()->getFont()->fontWeight, 400);
}

TEST(DrawmereImplStates, AreSavedWithTheFontAndTakenBackWithIt) {
    DrawnTree tree;
    SVGFont font;
    font.fontName = u"First";
    tree.impl.getGContext()->setFont(font);
    tree.impl.pushState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_PLAIN);
    font.fontName = u"Second";
    tree.impl.getGContext()->setFont(font);
    tree.impl.popState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(utf8(tree.impl.getGContext()->getFont()->fontName), "First");
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_NONE);
}

TEST(DrawmereImplStates, ATypedStateTakesBackTheDefaultFont) {
    // On purpose: the font is saved after the defaults are set.
    DrawnTree tree;
    SVGFont font;
    font.fontName = u"First";
    tree.impl.getGContext()->setFont(font);
    tree.impl.pushState(ELEMENT_TYPE_MASK);
    tree.impl.popState(ELEMENT_TYPE_MASK);
    EXPECT_EQ(utf8(tree.impl.getGContext()->getFont()->fontName), "");
}

TEST(DrawmereImplStates, ATypedStateStandsInDefsAndAPopLeavesIt) {
    DrawnTree tree;
    tree.impl.pushState(ELEMENT_TYPE_PATTERN);
    tree.impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE);
    tree.impl.popState(ELEMENT_TYPE_PATTERN);
    tree.impl.drawCircle(pt(4), pt(5), pt(6), PAINTMODE_NONE);
    tree.impl.finishRootSvg();
    EXPECT_EQ(tree.content(), "<defs>\n<g>\n<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>\n"
                              "</g>\n</defs>\n"
                              "<g>\n<circle cx=\"4\" cy=\"5\" r=\"6\" fill=\"none\"/>\n</g>\n");
}

TEST(DrawmereImplStates, AScaleIsSavedWithThem) {
    DrawnTree tree;
    tree.impl.setScale(2);
    tree.impl.pushState(ELEMENT_TYPE_PLAIN);
    tree.impl.setScale(3);
    EXPECT_EQ(tree.impl.groupManager->getScale(), 3);
    tree.impl.popState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(tree.impl.groupManager->getScale(), 2);
}

// Paint.

/// Returns: the attributes that the paint of `mode` writes on a new element.
template <typename Setup> std::string paint(int mode, Setup setup) {
    DrawnTree tree;
    setup(tree);
    const MoxPtr<SVGElement> rect = tree.make(SVGName::rect);
    tree.impl.setPaintAttr(rect.get(), static_cast<PAINTMODE>(mode));
    return toXml(*tree.impl.getDocument(), rect.get());
}

void setRedAndBlue(DrawnTree<>& tree) {
    tree.impl.getGContext()->setFillColor(MoxColor(255, 0, 0));
    tree.impl.getGContext()->setStrokeColor(MoxColor(0, 0, 255));
}

TEST(DrawmereImplPaint, FollowsTheBitsOfTheMode) {
    EXPECT_EQ(paint(0, setRedAndBlue), "<rect fill=\"none\"/>");
    EXPECT_EQ(paint(1, setRedAndBlue), "<rect fill=\"red\"/>");
    EXPECT_EQ(paint(2, setRedAndBlue), "<rect stroke=\"#00f\" fill=\"none\"/>");
    EXPECT_EQ(paint(3, setRedAndBlue), "<rect stroke=\"#00f\" fill=\"red\"/>");
    EXPECT_EQ(paint(4, setRedAndBlue), "<rect fill=\"none\"/>");
    EXPECT_EQ(paint(7, setRedAndBlue), "<rect stroke=\"#00f\" fill=\"red\"/>");
}

TEST(DrawmereImplPaint, OfNothingSetIsNone) {
    EXPECT_EQ(paint(3, [](DrawnTree<>&) {}), "<rect fill=\"none\"/>");
}

TEST(DrawmereImplPaint, LeavesOutWhatTheRootSays) {
    EXPECT_EQ(paint(1,
                    [](DrawnTree<>& tree) {
                        tree.impl.getGContext()->setFillColor(MoxColor());
                        tree.impl.getGContext()->setFillRule(FILLRULE_EVENODD);
                    }),
              "<rect/>");
}

TEST(DrawmereImplPaint, WritesAFillRuleOtherThanTheRootsOnFillsAlone) {
    const auto nonzero = [](DrawnTree<>& tree) {
        setRedAndBlue(tree);
        tree.impl.getGContext()->setFillRule(FILLRULE_NONZERO);
    };
    EXPECT_EQ(paint(1, nonzero), "<rect fill=\"red\" fill-rule=\"nonzero\"/>");
    EXPECT_EQ(paint(2, nonzero), "<rect stroke=\"#00f\" fill=\"none\"/>");
}

TEST(DrawmereImplPaint, ComparesWithTheDefaultColourAsTheConfigurationWritesIt) {
    const auto black = [](DrawnTree<>& tree) {
        tree.config.colorFlag = false;
        tree.impl.getGContext()->setFillColor(MoxColor());
    };
    EXPECT_EQ(paint(1, black), "<rect/>");
    EXPECT_EQ(
        paint(1, [](DrawnTree<>& tree) { tree.impl.getGContext()->setFillColorName(u"black"); }),
        "<rect fill=\"black\"/>");
}

TEST(DrawmereImplPaint, AnEmptyStrokeIsNone) {
    EXPECT_EQ(paint(2, [](DrawnTree<>& tree) { tree.impl.getGContext()->setStrokeColorName(u""); }),
              "<rect fill=\"none\"/>");
}

TEST(DrawmereImplPaint, InAClipDefinitionFillIsNoneWhateverTheMode) {
    for (const int mode : {0, 1, 2, 3}) {
        EXPECT_EQ(paint(mode,
                        [](DrawnTree<>& tree) {
                            setRedAndBlue(tree);
                            tree.impl.inClipDef = true;
                        }),
                  "<rect fill=\"none\"/>");
    }
}

TEST(DrawmereImplPaint, InAClipDefinitionAFillThatIsThereStays) {
    DrawnTree tree;
    tree.impl.inClipDef = true;
    const MoxPtr<SVGElement> rect = tree.make(SVGName::rect);
    rect->setSVGAttribute(SVGName::fill, u"green");
    tree.impl.setPaintAttr(rect.get(), PAINTMODE_FILLSTROKE);
    EXPECT_EQ(toXml(*tree.impl.getDocument(), rect.get()), "<rect fill=\"green\"/>");
}

// Writing for a caller outside.

TEST(DrawmereImplOutput, IsThatOfTheDocumentWithTheOptions) {
    DrawnTree tree;
    tree.impl.drawCircle(pt(1.26F), pt(2), pt(3), PAINTMODE_NONE);
    tree.impl.finishRootSvg();
    std::ostringstream stream;
    tree.impl.outputStream(tree.impl.getDocument(), u"UTF-16BE", &stream, u"decimals=1");
    const std::string bytes = stream.str();
    const auto text = UnicodeString(bytes.data(), static_cast<int>(bytes.size()), "UTF-16BE");
    EXPECT_NE(text.indexOf(u"<circle cx=\"1.3\" cy=\"2\" r=\"3\""), -1) << utf8(text);
    EXPECT_EQ(text.indexOf(u"DOCTYPE"), -1);
}

TEST(DrawmereImplOutput, IgnoresNulls) {
    DrawnTree tree;
    std::ostringstream stream;
    tree.impl.outputStream(nullptr, UnicodeString(), &stream, UnicodeString());
    tree.impl.outputStream(tree.impl.getDocument(), UnicodeString(), nullptr, UnicodeString());
    EXPECT_EQ(stream.str(), "");
}

// The end of a document.

TEST(DrawmereImplFinish, ClosesTheGroupAndRemovesEmptyOnes) {
    DrawnTree tree;
    tree.root()->appendChild(tree.make(SVGName::g).get());
    tree.impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE);
    EXPECT_EQ(tree.content(), "<g/>\n");
    tree.impl.finishRootSvg();
    EXPECT_EQ(tree.content(), "<g>\n<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>\n</g>\n");
}

} // namespace
} // namespace DrawmereTest
