#include "bench/BenchShapes.h"

#include <cmath>
#include <random>

namespace DrawmereNS {
namespace {

constexpr std::size_t rectsOfOneColor = 10;

/// A coordinate wanders by less than this at a time.
constexpr unsigned int largestStep = 4;

/// Numbers of three decimals; the engine gives the same everywhere, the library's distributions
/// might not.
class Source {
public:
    float takeBelow(unsigned int limit) {
        return static_cast<float>(engine() % (limit * 1000UL)) / 1000.0F;
    }

    /// A blue of 5E leaves every colour without a short form.
    std::uint32_t takeColor() { return (static_cast<std::uint32_t>(engine()) & 0xFFFF00U) | 0x5EU; }

    /// One coordinate a step away from `from`, and turned back at the borders of the page.
    float takeNear(float from, float limit) {
        const float step = takeBelow(2 * largestStep) - static_cast<float>(largestStep);
        const bool isInside = from + step >= 0.0F && from + step < limit;
        return roundToThousandth(isInside ? from + step : from - step);
    }

    BenchPoint takeNear(const BenchPoint& from) {
        const float x = takeNear(from.x, benchPageWidth);
        return {x, takeNear(from.y, benchPageHeight)};
    }

    bool takeFlag() { return engine() % 2000 < 1000; }

    /// A small letter, or a blank in the place of every eighth.
    char takeLetter() {
        const auto number = engine() % 208;
        return number % 8 == 0 ? ' ' : static_cast<char>('a' + number / 8);
    }

private:
    static float roundToThousandth(float value) { return std::round(value * 1000.0F) / 1000.0F; }

    std::minstd_rand engine;
};

BenchPath makePath(Source& source, std::size_t count) {
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

BenchText makeText(Source& source) {
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
    Source source;
    std::vector<BenchRect> rects;
    rects.reserve(count);
    std::uint32_t color = 0;
    for (std::size_t i = 0; i < count; ++i) {
        color = i % rectsOfOneColor == 0 ? source.takeColor() : color;
        rects.push_back({source.takeBelow(500), source.takeBelow(700), source.takeBelow(90),
                         source.takeBelow(90), color, source.takeBelow(4)});
    }
    return rects;
}

std::vector<BenchPath> makeBenchPaths(std::size_t count, std::size_t segments) {
    Source source;
    std::vector<BenchPath> paths;
    paths.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        paths.push_back(makePath(source, segments));
    }
    return paths;
}

std::vector<BenchPoint> makeBenchLine(std::size_t count) {
    Source source;
    std::vector<BenchPoint> line;
    line.reserve(count + 1);
    line.push_back({source.takeBelow(595), source.takeBelow(842)});
    for (std::size_t i = 0; i < count; ++i) {
        line.push_back(source.takeNear(line.back()));
    }
    return line;
}

std::vector<BenchText> makeBenchTexts(std::size_t count) {
    Source source;
    std::vector<BenchText> texts;
    texts.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        texts.push_back(makeText(source));
    }
    return texts;
}

} // namespace DrawmereNS
