#include "post/QuilletExtention.h"

#include "tests/post/Quillet.h"
#include "tests/post/ReadTree.h"
#include "tests/support/Utf8.h"

namespace DrawmereTest {
namespace {

using TextCoordVector = QuilletExtention::TextCoordVector;
using Images = std::map<UnicodeString, MoxElement*>;

std::string withoutLinks(const std::string& xml) {
    return pass(&QuilletExtention::removeAElement, xml);
}

std::string withSplitTexts(const std::string& xml) {
    return pass(&QuilletExtention::textCoordinate, xml);
}

std::string withSpeltColors(const std::string& xml) {
    return pass(&QuilletExtention::setRGBColor, xml);
}

// Links.

TEST(QuilletExtention, LinkBecomesAGroupWithItsTransformAndItsElements) {
    EXPECT_EQ(withoutLinks("<svg><a xlink:href=\"#x\" id=\"i\" transform=\"scale(2)\" "
                           "xlink:show=\"new\"><rect x=\"1\"/><text>b</text></a><line/></svg>"),
              "<svg><g transform=\"scale(2)\"><rect x=\"1\"/><text>b</text></g><line/></svg>");
}

TEST(QuilletExtention, LinkWithoutATransformBecomesAGroupWithoutOne) {
    EXPECT_EQ(withoutLinks("<svg><a xlink:href=\"#x\"><rect/></a></svg>"),
              "<svg><g><rect/></g></svg>");
}

TEST(QuilletExtention, EmptyLinkBecomesAnEmptyGroup) {
    EXPECT_EQ(withoutLinks("<svg><a/><a/></svg>"), "<svg><g/><g/></svg>");
}

TEST(QuilletExtention, TextDirectlyInALinkIsLost) {
    EXPECT_EQ(withoutLinks("<svg><a>one<rect/>two<line/>three</a></svg>"),
              "<svg><g><rect/><line/></g></svg>");
}

TEST(QuilletExtention, LinkInALinkBecomesAGroupToo) {
    EXPECT_EQ(withoutLinks("<svg><a><a transform=\"scale(2)\"><g><a/></g></a></a><a/></svg>"),
              "<svg><g><g transform=\"scale(2)\"><g><g/></g></g></g><g/></svg>");
}

TEST(QuilletExtention, LinkBehindATextIsFound) {
    EXPECT_EQ(withoutLinks("<svg><g/>text<a/></svg>"), "<svg><g/>text<g/></svg>");
}

TEST(QuilletExtention, LinksInDefinitionsStay) {
    EXPECT_EQ(withoutLinks("<svg><defs><a/></defs><g><defs><g><a/></g></defs></g><a/></svg>"),
              "<svg><defs><a/></defs><g><defs><g><a/></g></defs></g><g/></svg>");
    EXPECT_EQ(withoutLinks("<defs><a/></defs>"), "<defs><a/></defs>");
}

TEST(QuilletExtention, LinkThatIsTheRootStays) {
    EXPECT_EQ(withoutLinks("<a><a/></a>"), "<a><g/></a>");
}

// Coordinates of texts.

std::string listTokens(const std::vector<UnicodeString>& list) {
    std::string text;
    for (const UnicodeString& token : list) {
        text += "[" + utf8(token) + "]";
    }
    return text;
}

TEST(QuilletExtention, CoordinatesAreCutAtEveryBlank) {
    const struct {
        const char16_t* text;
        const char* tokens;
    } rows[] = {
        {u"", "[0]"},          {u"1", "[1]"},     {u"1 2 3", "[1][2][3]"},
        {u"1  2", "[1][][2]"}, {u"1 ", "[1]"},    {u" 1", "[][1]"},
        {u" ", "[]"},          {u"1,2", "[1,2]"}, {u"1\t2", "[1\t2]"},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(listTokens(TextCoordVector(row.text, u"").xList), row.tokens);
        EXPECT_EQ(listTokens(TextCoordVector(u"", row.text).yList), row.tokens);
    }
}

TEST(QuilletExtention, CoordinatesReplaceWhatTheListHeld) {
    TextCoordVector points(u"1 2", u"");
    points.setCoord(u"3", &points.xList);
    EXPECT_EQ(listTokens(points.xList), "[3]");
    points.setCoord(u"3", nullptr);
}

TEST(QuilletExtention, ShorterListRepeatsItsLastToken) {
    const TextCoordVector points(u"1 2 3", u"7");
    EXPECT_EQ(points.size(), 3);
    EXPECT_EQ(utf8(points.getX(1) + u"," + points.getY(1)), "2,7");
    EXPECT_EQ(utf8(points.getX(9) + u"," + points.getY(9)), "3,7");
    EXPECT_EQ(TextCoordVector(u"1", u"1 2").size(), 2);
    EXPECT_EQ(utf8(points.getX(-1)), "1");
}

TEST(QuilletExtention, PointIsSingleWhenBothCoordinatesAreGivenOnce) {
    EXPECT_TRUE(TextCoordVector(u"1", u"2").isSinglePoint);
    EXPECT_FALSE(TextCoordVector(u"1", u"").isSinglePoint);
    EXPECT_FALSE(TextCoordVector(u"", u"2").isSinglePoint);
    EXPECT_FALSE(TextCoordVector(u"", u"").isSinglePoint);
    EXPECT_FALSE(TextCoordVector(u"1 2", u"2").isSinglePoint);
    EXPECT_FALSE(TextCoordVector(u"1", u"2 3").isSinglePoint);
}

TEST(QuilletExtention, TextWithOnePointStays) {
    const std::string text =
        "<svg><text id=\"a\" x=\"1\" rotate=\"0\" y=\"2\">abc<tspan>d</tspan></text></svg>";
    EXPECT_EQ(withSplitTexts(text), text);
}

TEST(QuilletExtention, TextWithoutACoordinateGetsBoth) {
    EXPECT_EQ(withSplitTexts("<svg><text fill=\"red\" y=\"2\">abc</text></svg>"),
              "<svg><text x=\"0\" y=\"2\" fill=\"red\">abc</text></svg>");
    EXPECT_EQ(withSplitTexts("<svg><text x=\"2\">abc</text></svg>"),
              "<svg><text x=\"2\" y=\"0\">abc</text></svg>");
    EXPECT_EQ(withSplitTexts("<svg><g><text id=\"p\"/></g><line/></svg>"),
              "<svg><g><text x=\"0\" y=\"0\" id=\"p\"></text></g><line/></svg>");
}

TEST(QuilletExtention, TextWithoutACoordinateKeepsItsWholeRotation) {
    EXPECT_EQ(withSplitTexts("<svg><text x=\"2\" rotate=\"30 60\">ab</text></svg>"),
              "<svg><text x=\"2\" y=\"0\" rotate=\"30 60\">ab</text></svg>");
    EXPECT_EQ(withSplitTexts("<svg><text x=\"2\" rotate=\"0\">ab</text></svg>"),
              "<svg><text x=\"2\" y=\"0\">ab</text></svg>");
}

TEST(QuilletExtention, PositionedCharactersBecomeTextsOfTheirOwn) {
    EXPECT_EQ(withSplitTexts("<svg><text id=\"i\" x=\"1 2 3\" y=\"9\" fill=\"red\">abc</text>"
                             "<line/></svg>"),
              "<svg><text x=\"1\" y=\"9\" id=\"i\" fill=\"red\">a</text>"
              "<text x=\"2\" y=\"9\" id=\"i\" fill=\"red\">b</text>"
              "<text x=\"3\" y=\"9\" id=\"i\" fill=\"red\">c</text><line/></svg>");
}

TEST(QuilletExtention, CharactersBeyondThePositionsRepeatTheLast) {
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1 2 3\" y=\"5\">abcde</text></svg>"),
              "<svg><text x=\"1\" y=\"5\">a</text><text x=\"2\" y=\"5\">b</text>"
              "<text x=\"3\" y=\"5\">c</text><text x=\"3\" y=\"5\">d</text>"
              "<text x=\"3\" y=\"5\">e</text></svg>");
}

TEST(QuilletExtention, SparePositionsHaveNoEffect) {
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1 2 3\" y=\"5\">a</text></svg>"),
              "<svg><text x=\"1\" y=\"5\">a</text></svg>");
}

TEST(QuilletExtention, EmptyTextWithPositionsIsRemoved) {
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1 2\"/><line/></svg>"), "<svg><line/></svg>");
}

TEST(QuilletExtention, DoubledBlankGivesAnEmptyCoordinate) {
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1  2\" y=\"5\">ab</text></svg>"),
              "<svg><text x=\"1\" y=\"5\">a</text><text x=\"\" y=\"5\">b</text></svg>");
}

TEST(QuilletExtention, RotationsGoWithTheirCharactersAndZeroIsNotWritten) {
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1 2 3\" y=\"5\" rotate=\"30,0 -9\">abc</text></svg>"),
              "<svg><text x=\"1\" y=\"5\" rotate=\"30\">a</text><text x=\"2\" y=\"5\">b</text>"
              "<text x=\"3\" y=\"5\" rotate=\"-9\">c</text></svg>");
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1 2\" y=\"5\" rotate=\"\">ab</text></svg>"),
              "<svg><text x=\"1\" y=\"5\">a</text><text x=\"2\" y=\"5\">b</text></svg>");
}

TEST(QuilletExtention, OfTooFewRotationsTheLastRepeats) {
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1 2\" y=\"5\" rotate=\"30\">ab</text></svg>"),
              "<svg><text x=\"1\" y=\"5\" rotate=\"30\">a</text>"
              "<text x=\"2\" y=\"5\" rotate=\"30\">b</text></svg>");
}

TEST(QuilletExtention, ElementsInASplitTextAreLostAndItsTextsJoined) {
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1 2\" y=\"5\">a<tspan>b</tspan>c</text></svg>"),
              "<svg><text x=\"1\" y=\"5\">a</text><text x=\"2\" y=\"5\">c</text></svg>");
    EXPECT_EQ(withSplitTexts("<svg><text x=\"1\">a<tspan>b</tspan>c</text></svg>"),
              "<svg><text x=\"1\" y=\"0\">ac</text></svg>");
}

// On purpose: units, not characters, so a surrogate pair becomes two texts.
TEST(QuilletExtention, SurrogatePairBecomesTwoTexts) {
    const MoxPtr<SVGDocument> document =
        readTree("<svg><text x=\"1 2\" y=\"5\">\U0001F600</text></svg>");
    MoxElement* const root = document->getDocumentElement();
    makeQuillet().textCoordinate(root);
    const MoxNode* const first = root->getFirstChild();
    EXPECT_EQ(first->getFirstChild()->getText(), UnicodeString(char16_t(0xD83D)));
    EXPECT_EQ(first->getNextSibling()->getFirstChild()->getText(), UnicodeString(char16_t(0xDE00)));
}

TEST(QuilletExtention, TextsInDefinitionsStay) {
    const std::string text = "<svg><defs><g><text>a</text></g></defs></svg>";
    EXPECT_EQ(withSplitTexts(text), text);
    EXPECT_EQ(withSplitTexts("<defs><text/></defs>"), "<defs><text/></defs>");
}

TEST(QuilletExtention, TextThatIsTheRootStays) {
    EXPECT_EQ(withSplitTexts("<text>a</text>"), "<text>a</text>");
}

TEST(QuilletExtention, TextWithoutADocumentStays) {
    MoxPtr<MoxElement> root;
    {
        const MoxPtr<SVGDocument> document = readTree("<svg><text>a</text></svg>");
        root = document->getDocumentElement();
    }
    QuilletExtention quillet = makeQuillet();
    MoxElement* const text = MoxCommonNS::narrow<MoxElement>(root->getFirstChild());
    EXPECT_EQ(quillet.createSplitTextNode(u"1", u"2", u"0", u"a", text), nullptr);
    EXPECT_EQ(quillet.createSplitTextNode(u"1", u"2", u"0", u"a", nullptr), nullptr);
    quillet.optimizeQuillet(root.get());
    EXPECT_EQ(root->getFirstChild(), text);
}

TEST(QuilletExtention, SplitTextHasItsValuesFirstAndTheOtherAttributesBehind) {
    const MoxPtr<SVGDocument> document =
        readTree("<text id=\"i\" rotate=\"7\" x=\"8\" fill=\"red\" y=\"9\">old</text>");
    const MoxPtr<MoxElement> split =
        makeQuillet().createSplitTextNode(u"1", u"2", u"3", u"new", document->getDocumentElement());
    document->replaceChild(split.get(), document->getDocumentElement());
    EXPECT_EQ(writeTree(*document),
              "<text x=\"1\" y=\"2\" rotate=\"3\" id=\"i\" fill=\"red\">new</text>");
}

// Colours.

TEST(QuilletExtention, PaintsAreSpeltOutAsNumbers) {
    const struct {
        const char* before;
        const char* after;
    } rows[] = {
        {"red", "#f00"},
        {"#FF0000", "#f00"},
        {"#123456", "#123456"},
        {"lightsalmon", "#ffa07a"},
        {"rgb(1,2,3)", "#010203"},
        {"none", "none"},
        {"transparent", "transparent"},
        {"url(#g0)", "url(#g0)"},
        {"nonsense", "nonsense"},
        {"", ""},
        {"None", "None"},
    };

    for (const auto& row : rows) {
        const auto make = [](const std::string& paint) {
            std::string rect = "<rect fill=\"";
            return rect.append(paint).append("\" x=\"1\" stroke=\"").append(paint).append("\"/>");
        };
        EXPECT_EQ(withSpeltColors(make(row.before)), make(row.after)) << row.before;
    }
}

TEST(QuilletExtention, OnlyPaintsOfPaintableElementsAreSpeltOut) {
    EXPECT_EQ(withSpeltColors("<svg fill=\"red\"><g stroke=\"red\"><circle fill=\"red\"/>"
                              "<ellipse fill=\"red\"/><line stroke=\"red\"/><path fill=\"red\"/>"
                              "<polygon fill=\"red\"/><polyline fill=\"red\"/><rect color=\"red\"/>"
                              "<text fill=\"red\">red</text><image fill=\"red\"/></g></svg>"),
              "<svg fill=\"red\"><g stroke=\"red\"><circle fill=\"#f00\"/>"
              "<ellipse fill=\"#f00\"/><line stroke=\"#f00\"/><path fill=\"#f00\"/>"
              "<polygon fill=\"#f00\"/><polyline fill=\"#f00\"/><rect color=\"red\"/>"
              "<text fill=\"#f00\">red</text><image fill=\"red\"/></g></svg>");
}

TEST(QuilletExtention, PaintsInDefinitionsAndInPaintedElementsAreSpeltOutToo) {
    EXPECT_EQ(withSpeltColors("<svg><defs><rect fill=\"red\"/></defs>"
                              "<text><rect fill=\"red\"/></text></svg>"),
              "<svg><defs><rect fill=\"#f00\"/></defs><text><rect fill=\"#f00\"/></text></svg>");
}

TEST(QuilletExtention, PaintThatIsAColorBecomesAText) {
    const MoxPtr<SVGDocument> document = readTree("<rect/>");
    MoxElement* const rect = document->getDocumentElement();
    rect->setAttribute(toName("fill"), MoxValue(MoxColor(255, 0, 0)));
    makeQuillet().setRGBColor(rect);
    EXPECT_EQ(rect->getAttribute(toName("fill")), MoxValue(u"#f00"));
}

TEST(QuilletExtention, WhatIsPaintableIsTheMakersChoice) {
    const MoxPtr<SVGDocument> document =
        readTree("<g fill=\"red\" color=\"red\"><rect fill=\"red\"/></g>");
    QuilletExtention quillet;
    quillet.setRGBColor(document->getDocumentElement());
    quillet.paintableElements = {toName("g")};
    quillet.paintAttributes = {toName("color")};
    quillet.setRGBColor(document->getDocumentElement());
    EXPECT_EQ(writeTree(*document), "<g fill=\"red\" color=\"#f00\"><rect fill=\"red\"/></g>");
}

// All of it.

TEST(QuilletExtention, PassesRunOneAfterTheOther) {
    EXPECT_EQ(pass(&QuilletExtention::optimizeQuillet,
                   rootTag + "<defs>" + twoImages + "</defs><a transform=\"scale(2)\">" +
                       frame("#i0") + "<text x=\"1 2\" y=\"3\" fill=\"red\">ab</text></a></svg>"),
              rootTag + "<g transform=\"scale(2)\">" + placed("data:0") +
                  "<text x=\"1\" y=\"3\" fill=\"#f00\">a</text>"
                  "<text x=\"2\" y=\"3\" fill=\"#f00\">b</text></g></svg>");
}

TEST(QuilletExtention, NullsAreIgnored) {
    QuilletExtention quillet = makeQuillet();
    Images images;
    quillet.optimizeQuillet(nullptr);
    quillet.execEmbedDirect(nullptr, images);
}

TEST(QuilletExtention, DeepTreeIsNoMatterOfTheStack) {
    const MoxPtr<SVGDocument> document = readTree(rootTag + "<defs>" + twoImages + "</defs></svg>");
    MoxNode* deepest = document->getDocumentElement();
    for (int i = 0; i < 200000; ++i) {
        deepest = deepest->appendChild(document->createElement(toName(i % 2 ? "a" : "g")).get());
    }
    deepest->appendChild(document->createElement(toName("text")).get());
    makeQuillet().optimizeQuillet(document->getDocumentElement());
    EXPECT_EQ(deepest->getLocalName(), toName("g"));
    EXPECT_TRUE(
        MoxCommonNS::narrow<MoxElement>(deepest->getFirstChild())->hasAttribute(toName("x")));
}

} // namespace
} // namespace DrawmereTest
