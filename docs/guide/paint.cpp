// Clips, masks, patterns and gradients on one page.

#include "Drawmere.h"

using namespace DrawmereNS;

namespace {

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

void fillSquare(Drawmere& page, float x) {
    page.drawRect(pt(x), pt(10), pt(60), pt(60), pt(0), pt(0), PAINTMODE_FILL);
}

MoxPointT<MoxLength> point(float x, float y) { return {pt(x), pt(y)}; }

void drawLeaf(Drawmere& page, PAINTMODE mode) {
    page.startPathData();
    page.setPathMoveTo(point(10, 70));
    page.setPathCubicBezierCurveTo(point(10, 30), point(30, 10), point(70, 10));
    page.setPathCubicBezierCurveTo(point(70, 50), point(50, 70), point(10, 70));
    page.setPathClosepath();
    page.endPathData(mode);
}

void drawClip(Drawmere& page) {
    page.pushState();
    page.startClipDef(USERSPACEONUSE);
    drawLeaf(page, PAINTMODE_FILL);
    page.endClipDef();
    page.doClip();
    page.setFillColor(MoxColor(0x1F5F7A));
    fillSquare(page, 10);
    page.popState();
}

void drawMask(Drawmere& page) {
    const UnicodeString mask =
        page.startMask(pt(80), pt(10), pt(60), pt(60), USERSPACEONUSE, USERSPACEONUSE);
    page.setFillColor(MoxColor(0x808080)); // half of white: half of what is masked shows
    fillSquare(page, 80);
    page.endMask();
    page.pushState();
    page.setMaskReference(mask);
    page.setFillColor(MoxColor(0x1F5F7A));
    fillSquare(page, 80);
    page.popState();
}

void drawPattern(Drawmere& page) {
    const MoxRectT<MoxLength> tile(pt(0), pt(0), pt(10), pt(10));
    const UnicodeString pattern =
        page.startPattern(tile, tile, SVGMatrix(), USERSPACEONUSE, USERSPACEONUSE);
    page.setFillColor(MoxColor(0xB5382A));
    page.drawCircle(pt(5), pt(5), pt(3), PAINTMODE_FILL);
    page.endPattern();
    page.setFillColorId(pattern);
    fillSquare(page, 150);
}

void drawGradient(Drawmere& page) {
    const UnicodeString gradient = page.startLinearGradient(pt(220), pt(0), pt(280), pt(0),
                                                            SVGMatrix(), USERSPACEONUSE, GRADPAD);
    page.setStopColor(MoxColor(0xFFFFFF), /*offset=*/0, /*opacity=*/1);
    page.setStopColor(MoxColor(0x1F5F7A), /*offset=*/1, /*opacity=*/1);
    page.endGradiant();
    page.setFillColorId(gradient);
    fillSquare(page, 220);
}

} // namespace

int main() {
    SVGConfig config;
    config.streamOutput = false;
    config.saveOption = u"indent";
    SVGPageUri uri(u"paint.svg");
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(u"paint.svg");
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(290), pt(80)));
    drawmere.setCanvasSize(pt(290), pt(80));
    drawClip(drawmere);
    drawMask(drawmere);
    drawPattern(drawmere);
    drawGradient(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}
