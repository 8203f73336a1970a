// The public class at work, from the first call to the saved file.
#include "Drawmere.h"
#include "bench/BenchFile.h"
#include "bench/BenchShapes.h"
#include "bench/Contest.h"
#include "bench/PlainWriter.h"
#include "bench/peers/CairoPeer.h"

#include <benchmark/benchmark.h>

namespace DrawmereNS {
namespace {

constexpr std::size_t stateCount = 100'000;
constexpr std::size_t rectCount = 200'000;
constexpr std::size_t rectsOfOneColor = 10;

using Rects = std::vector<BenchRect>;

MoxLength pt(float number) { return MoxLength::fromRaw(number); }

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

template <typename Draw> ContestResult runPlain(Draw draw, const Rects& rects, const BenchFile& f) {
    const Stopwatch watch;
    PlainWriter writer(f.getPath());
    writer.startPage(benchPageWidth, benchPageHeight);
    draw(writer, rects);
    const std::size_t bytes = writer.finish();
    return {watch.getTime(), bytes};
}

template <typename Draw> void makeFile(Draw draw, const Rects& rects, const UnicodeString& path) {
    SVGConfig config;
    config.streamOutput = false;
    config.singleFile = true;
    config.saveOption = u"decimals=3";
    SVGPageUri uri(path);
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawmere.startPage(1,
                       MoxRectT<MoxLength>(pt(0), pt(0), pt(benchPageWidth), pt(benchPageHeight)));
    drawmere.setCanvasSize(pt(benchPageWidth), pt(benchPageHeight));
    draw(drawmere, rects);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

template <typename Draw>
ContestResult runDrawmere(Draw draw, const Rects& rects, const BenchFile& f) {
    const Stopwatch watch;
    makeFile(draw, rects, UnicodeString::fromUTF8(f.getPath()));
    return {watch.getTime(), f.getSize()};
}

template <typename Draw> ContestResult runCairo(Draw draw, const Rects& rects, const BenchFile& f) {
    const Stopwatch watch;
    CairoPeer cairo(f.getPath(), benchPageWidth, benchPageHeight);
    draw(cairo, rects);
    cairo.finish();
    return {watch.getTime(), f.getSize()};
}

template <typename Draw>
Contest makeContest(const char* title, Draw draw, const Rects& rects, const BenchFile& file,
                    double goal) {
    return {title,
            {
                {"plain", [&, draw] { return runPlain(draw, rects, file); }},
                {"drawmere", [&, draw] { return runDrawmere(draw, rects, file); }},
                {"cairo", [&, draw] { return runCairo(draw, rects, file); }, /*isSlow=*/true},
            },
            goal};
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    const Rects manyStates = makeBenchRects(scaleCount(stateCount));
    const Rects manyRects = makeBenchRects(scaleCount(rectCount));
    runContests({makeContest("state changes: push, transform, width, rectangle, pop", states,
                             manyStates, file, 2.2),
                 makeContest("rectangles, filled and stroked", rectangles, manyRects, file, 2.0)});
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
