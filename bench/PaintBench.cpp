// Definitions from the first call to the saved file: a gradient and a clip path for each rectangle.
#include "bench/BenchShapes.h"
#include "bench/DrawContest.h"

#include <benchmark/benchmark.h>
#include <string>

namespace DrawmereNS {
namespace {

constexpr std::size_t rectCount = 50'000;
constexpr float margin = 0.5F; ///< by which a clip path is smaller than what it clips

using Rects = std::vector<BenchRect>;

// Rectangles with a gradient from the left to the right, clipped by smaller ones.

void drawClipped(Drawmere& drawmere, const Rects& rects) {
    for (const BenchRect& rect : rects) {
        drawmere.pushState();
        const UnicodeString gradient =
            drawmere.startLinearGradient(pt(rect.x), pt(0), pt(rect.x + rect.width), pt(0),
                                         SVGMatrix(), USERSPACEONUSE, GRADPAD);
        drawmere.setStopColor(MoxColor(rect.fillColor), 0, 1);
        drawmere.setStopColor(MoxColor(benchStrokeColor), 1, 1);
        drawmere.endGradiant();
        drawmere.startClipRect(USERSPACEONUSE);
        drawmere.drawRect(pt(rect.x + margin), pt(rect.y + margin), pt(rect.width), pt(rect.height),
                          pt(0), pt(0), PAINTMODE_FILL);
        drawmere.endClipDef();
        drawmere.doClip();
        drawmere.setFillColorId(gradient);
        drawmere.drawRect(pt(rect.x), pt(rect.y), pt(rect.width), pt(rect.height), pt(0), pt(0),
                          PAINTMODE_FILL);
        drawmere.popState();
    }
}

void addStop(PlainWriter& writer, std::uint32_t rgb, float offset) {
    writer.startElement("stop");
    writer.addColor("stop-color", rgb);
    writer.addNumber("offset", offset);
    writer.addNumber("stop-opacity", 1);
    writer.endEmptyElement();
}

void startGradient(PlainWriter& writer, const std::string& id, float x1, float x2) {
    writer.startElement("linearGradient");
    writer.addText("id", id);
    writer.addText("gradientUnits", "userSpaceOnUse");
    writer.addNumber("x1", x1);
    writer.addNumber("y1", 0);
    writer.addNumber("x2", x2);
    writer.addNumber("y2", 0);
    writer.openElement();
}

void addRect(PlainWriter& writer, float x, float y, const BenchRect& rect,
             const std::string& fill) {
    writer.startElement("rect");
    writer.addNumber("x", x);
    writer.addNumber("y", y);
    writer.addNumber("width", rect.width);
    writer.addNumber("height", rect.height);
    writer.addText("fill", fill);
    writer.endEmptyElement();
}

void addClipPath(PlainWriter& writer, const std::string& id, const BenchRect& rect) {
    writer.startElement("clipPath");
    writer.addText("id", id);
    writer.openElement();
    addRect(writer, rect.x + margin, rect.y + margin, rect, "none");
    writer.endElement("clipPath");
}

void drawClipped(PlainWriter& writer, const Rects& rects) {
    for (std::size_t i = 0; i < rects.size(); ++i) {
        const BenchRect& rect = rects[i];
        const std::string gradient = "g" + std::to_string(i);
        const std::string clipPath = "c" + std::to_string(i);
        startGradient(writer, gradient, rect.x, rect.x + rect.width);
        addStop(writer, rect.fillColor, 0);
        addStop(writer, benchStrokeColor, 1);
        writer.endElement("linearGradient");
        addClipPath(writer, clipPath, rect);
        writer.startElement("g");
        writer.addText("clip-path", "url(#" + clipPath + ")");
        writer.openElement();
        addRect(writer, rect.x, rect.y, rect, "url(#" + gradient + ")");
        writer.endElement("g");
    }
}

void drawClipped(CairoPeer& cairo, const Rects& rects) {
    for (const BenchRect& rect : rects) {
        cairo.save();
        cairo.clipRect(rect.x + margin, rect.y + margin, rect.width, rect.height);
        cairo.fillRect(rect.x, rect.y, rect.width, rect.height, rect.fillColor, benchStrokeColor);
        cairo.restore();
    }
}

/// Draws the workload on any of the three.
constexpr auto clipped = [](auto& target, const Rects& rects) { drawClipped(target, rects); };

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    const Rects rects = makeBenchRects(scaleCount(rectCount));
    runContests({makeDrawContest("a gradient, a clip path and a rectangle", clipped, rects, file,
                                 {.wall = 2.5})});
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
