#include "Drawmere.h"

using namespace DrawmereNS;

int main() {
    SVGConfig config;
    config.streamOutput = false; // pages go to files, not to a stream
    SVGPageUri uri(u"hello.svg");
    Drawmere drawmere(&config, &uri);

    const auto pt = [](float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); };
    drawmere.initRootSvg(u"hello.svg");
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(200), pt(100)));
    drawmere.setCanvasSize(pt(200), pt(100));
    drawmere.setFillColor(MoxColor(200, 30, 30));
    drawmere.drawRect(pt(20), pt(20), pt(160), pt(60), pt(8), pt(8), PAINTMODE_FILL);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}
