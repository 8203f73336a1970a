/// The generated input of the benches.
#pragma once

#include <cstdint>
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

constexpr float benchPageWidth = 595.0F;
constexpr float benchPageHeight = 842.0F;
constexpr std::uint32_t benchStrokeColor = 0x1A2B3C;

/// Returns: `count` rectangles, the same ones in every run. Colours change every ten rectangles,
/// and none has a short form.
std::vector<BenchRect> makeBenchRects(std::size_t count);

} // namespace DrawmereNS
