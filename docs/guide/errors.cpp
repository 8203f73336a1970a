// The three ways in which failures reach a caller.

#include "Drawmere.h"
#include "foundation/records/TLMemoryImage.h"

#include <cstdio>

using namespace DrawmereNS;

namespace {

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

void print(const char* way, const MoxError& error) {
    std::printf("%s %d: %s\n", way, int{error.getCode()}, error.what());
}

class Reporter : public DrawmereErrHandler {
public:
    using DrawmereErrHandler::handleError; // other exceptions are still thrown

    void handleError(const MoxError& error) override { print("handled", error); }
};

void drawBrokenImage(Drawmere& page) {
    TalGraphic::TLMemoryImage image("these bytes are no image");
    page.pushState();
    page.drawImage(&image, image.getGraphicType(), pt(10), pt(10), pt(0), pt(0));
    page.popState();
}

void popTooOften(Drawmere& page) {
    try {
        page.popState();
    } catch (const MoxError& error) {
        print("thrown", error);
    }
}

} // namespace

int main() {
    SVGConfig config;
    config.streamOutput = false;
    SVGPageUri uri(u"missing/page.svg"); // there is no such directory
    Drawmere drawmere(&config, &uri);
    Reporter reporter;
    drawmere.setErrorHandler(&reporter);
    drawmere.initRootSvg(uri.getText());
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(100), pt(100)));
    drawmere.setCanvasSize(pt(100), pt(100));
    drawBrokenImage(drawmere);
    popTooOften(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg(); // the handler is told that the file can't be made
    drawmere.finish();
    while (drawmere.hasError()) {
        print("queued", drawmere.popError());
    }
}
