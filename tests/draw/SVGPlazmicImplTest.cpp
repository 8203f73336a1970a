#include "draw/SVGPlazmicImpl.h"

#include "tests/draw/ProfileChecks.h"
#include "tests/support/XmlReader.h"

#include <limits>
#include <sstream>

namespace DrawmereTest {
namespace {

constexpr auto plazmic = SVGConfig::SVGTYPE_PLAZMIC;

struct PlazmicTree : DrawnTree<SVGPlazmicImpl> {
    PlazmicTree() : DrawnTree(plazmic) {}

    /// Returns: the document as the player gets it.
    std::string output(const UnicodeString& encoding = UnicodeString()) {
        std::ostringstream stream;
        impl.outputStream(impl.getDocument(), encoding, &stream, u"decimals=2");
        return stream.str();
    }
};

/// Returns: the transform of the root of a page of this size.
std::string transformOf(float width, float height) {
    PlazmicTree tree;
    tree.impl.setCanvasSize(pt(width), pt(height));
    return readXml(tree.output()).element("svg").attribute("transform");
}

TEST(SVGPlazmicImpl, HasTheDialectFullThoughItsCallsAreThoseOfTiny) {
    EXPECT_EQ(dialectOf<SVGPlazmicImpl>(), 0);
    SVGConfig config;
    const SVGPlazmicImpl impl(&config);
    EXPECT_NE(dynamic_cast<const SVGTinyImpl*>(&impl), nullptr);
}

TEST(SVGPlazmicImpl, LetsRectsAndClipPathsIntoAClipDefinition) {
    EXPECT_EQ(listClipContent<SVGPlazmicImpl>(plazmic), "clipPath rect");
}

TEST(SVGPlazmicImpl, ClampsCoordinatesAsBasicDoes) {
    float points[] = {40000, -40000};
    EXPECT_EQ(drawPoints<SVGPlazmicImpl>(points, 2),
              "<polyline fill=\"none\" points=\"32768,-32768 \"/>");
}

TEST(SVGPlazmicImpl, OutputFitsTheScreenOfThePlayer) {
    PlazmicTree tree;
    tree.impl.setCanvasSize(pt(480), pt(160));
    tree.root()->setAttribute(SVGName(SVGName::baseProfile), MoxValue(u"tiny"));
    EXPECT_EQ(tree.output(),
              "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
              "<!DOCTYPE svg SYSTEM \"http://www.example.com/dtd/1_0/svg.dtd\">\n"
              "<svg xmlns:xlink=\"http://www.w3.org/1999/xlink\" xml:space=\"preserve\" "
              "fill=\"#000\" fill-rule=\"evenodd\" font-style=\"normal\" font-weight=\"normal\" "
              "font-stretch=\"normal\" width=\"240\" height=\"160\" transform=\"scale(0.5)\"/>\n");
}

TEST(SVGPlazmicImpl, OutputKeepsTheProportionsOfThePage) {
    const struct {
        float width;
        float height;
        const char* transform;
    } rows[] = {
        {480, 160, "scale(0.5)"},  {120, 160, "scale(1)"},  {240, 160, "scale(1)"},
        {240, 640, "scale(0.25)"}, {24, 16, "scale(10)"},   {480, 480, "scale(0.3333333333333333)"},
        {24, 1, "scale(10)"},      {1, 1600, "scale(0.1)"},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(transformOf(row.width, row.height), row.transform);
    }
}

TEST(SVGPlazmicImpl, OutputReadsSizesInEveryForm) {
    PlazmicTree tree;
    tree.impl.setCanvasSize(pt(480), pt(480), MoxCommonNS::MOXUNIT_NONE);
    tree.root()->setAttribute(SVGName(SVGName::width), MoxValue(u"960pt"));
    EXPECT_EQ(readXml(tree.output()).element("svg").attribute("transform"), "scale(0.25)");
}

TEST(SVGPlazmicImpl, OutputOfAPageWithoutASizeIsNotScaled) {
    constexpr float infinite = std::numeric_limits<float>::infinity();
    EXPECT_EQ(readXml(PlazmicTree().output()).element("svg").attribute("transform"), "scale(1)");
    EXPECT_EQ(transformOf(0, 0), "scale(1)");
    EXPECT_EQ(transformOf(std::numeric_limits<float>::quiet_NaN(), 0), "scale(1)");
    EXPECT_EQ(transformOf(infinite, infinite), "scale(0)");
}

// On purpose: changes the tree as it writes, so a second writing finds the size of the screen and
// scales by 1.
TEST(SVGPlazmicImpl, SecondOutputScalesByOne) {
    PlazmicTree tree;
    tree.impl.setCanvasSize(pt(480), pt(160));
    tree.output();
    EXPECT_EQ(tree.rootAttribute(SVGName::width), "240");
    EXPECT_EQ(tree.rootAttribute(SVGName::version), "");
    EXPECT_EQ(readXml(tree.output()).element("svg").attribute("transform"), "scale(1)");
}

TEST(SVGPlazmicImpl, OutputHasTheEncodingAndOptionsOfTheCall) {
    PlazmicTree tree;
    tree.root()->setAttribute(SVGName(SVGName::stroke_width), MoxValue(1.2345F));
    const std::string text = tree.output(u"ISO-8859-1");
    EXPECT_NE(text.find("encoding=\"ISO-8859-1\""), std::string::npos);
    EXPECT_NE(text.find("stroke-width=\"1.23\""), std::string::npos);
}

TEST(SVGPlazmicImpl, OutputOfADocumentWithoutARootIsWrittenAsItIs) {
    SVGConfig config;
    SVGPlazmicImpl impl(&config);
    MoxPtr<MoxDocument> document(new SVGDocument);
    std::ostringstream stream;
    impl.outputStream(document.get(), UnicodeString(), &stream, UnicodeString());
    EXPECT_TRUE(stream.str().starts_with("<?xml"));
    impl.outputStream(nullptr, UnicodeString(), &stream, UnicodeString());
    impl.outputStream(document.get(), UnicodeString(), nullptr, UnicodeString());
}

TEST(SVGPlazmicImpl, OutputOfOthersIsTheDocumentAsItIs) {
    DrawnTree<SVGTinyImpl> tree(SVGConfig::SVGTYPE_TINY);
    std::ostringstream stream;
    tree.impl.outputStream(tree.impl.getDocument(), UnicodeString(), &stream, UnicodeString());
    EXPECT_EQ(readXml(stream.str()).doctype, "");
    EXPECT_EQ(readXml(stream.str()).element("svg").attribute("baseProfile"), "tiny");
}

} // namespace
} // namespace DrawmereTest
