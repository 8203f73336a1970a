// The public class at work, from the first call to the saved file.
#include "bench/BenchShapes.h"
#include "bench/DrawContest.h"

#include <benchmark/benchmark.h>

namespace DrawmereNS {
namespace {

constexpr std::size_t stateCount = 100'000;
constexpr std::size_t rectCount = 200'000;
constexpr std::size_t rectsOfOneColor = 10;

using Rects = std::vector<BenchRect>;

// Each round moves the origin to the corner of its rectangle.

void drawStates(Drawmere& drawmere, const Rects& rects) {
    drawmere.setStrokeColor(MoxColor(benchStrokeColor));
    for (const BenchRect& rect : rects) {
        drawmere.pushState();
        drawmere.setTransMatrix(SVGMatrix(1, 0, 0, 1, rect.x, rect.y));
        drawmere.setStrokeWidth(pt(rect.strokeWidth));
        drawmere.drawRect(pt(1), pt(2), pt(rect.width), pt(rect.height), pt(0), pt(0),
                          PAINTMODE_STROKE);
        drawmere.popState();
    }
}

void drawStates(PlainWriter& writer, const Rects& rects) {
    writer.setStrokeColor(benchStrokeColor);
    for (const BenchRect& rect : rects) {
        writer.save();
        writer.translate(rect.x, rect.y);
        writer.setStrokeWidth(rect.strokeWidth);
        writer.drawRect(1, 2, rect.width, rect.height, {.fill = false, .stroke = true});
        writer.restore();
    }
}

void drawStates(CairoPeer& cairo, const Rects& rects) {
    cairo.setStrokeColor(benchStrokeColor);
    for (const BenchRect& rect : rects) {
        cairo.save();
        cairo.translate(rect.x, rect.y);
        cairo.setStrokeWidth(rect.strokeWidth);
        cairo.strokeRect(1, 2, rect.width, rect.height);
        cairo.restore();
    }
}

void drawRects(Drawmere& drawmere, const Rects& rects) {
    drawmere.setStrokeColor(MoxColor(benchStrokeColor));
    for (std::size_t i = 0; i < rects.size(); ++i) {
        const BenchRect& rect = rects[i];
        if (i % rectsOfOneColor == 0) {
            drawmere.setFillColor(MoxColor(rect.fillColor));
        }
        drawmere.drawRect(pt(rect.x), pt(rect.y), pt(rect.width), pt(rect.height), pt(0), pt(0),
                          PAINTMODE_FILLSTROKE);
    }
}

void drawRects(PlainWriter& writer, const Rects& rects) {
    writer.setStrokeColor(benchStrokeColor);
    for (std::size_t i = 0; i < rects.size(); ++i) {
        const BenchRect& rect = rects[i];
        if (i % rectsOfOneColor == 0) {
            writer.setFillColor(rect.fillColor);
        }
        writer.drawRect(rect.x, rect.y, rect.width, rect.height, {.fill = true, .stroke = true});
    }
}

void drawRects(CairoPeer& cairo, const Rects& rects) {
    cairo.setStrokeColor(benchStrokeColor);
    for (std::size_t i = 0; i < rects.size(); ++i) {
        const BenchRect& rect = rects[i];
        if (i % rectsOfOneColor == 0) {
            cairo.setFillColor(rect.fillColor);
        }
        cairo.fillAndStrokeRect(rect.x, rect.y, rect.width, rect.height);
    }
}

/// Draws one workload on any of the three.
constexpr auto states = [](auto& target, const Rects& rects) { drawStates(target, rects); };
constexpr auto rectangles = [](auto& target, const Rects& rects) { drawRects(target, rects); };

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    const Rects manyStates = makeBenchRects(scaleCount(stateCount));
    const Rects manyRects = makeBenchRects(scaleCount(rectCount));
    runContests({makeDrawContest("state changes: push, transform, width, rectangle, pop", states,
                                 manyStates, file, {.wall = 2.2}),
                 makeDrawContest("rectangles, filled and stroked", rectangles, manyRects, file,
                                 {.wall = 2.0})});
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
