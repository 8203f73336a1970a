// What each operation comes to in each profile.
#include "draw/SVGBasicImpl.h"
#include "draw/SVGFullImpl.h"
#include "draw/SVGPlazmicImpl.h"
#include "draw/SVGTinyImpl.h"
#include "draw/SVGWispImpl.h"
#include "foundation/records/TLGraphicImage.h"
#include "state/SVGGraphicContext.h"
#include "tests/draw/DrawnTree.h"
#include "tests/draw/QueuedErrors.h"

#include <gtest/gtest.h>

#include <array>
#include <memory>

namespace DrawmereTest {
namespace {

constexpr char same[] = "(as the base)";

/// Draws, and returns what the calls return.
using Action = std::string (*)(DrawmereImpl& impl);

struct Operation {
    const char* name;
    Action draw;
    /// What stands below the root, ids and errors, of the profiles in the order of `profileMakers`;
    /// `same` for what a plain `DrawmereImpl` writes for the full profile.
    std::array<const char*, 5> expected;
};

struct ProfileMaker {
    const char* name;
    SVGConfig::SVGTYPE number;
    std::unique_ptr<DrawmereImpl> (*make)(SVGConfig*);
};

template <typename Impl> std::unique_ptr<DrawmereImpl> make(SVGConfig* config) {
    return std::make_unique<Impl>(config);
}

constexpr ProfileMaker profileMakers[] = {
    {"Full", SVGConfig::SVGTYPE_FULL, make<SVGFullImpl>},
    {"Basic", SVGConfig::SVGTYPE_BASIC, make<SVGBasicImpl>},
    {"Tiny", SVGConfig::SVGTYPE_TINY, make<SVGTinyImpl>},
    {"Plazmic", SVGConfig::SVGTYPE_PLAZMIC, make<SVGPlazmicImpl>},
    {"Wisp", SVGConfig::SVGTYPE_WISP, make<SVGWispImpl>},
};

constexpr ProfileMaker base = {"Base", SVGConfig::SVGTYPE_FULL, make<DrawmereImpl>};

MoxPointT<MoxLength> point(float x, float y) { return {pt(x), pt(y)}; }

void drawSquare(DrawmereImpl& impl, float size = 10) {
    impl.drawRect(pt(0), pt(0), pt(size), pt(size), pt(0), pt(0), PAINTMODE_FILL);
}

std::string startMask(DrawmereImpl& impl) {
    return utf8(impl.startMask(pt(0), pt(0), pt(1), pt(1), USERSPACEONUSE, USERSPACEONUSE)) + "\n";
}

std::string startPattern(DrawmereImpl& impl) {
    const MoxRectT<MoxLength> area(pt(0), pt(0), pt(4), pt(4));
    return utf8(impl.startPattern(area, area, SVGMatrix(), USERSPACEONUSE, USERSPACEONUSE)) + "\n";
}

std::string fillGradient(DrawmereImpl& impl, const UnicodeString& id) {
    impl.setStopColor(MoxColor(255, 0, 0), 0, 1);
    impl.setStopColor(MoxColor(0, 0, 255), 1, 1);
    impl.endGradiant();
    impl.getGContext()->setFillColorId(id);
    drawSquare(impl);
    return utf8(id) + "\n";
}

/// An image that documents refer to, whatever is in it.
class PngFile : public TalGraphic::TLGraphicImage {
public:
    PngFile() : TLGraphicImage(u"a.png") {}

    TalGraphic::TLGraphicType getGraphicType() override { return TalGraphic::TLGRAPHICTYPE_PNG; }

    std::istream* getStream() override { return nullptr; }
};

void drawImage(DrawmereImpl& impl) {
    PngFile image;
    impl.config->setImageProcessingType(MoxName(u"link"));
    impl.drawImage(&image, pt(1), pt(2), pt(3), pt(4));
}

std::string drawClip(DrawmereImpl& impl) {
    drawSquare(impl);
    impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILL);
    impl.endClipDef();
    return "";
}

constexpr char tinyClip[] =
    "<defs/>\n"
    "16940 clipPath element is required. It is not supported with SVG Tiny.\n";

constexpr char rectClip[] = "<defs>\n<clipPath id=\"c0\">\n"
                            "<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\" "
                            "clip-rule=\"evenodd\"/>\n"
                            "</clipPath>\n</defs>\n";

constexpr char square[] =
    "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n";

const Operation operations[] = {
    {"drawRect",
     [](DrawmereImpl& impl) {
         impl.drawRect(pt(1), pt(2), pt(3), pt(4), pt(5), pt(6), PAINTMODE_FILLSTROKE);
         return std::string();
     },
     {same, same, same, same, same}},
    {"drawCircle",
     [](DrawmereImpl& impl) {
         impl.drawCircle(pt(1), pt(2), pt(40000), PAINTMODE_FILL);
         return std::string();
     },
     {same, same, same, same, same}},
    {"drawEllipse",
     [](DrawmereImpl& impl) {
         impl.drawEllipse(pt(1), pt(2), pt(3), pt(40000), PAINTMODE_FILL);
         return std::string();
     },
     {same, same, same, same, same}},
    {"drawLine",
     [](DrawmereImpl& impl) {
         impl.drawLine(pt(1), pt(2), pt(3), pt(40000), PAINTMODE_STROKE);
         return std::string();
     },
     {same, same, same, same, same}},
    {"paths",
     [](DrawmereImpl& impl) {
         impl.startPathData();
         impl.setPathMoveTo(point(1, 2));
         impl.setPathLineTo(point(40000, 4));
         impl.setPathCubicBezierCurveTo(point(1, 2), point(3, 4), point(5, 6));
         impl.ellipticalArcTo(1, 2, 3, false, true, 4.56F, 5, /*absolute=*/true);
         impl.closePath(/*absolute=*/true);
         impl.endPathData(PAINTMODE_FILL);
         return std::string();
     },
     {same, same, same, same, same}},
    {"contentOfPattern",
     [](DrawmereImpl& impl) {
         std::string id = startPattern(impl);
         drawSquare(impl);
         impl.endPattern();
         return id;
     },
     {same, same, "\n",
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n\n", same}},
    {"contentOfMask",
     [](DrawmereImpl& impl) {
         std::string id = startMask(impl);
         drawSquare(impl);
         impl.endMask();
         return id;
     },
     {same, same, "\n",
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n\n", same}},
    {"drawPoly",
     [](DrawmereImpl& impl) {
         float points[] = {40000, -40000};
         impl.drawPoly(points, 2, /*open=*/true, PAINTMODE_FILL);
         return std::to_string(points[0]) + "\n";
     },
     {same, "<g>\n<polyline fill=\"none\" points=\"32768,-32768 \"/>\n</g>\n32768.000000\n",
      "<g>\n<polyline fill=\"none\" points=\"32768,-32768 \"/>\n</g>\n32768.000000\n",
      "<g>\n<polyline fill=\"none\" points=\"32768,-32768 \"/>\n</g>\n32768.000000\n", same}},
    {"drawText",
     [](DrawmereImpl& impl) {
         impl.drawText(u"abc", {pt(1), pt(2), pt(3)}, {pt(4)}, {}, PAINTMODE_FILL, nullptr,
                       /*wholeRun=*/true, /*leftToRight=*/false);
         impl.drawText(u"d", pt(1), pt(2), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                       /*leftToRight=*/false);
         return std::string();
     },
     {same, same, same, same, same}},
    {"drawImage",
     [](DrawmereImpl& impl) {
         drawImage(impl);
         return std::string();
     },
     {same, same, same, same, same}},
    {"drawImageInPattern",
     [](DrawmereImpl& impl) {
         std::string id = startPattern(impl);
         drawImage(impl);
         impl.endPattern();
         return id;
     },
     {same, same, "\n", "\n", same}},
    {"startClipDef",
     [](DrawmereImpl& impl) {
         impl.startClipDef(OBJECTBOUNDINGBOX);
         impl.endClipDef();
         return std::string();
     },
     {same, same, tinyClip, same, same}},
    {"startClipRect",
     [](DrawmereImpl& impl) {
         impl.startClipRect(OBJECTBOUNDINGBOX);
         impl.endClipDef();
         return std::string();
     },
     {same, same, "<defs/>\n", same, same}},
    {"contentOfClipPath",
     [](DrawmereImpl& impl) {
         impl.startClipRect(USERSPACEONUSE);
         return drawClip(impl);
     },
     // The state of Wisp is that of Tiny: it writes no clip rule here, no clip path and no
     // reference to a paint below.
     {same, rectClip, "<defs/>\n", rectClip,
      "<defs>\n<clipPath id=\"c0\">\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" "
      "fill=\"none\"/>\n<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>\n</clipPath>\n</defs>\n"}},
    {"doClip",
     [](DrawmereImpl& impl) {
         impl.startClipRect(USERSPACEONUSE);
         drawSquare(impl);
         impl.endClipDef();
         impl.doClip();
         drawSquare(impl);
         return std::string();
     },
     {same, same,
      "<defs/>\n<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n",
      "<defs>\n<clipPath id=\"c0\">\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" "
      "fill=\"none\" clip-rule=\"evenodd\"/>\n</clipPath>\n</defs>\n"
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n",
      "<defs>\n<clipPath id=\"c0\">\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</clipPath>\n</defs>\n<g>\n<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n</g>\n"}},
    {"masks",
     [](DrawmereImpl& impl) {
         std::string ids = startMask(impl);
         impl.endMask();
         ids += startMask(impl);
         impl.endMask();
         drawSquare(impl);
         return ids;
     },
     {same, same,
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n\n\n",
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n\n\n", same}},
    {"patterns",
     [](DrawmereImpl& impl) {
         std::string ids = startPattern(impl);
         impl.endPattern();
         ids += startPattern(impl);
         impl.endPattern();
         drawSquare(impl);
         return ids;
     },
     {same, same,
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n\n\n",
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\n\n\n", same}},
    {"linearGradients",
     [](DrawmereImpl& impl) {
         return fillGradient(impl, impl.startLinearGradient(pt(0), pt(0), pt(1), pt(1), SVGMatrix(),
                                                            USERSPACEONUSE, GRADPAD));
     },
     {same, same,
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"#7f007f\"/>\n</g>\ng0\n",
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"url(#g0)\"/>\n</g>\ng0\n",
      "<defs>\n<linearGradient id=\"g0\" gradientUnits=\"userSpaceOnUse\" x1=\"0\" y1=\"0\" x2=\"1\" y2=\"1\">\n<stop stop-color=\"red\" offset=\"0\" stop-opacity=\"1\"/>\n<stop stop-color=\"#00f\" offset=\"1\" stop-opacity=\"1\"/>\n</linearGradient>\n</defs>\n<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\ng0\n"}},
    {"radialGradients",
     [](DrawmereImpl& impl) {
         return fillGradient(impl, impl.startRadialGradient(pt(0), pt(0), pt(1), pt(0), pt(0),
                                                            SVGMatrix(), USERSPACEONUSE, GRADPAD));
     },
     {same, same,
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"#7f007f\"/>\n</g>\ng0\n",
      "<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"url(#g0)\"/>\n</g>\ng0\n",
      "<defs>\n<radialGradient id=\"g0\" gradientUnits=\"userSpaceOnUse\" cx=\"0\" cy=\"0\" r=\"1\" fx=\"0\" fy=\"0\">\n<stop stop-color=\"red\" offset=\"0\" stop-opacity=\"1\"/>\n<stop stop-color=\"#00f\" offset=\"1\" stop-opacity=\"1\"/>\n</radialGradient>\n</defs>\n<g>\n<rect x=\"0\" y=\"0\" width=\"10\" height=\"10\" fill=\"none\"/>\n</g>\ng0\n"}},
    {"setInternalView",
     [](DrawmereImpl& impl) {
         impl.setInternalView(u"v", 1, 2, 3, 4);
         drawSquare(impl);
         return std::string();
     },
     {same, same, square, square, same}},
    {"setInternalLinkAnchor",
     [](DrawmereImpl& impl) {
         impl.setInternalLinkAnchor(u"v", 1, 2);
         return std::string();
     },
     {same, same, same, same, same}},
    {"links",
     [](DrawmereImpl& impl) {
         impl.startLink(u"#v", MoxName(MoxCommonNS::MOXNAME_NEW));
         drawSquare(impl);
         impl.endLink();
         return std::string();
     },
     {same, same, same, same, same}},
};

std::string draw(const ProfileMaker& profile, Action action) {
    SVGConfig config;
    config.svgType = profile.number;
    const std::unique_ptr<DrawmereImpl> impl = profile.make(&config);
    impl->initRootSvg();
    const std::string returned = action(*impl);
    impl->finishRootSvg();
    const SVGDocument& document = *impl->getDocument();
    std::string text;
    for (const MoxNode* child = document.getDocumentElement()->getFirstChild(); child;
         child = child->getNextSibling()) {
        text += toXml(document, child) + "\n";
    }
    return text + returned + takeErrors(config);
}

struct Cell {
    const Operation* operation;
    std::size_t profile;
};

std::vector<Cell> listCells() {
    std::vector<Cell> cells;
    for (const Operation& operation : operations) {
        for (std::size_t i = 0; i < std::size(profileMakers); ++i) {
            cells.push_back({&operation, i});
        }
    }
    return cells;
}

class OperationsByProfile : public testing::TestWithParam<Cell> {};

TEST_P(OperationsByProfile, ComeToWhatTheTableSays) {
    const auto [operation, profile] = GetParam();
    const std::string expected = operation->expected.at(profile);
    EXPECT_EQ(draw(profileMakers[profile], operation->draw),
              expected == same ? draw(base, operation->draw) : expected);
}

std::string nameCell(const testing::TestParamInfo<Cell>& cell) {
    return std::string(cell.param.operation->name) + "Under" +
           profileMakers[cell.param.profile].name;
}

INSTANTIATE_TEST_SUITE_P(Profiles, OperationsByProfile, testing::ValuesIn(listCells()), nameCell);

} // namespace
} // namespace DrawmereTest
