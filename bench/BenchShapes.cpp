#include "bench/BenchShapes.h"

#include "bench/BenchSource.h"

namespace DrawmereNS {
namespace {

constexpr std::size_t rectsOfOneColor = 10;

BenchPath makePath(BenchSource& source, std::size_t count) {
    BenchPath path = {{source.takeBelow(595), source.takeBelow(842)}, {}};
    path.segments.reserve(count);
    BenchPoint current = path.start;
    for (std::size_t i = 0; i < count; ++i) {
        const bool isCurve = source.takeFlag();
        const BenchPoint control1 = source.takeNear(current);
        const BenchPoint control2 = source.takeNear(current);
        current = source.takeNear(current);
        path.segments.push_back({isCurve, control1, control2, current});
    }
    return path;
}

BenchText makeText(BenchSource& source) {
    constexpr float advance = 5.004F;
    BenchText run = {{}, std::string(benchRunLength, ' '), {}, source.takeBelow(842)};
    const float start = source.takeBelow(500);
    for (std::size_t i = 0; i < benchRunLength; ++i) {
        run.bytes[i] = source.takeLetter();
        run.x[i] = start + static_cast<float>(i) * advance;
    }
    run.text = UnicodeString::fromUTF8(run.bytes);
    return run;
}

} // namespace

std::vector<BenchRect> makeBenchRects(std::size_t count) {
    BenchSource source;
    std::vector<BenchRect> rects;
    rects.reserve(count);
    std::uint32_t color = 0;
    for (std::size_t i = 0; i < count; ++i) {
        color = i % rectsOfOneColor == 0 ? source.takeColor() : color;
        rects.push_back(source.takeRect(color));
    }
    return rects;
}

std::vector<BenchPath> makeBenchPaths(std::size_t count, std::size_t segments) {
    BenchSource source;
    std::vector<BenchPath> paths;
    paths.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        paths.push_back(makePath(source, segments));
    }
    return paths;
}

std::vector<BenchPoint> makeBenchLine(std::size_t count) {
    BenchSource source;
    std::vector<BenchPoint> line;
    line.reserve(count + 1);
    line.push_back({source.takeBelow(595), source.takeBelow(842)});
    for (std::size_t i = 0; i < count; ++i) {
        line.push_back(source.takeNear(line.back()));
    }
    return line;
}

std::vector<BenchText> makeBenchTexts(std::size_t count) {
    BenchSource source;
    std::vector<BenchText> texts;
    texts.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        texts.push_back(makeText(source));
    }
    return texts;
}

} // namespace DrawmereNS
