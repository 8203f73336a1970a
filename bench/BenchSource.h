/// Where the numbers of the benches come from.
#pragma once

#include "bench/BenchShapes.h"

#include <cmath>
#include <cstdint>
#include <random>

namespace DrawmereNS {

/// Numbers of three decimals, the same ones in every run; the engine gives the same everywhere, the
/// library's distributions might not.
class BenchSource {
public:
    float takeBelow(unsigned int limit) {
        return static_cast<float>(engine() % (limit * 1000UL)) / 1000.0F;
    }

    unsigned int takeCount(unsigned int limit) {
        return static_cast<unsigned int>(engine() % (limit * 16UL) / 16);
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

    /// A rectangle inside the page, of a colour of its own.
    BenchRect takeRect(std::uint32_t color) {
        const float x = takeBelow(500);
        const float y = takeBelow(700);
        const float width = takeBelow(90);
        const float height = takeBelow(90);
        return {x, y, width, height, color, takeBelow(4)};
    }

private:
    /// A coordinate wanders by less than this at a time.
    static constexpr unsigned int largestStep = 4;

    static float roundToThousandth(float value) { return std::round(value * 1000.0F) / 1000.0F; }

    std::minstd_rand engine;
};

} // namespace DrawmereNS
