// One drawing in three profiles, into memory, plain and compressed, on several threads.

#include "Drawmere.h"

#include <array>
#include <cstdio>
#include <sstream>
#include <string>
#include <thread>

using namespace DrawmereNS;

namespace {

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

void draw(Drawmere& page) {
    const UnicodeString gradient = page.startLinearGradient(pt(0), pt(0), pt(100), pt(0),
                                                            SVGMatrix(), USERSPACEONUSE, GRADPAD);
    page.setStopColor(MoxColor(0xFF0000), 0, 1);
    page.setStopColor(MoxColor(0x0000FF), 1, 1);
    page.endGradiant();
    page.setFillColorId(gradient);
    page.setOpacity(0.5F, OPACITYDEST_ELEMENT);
    page.drawCircle(pt(50), pt(25), pt(20), PAINTMODE_FILL);
}

std::string write(SVGConfig& config) {
    std::ostringstream stream;
    SVGPageUri uri(u"memory.svg"); // names nothing here: the document goes to the stream
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(&stream);
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(100), pt(50)));
    drawmere.setCanvasSize(pt(100), pt(50));
    draw(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
    return stream.str();
}

std::string writeProfile(SVGConfig::SVGTYPE profile) {
    SVGConfig config; // `streamOutput` is true from the start
    config.svgType = profile;
    config.saveOption = u"indent";
    return write(config);
}

std::string writeCompressed() {
    SVGConfig config;
    config.gzip = true;
    return write(config);
}

} // namespace

int main() {
    std::array<std::string, 3> documents;
    std::thread full([&] { documents[0] = writeProfile(SVGConfig::SVGTYPE_FULL); });
    std::thread tiny([&] { documents[1] = writeProfile(SVGConfig::SVGTYPE_TINY); });
    std::thread gzip([&] { documents[2] = writeCompressed(); });
    full.join();
    tiny.join();
    gzip.join();
    std::printf("%s\n%s\n", documents[0].c_str(), documents[1].c_str());
    const bool isGzip = documents[2].starts_with("\x1F\x8B");
    std::printf("The third is %s.\n", isGzip ? "a gzip file" : "broken");
}
