/// The generated input of the benches.
#pragma once

#include "foundation/common/MoxString.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace DrawmereNS {

/// One rectangle of a page; lengths are points in thousandths.
struct BenchRect {
    float x;
    float y;
    float width;
    float height;
    std::uint32_t fillColor;
    float strokeWidth;
};

struct BenchPoint {
    float x;
    float y;
};

/// A line or a curve to `target`; a line has no use for the control points.
struct BenchSegment {
    bool isCurve;
    BenchPoint control1;
    BenchPoint control2;
    BenchPoint target;
};

/// A drawing without its style: lines and curves, a few points long each.
struct BenchPath {
    BenchPoint start;
    std::vector<BenchSegment> segments;
};

constexpr std::size_t benchRunLength = 12;

/// A run of text, as characters and as bytes, with a position for each of them.
struct BenchText {
    UnicodeString text;
    std::string bytes;
    std::array<float, benchRunLength> x;
    float y;
};

constexpr float benchPageWidth = 595.0F;
constexpr float benchPageHeight = 842.0F;
constexpr std::uint32_t benchStrokeColor = 0x1A2B3C;

/// Returns: `count` rectangles, the same ones in every run. Colours change every ten rectangles,
/// and none has a short form.
std::vector<BenchRect> makeBenchRects(std::size_t count);

/// Returns: `count` paths of `segments` segments, lines and curves in turn as chance has it, the
/// same ones in every run. A target lies less than four points away from the start of its segment
/// in x and in y.
std::vector<BenchPath> makeBenchPaths(std::size_t count, std::size_t segments);

/// Returns: the corners of a line of `count` segments, as far apart.
std::vector<BenchPoint> makeBenchLine(std::size_t count);

/// Returns: `count` runs of small letters and blanks, the same ones in every run.
std::vector<BenchText> makeBenchTexts(std::size_t count);

} // namespace DrawmereNS
