#include "bench/BenchShapes.h"

#include <random>

namespace DrawmereNS {
namespace {

constexpr std::size_t rectsOfOneColor = 10;

/// Numbers of three decimals; the engine gives the same everywhere, the library's distributions
/// might not.
class Source {
public:
    float takeBelow(unsigned int limit) {
        return static_cast<float>(engine() % (limit * 1000UL)) / 1000.0F;
    }

    /// A blue of 5E leaves every colour without a short form.
    std::uint32_t takeColor() { return (static_cast<std::uint32_t>(engine()) & 0xFFFF00U) | 0x5EU; }

private:
    std::minstd_rand engine;
};

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

} // namespace DrawmereNS
