#include "tools/convert/ShadingStops.h"

#include <array>
#include <cmath>
#include <cstdlib>

namespace DrawmereConvert {
namespace {

constexpr int sampleCount = 256;
constexpr int last = sampleCount - 1;

// Stops are rounded to bytes themselves, so half of the error allowed is theirs already.
constexpr float tolerance = 0.75F;

using Sample = std::array<int, 4>; // red, green, blue, alpha
using Samples = std::array<Sample, sampleCount>;

Samples readSamples(fz_context* ctx, const fz_shade& shade, PaintColors& colors) {
    const int count = fz_colorspace_n(ctx, shade.colorspace);
    Samples samples;
    for (int i = 0; i < sampleCount; ++i) {
        const float* numbers = shade.function[i];
        const MoxColor color =
            colors.convert(shade.colorspace, numbers, numbers[count], fz_default_color_params);
        samples.at(i) = {color.getRed(), color.getGreen(), color.getBlue(), color.getAlpha()};
    }
    return samples;
}

bool isOnLine(const Samples& samples, int from, int to, int between) {
    const float part = static_cast<float>(between - from) / static_cast<float>(to - from);
    for (std::size_t i = 0; i < Sample().size(); ++i) {
        const auto begin = static_cast<float>(samples.at(from).at(i));
        const auto end = static_cast<float>(samples.at(to).at(i));
        const auto real = static_cast<float>(samples.at(between).at(i));
        if (std::abs(begin + (end - begin) * part - real) > tolerance) {
            return false;
        }
    }
    return true;
}

bool isLine(const Samples& samples, int from, int to) {
    for (int between = from + 1; between < to; ++between) {
        if (!isOnLine(samples, from, to, between)) {
            return false;
        }
    }
    return true;
}

/// Returns: how far the line from `from` reaches: halving finds it, as what a long line keeps to
/// shorter ones mostly do.
int findEnd(const Samples& samples, int from) {
    int good = from + 1;
    for (int step = last - from; step > 0; step /= 2) {
        while (good + step <= last && isLine(samples, from, good + step)) {
            good += step;
        }
    }
    return good;
}

ShadingStop toStop(const Samples& samples, int index) {
    const Sample& sample = samples.at(index);
    return {static_cast<float>(index) / static_cast<float>(last),
            MoxColor(sample[0], sample[1], sample[2], sample[3])};
}

} // namespace

std::vector<ShadingStop> findStops(fz_context* ctx, const fz_shade& shade, PaintColors& colors) {
    const Samples samples = readSamples(ctx, shade, colors);
    std::vector<ShadingStop> stops = {toStop(samples, 0)};
    for (int from = 0; from < last;) {
        from = findEnd(samples, from);
        stops.push_back(toStop(samples, from));
    }
    return stops;
}

MoxColor findMiddleColor(fz_context* ctx, const fz_shade& shade, PaintColors& colors) {
    const Samples samples = readSamples(ctx, shade, colors);
    const Sample& from = samples.front();
    const Sample& to = samples.back();
    return {(from[0] + to[0]) / 2, (from[1] + to[1]) / 2, (from[2] + to[2]) / 2};
}

} // namespace DrawmereConvert
