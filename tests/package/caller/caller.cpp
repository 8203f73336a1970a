#include "Drawmere.h"
#include "SVGConfig.h"
#include "SVGPageUri.h"
#include "config/SVGZip.h"
#include "draw/SVGTinyImpl.h"
#include "frontend/DrawmereError.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGUtil.h"

#include <cstdio>
#include <fstream>
#include <iostream>
#include <iterator>
#include <sstream>
#include <string>

using namespace DrawmereNS;

static MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

/// Writes one page with a rectangle to `path`.
static void drawPage(const UnicodeString& path) {
    SVGConfig config;
    config.streamOutput = false;
    SVGPageUri uri(path);
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawmere.setCanvasSize(pt(100), pt(100));
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(100), pt(100)));
    drawmere.drawRect(pt(10), pt(10), pt(30), pt(20), pt(0), pt(0), PAINTMODE_FILL);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

/// Draws on what stands behind the public class, which callers may derive from.
static std::string drawDirectly() {
    SVGConfig config;
    SVGTinyImpl impl(&config);
    impl.initRootSvg();
    impl.getGContext()->setStrokeColor(MoxColor(0, 0, 255));
    impl.drawLine(pt(0), pt(0), pt(10), pt(10), PAINTMODE_STROKE);
    impl.finishRootSvg();
    std::ostringstream compressed;
    {
        SVGZipStream stream(compressed);
        impl.outputStream(impl.getDocument(), UnicodeString(), &stream, UnicodeString());
    }
    const UnicodeString name = SVGUtil::getColorString(MoxColor(255, 0, 0), true);
    const UnicodeString text = DrawmereError::getErrorMessage(16406, UnicodeString());
    std::string result;
    return compressed.str().empty() || name != u"red" ? result : text.toUTF8String(result);
}

static std::string readFile(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

int main(int argc, char** argv) {
    const std::string path = argc > 1 ? argv[1] : "caller.svg";
    std::remove(path.c_str());
    drawPage(UnicodeString::fromUTF8(path));
    const std::string written = readFile(path);
    std::cout << written;
    const bool drawsDirectly = drawDirectly() == "Pop a empty stack.";
    return drawsDirectly && written.find("<rect") != std::string::npos ? 0 : 1;
}
