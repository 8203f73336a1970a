// Paths from the first call to the saved file: many short ones and a very long one.
#include "bench/BenchShapes.h"
#include "bench/DrawContest.h"
#include "bench/ResidentMemory.h"

#include <benchmark/benchmark.h>
#include <cstdio>

namespace DrawmereNS {
namespace {

constexpr std::size_t pathCount = 50'000;
constexpr std::size_t segmentsOfPath = 40;
constexpr std::size_t lineCount = 5'000'000;
constexpr float strokeWidth = 0.75F;

using Paths = std::vector<BenchPath>;
using Line = std::vector<BenchPoint>;

MoxPointT<MoxLength> at(const BenchPoint& point) { return {pt(point.x), pt(point.y)}; }

// How each of the three is told its style and the parts of a path.

void prepare(Drawmere& drawmere) {
    drawmere.setStrokeColor(MoxColor(benchStrokeColor));
    drawmere.setStrokeWidth(pt(strokeWidth));
}

template <typename Target> void prepare(Target& target) {
    target.setStrokeColor(benchStrokeColor);
    target.setStrokeWidth(strokeWidth);
}

void start(Drawmere& drawmere, const BenchPoint& point) {
    drawmere.startPathData();
    drawmere.setPathMoveTo(at(point));
}

void start(PlainWriter& writer, const BenchPoint& point) {
    writer.startPath();
    writer.moveTo(point.x, point.y);
}

void start(CairoPeer& cairo, const BenchPoint& point) { cairo.moveTo(point.x, point.y); }

void addLine(Drawmere& drawmere, const BenchPoint& point) { drawmere.setPathLineTo(at(point)); }

template <typename Target> void addLine(Target& target, const BenchPoint& point) {
    target.lineTo(point.x, point.y);
}

void addCurve(Drawmere& drawmere, const BenchSegment& segment) {
    drawmere.setPathCubicBezierCurveTo(at(segment.control1), at(segment.control2),
                                       at(segment.target));
}

template <typename Target> void addCurve(Target& target, const BenchSegment& segment) {
    target.curveTo(segment.control1.x, segment.control1.y, segment.control2.x, segment.control2.y,
                   segment.target.x, segment.target.y);
}

void end(Drawmere& drawmere) { drawmere.endPathData(PAINTMODE_STROKE); }

void end(PlainWriter& writer) { writer.endPath(); }

void end(CairoPeer& cairo) { cairo.strokePath(); }

template <typename Target> void drawPath(Target& target, const BenchPath& path) {
    start(target, path.start);
    for (const BenchSegment& segment : path.segments) {
        if (segment.isCurve) {
            addCurve(target, segment);
        } else {
            addLine(target, segment.target);
        }
    }
    end(target);
}

/// Draws one workload on any of the three.
constexpr auto manyPaths = [](auto& target, const Paths& paths) {
    prepare(target);
    for (const BenchPath& path : paths) {
        drawPath(target, path);
    }
};

constexpr auto oneLine = [](auto& target, const Line& line) {
    prepare(target);
    start(target, line.front());
    for (std::size_t i = 1; i < line.size(); ++i) {
        addLine(target, line[i]);
    }
    end(target);
};

/// What the open path takes up. The finished one is text.
void printMemory(const Line& line) {
    SVGConfig config;
    SVGPageUri uri(u"");
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(u"");
    start(drawmere, line.front());
    const std::size_t before = countResidentBytes();
    for (std::size_t i = 1; i < line.size(); ++i) {
        addLine(drawmere, line[i]);
    }
    const std::size_t used = countResidentBytes() - before;
    std::printf("\nmemory\n  %.1f bytes for a line segment; goal: at most 64\n",
                static_cast<double>(used) / static_cast<double>(line.size() - 1));
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    const Paths paths = makeBenchPaths(scaleCount(pathCount), segmentsOfPath);
    const Line line = makeBenchLine(scaleCount(lineCount));
    runContests({makeDrawContest("paths of 40 lines and curves", manyPaths, paths, file,
                                 {.wall = 0.8, .bytes = 0.85}),
                 makeDrawContest("one path of 5,000,000 lines", oneLine, line, file,
                                 {.wall = 0.8, .bytes = 0.85})});
    printMemory(line);
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
