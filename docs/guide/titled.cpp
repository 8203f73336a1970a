// A chart with a language, a title and a description, and with titles of its parts.

#include "Drawmere.h"
#include "draw/DrawmereImpl.h"

using namespace DrawmereNS;

namespace {

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

void putFirst(MoxNode& parent, SVGDocument& document, SVGName name, const UnicodeString& text) {
    const MoxPtr<SVGElement> element = document.createSVGElement(name);
    element->appendChildText(text);
    parent.insertBefore(element.get(), parent.getFirstChild());
}

void titleDocument(SVGDocument& document) {
    MoxElement& root = *document.getDocumentElement();
    root.setAttribute(MoxName(u"xml:lang"), u"en");
    putFirst(root, document, SVGName::desc, u"Two bars: 150 in spring, 220 in autumn.");
    putFirst(root, document, SVGName::title, u"Lamps sold"); // now ahead of the description
}

void titleLast(SVGDocument& document, const UnicodeString& title) {
    putFirst(*document.getDocumentElement()->lastLink(), document, SVGName::title, title);
}

void setGradient(Drawmere& page) {
    const UnicodeString gradient = page.startLinearGradient(pt(20), pt(0), pt(240), pt(0),
                                                            SVGMatrix(), USERSPACEONUSE, GRADPAD);
    page.setStopColor(MoxColor(0xC98A1B), /*offset=*/0, /*opacity=*/1);
    page.setStopColor(MoxColor(0xB5382A), /*offset=*/1, /*opacity=*/1);
    page.endGradiant();
    page.setFillColorId(gradient);
}

void drawBar(Drawmere& page, float y, float length) {
    page.drawRect(pt(20), pt(y), pt(length), pt(20), pt(0), pt(0), PAINTMODE_FILL);
}

void drawChart(Drawmere& page, SVGDocument& document) {
    setGradient(page);
    page.pushState();
    drawBar(page, 20, 150);
    page.popState();
    titleLast(document, u"Spring: 150");
    page.startLink(u"autumn.svg", MoxName());
    drawBar(page, 50, 220);
    page.endLink();
    titleLast(document, u"Autumn: 220, month by month");
}

} // namespace

int main() {
    SVGConfig config;
    config.streamOutput = false;
    config.saveOption = u"indent";
    SVGPageUri uri(u"titled.svg");
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(u"titled.svg");
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(260), pt(90)));
    drawmere.setCanvasSize(pt(260), pt(90));
    SVGDocument& document = *drawmere.impl->getDocument();
    drawChart(drawmere, document);
    drawmere.endPage();
    titleDocument(document); // when all is drawn
    drawmere.finishRootSvg();
    drawmere.finish();
}
