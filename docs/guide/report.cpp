// Two linked pages with an embedded font and an image.

#include "Drawmere.h"
#include "foundation/records/TLFileImage.h"

#include <cstdio>
#include <string>

using namespace DrawmereNS;

namespace {

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

const MoxRectT<MoxLength> pageArea(pt(0), pt(0), pt(300), pt(200));

void setFont(Drawmere& page, float size) {
    SVGFont font;
    font.setFontAttribute(u"DejaVu Sans", pt(size), FONTWEIGHT_NORMAL, FSTYLE_NORMAL,
                          /*family=*/u"", /*familyOnly=*/false);
    font.setEmbedAttribute(/*embed=*/true, /*byGlyphIds=*/false);
    page.setFont(&font, /*extra=*/nullptr);
}

void drawText(Drawmere& page, const UnicodeString& text, float x, float y) {
    page.drawText(text, pt(x), pt(y), PAINTMODE_FILL, /*glyphs=*/nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

void drawImage(Drawmere& page, const UnicodeString& path) {
    TalGraphic::TLFileImage image(path);
    page.pushState();
    page.drawImage(&image, image.getGraphicType(), /*width=*/pt(100), /*height=*/pt(60),
                   /*x=*/pt(180), /*y=*/pt(20));
    page.popState();
}

void drawCover(Drawmere& page) {
    page.setFillColor(MoxColor(0x1F, 0x5F, 0x7A));
    setFont(page, 20);
    drawText(page, u"Lights", 20, 40);
    drawImage(page, u"picture.png");
    page.startLink(u"#heights", MoxName());
    setFont(page, 12);
    drawText(page, u"Heights", 20, 70);
    page.endLink();
}

void drawBar(Drawmere& page, float y, float length) {
    page.drawRect(pt(20), pt(y), pt(length), pt(14), pt(0), pt(0), PAINTMODE_FILL);
}

void drawHeights(Drawmere& page) {
    page.setInternalLinkAnchor(u"heights", 0, 0);
    page.setFillColor(MoxColor(0x1F, 0x5F, 0x7A)); // a new document has forgotten it
    setFont(page, 20);
    drawText(page, u"Heights", 20, 40);
    page.setFillColor(MoxColor(0xC9, 0x8A, 0x1B));
    drawBar(page, 60, 150);
    drawBar(page, 80, 220);
    page.startLink(u"report1.svg", MoxName());
    setFont(page, 12);
    drawText(page, u"Back", 20, 120);
    page.endLink();
}

using Draw = void (*)(Drawmere& page);

void writePage(Drawmere& drawmere, int number, Draw draw) {
    drawmere.initRootSvg(u"report.svg");
    drawmere.startPage(number, pageArea);
    drawmere.setCanvasSize(pageArea.x2, pageArea.y2);
    draw(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg();
}

void writeReport() {
    SVGConfig config;
    config.streamOutput = false;   // pages go to files
    config.saveOption = u"indent"; // for readers; leave it out for size
    SVGPageUri uri(u"report.svg");
    Drawmere drawmere(&config, &uri);
    writePage(drawmere, 1, drawCover);
    writePage(drawmere, 2, drawHeights);
    drawmere.finish();
    while (drawmere.hasError()) {
        std::printf("warning: %s\n", drawmere.popError().what());
    }
}

} // namespace

int main() {
    try {
        writeReport();
    } catch (const MoxError& error) {
        std::printf("error %d: %s\n", int{error.getCode()}, error.what());
        return 1;
    }
}
