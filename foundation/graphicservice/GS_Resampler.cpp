#include "foundation/graphicservice/GS_Resampler.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace MoxGraphicService_NS {
namespace {

constexpr float fullByte = 255.0F;

/// The curve of sRGB (IEC 61966-2-1), one way for each byte, the other finely enough that every
/// byte comes back.
class Curve {
public:
    Curve() {
        for (std::size_t i = 0; i < linear.size(); ++i) {
            linear[i] = static_cast<float>(makeLinear(static_cast<double>(i)));
        }
        std::size_t byte = 0;
        for (std::size_t i = 0; i < bytes.size(); ++i) {
            // The next byte begins half way, as seen by the eye.
            const double middle = (static_cast<double>(i) + 0.5) / steps;
            while (byte < UINT8_MAX && middle >= makeLinear(static_cast<double>(byte) + 0.5)) {
                ++byte;
            }
            bytes[i] = static_cast<std::uint8_t>(byte);
        }
    }

    float toLinear(std::uint8_t byte) const { return linear[byte]; }

    std::uint8_t toByte(float value) const {
        const float inside = std::clamp(value, 0.0F, 1.0F);
        return bytes[static_cast<std::size_t>(inside * static_cast<float>(steps))];
    }

private:
    static constexpr int steps = 65535;

    /// Returns: the light of a byte, or of what lies between two, from 0 to 1.
    static double makeLinear(double byte) {
        constexpr double straightEnd = 0.04045;
        constexpr double slope = 12.92;
        constexpr double offset = 0.055;
        constexpr double power = 2.4;
        const double value = byte / UINT8_MAX;
        return value <= straightEnd ? value / slope
                                    : std::pow((value + offset) / (1.0 + offset), power);
    }

    std::array<float, 256> linear = {};
    std::array<std::uint8_t, steps + 1> bytes = {};
};

const Curve& getCurve() {
    static const Curve curve;
    return curve;
}

// The weight of an old pixel by its distance from the middle of the new one, in new pixels.
float weighTriangle(float distance) { return std::max(0.0F, 1.0F - std::fabs(distance)); }

float weighCubic(float distance) {
    const float x = std::fabs(distance);
    if (x < 1.0F) {
        return 1.0F + x * x * (1.5F * x - 2.5F);
    }
    return x < 2.0F ? 2.0F + x * (-4.0F + x * (2.5F - 0.5F * x)) : 0.0F;
}

/// The filters, by the numbers of GSMP_SAMPLINGTYPE.
struct Filter {
    GSMP_SAMPLINGTYPE type;
    double reach;          // on both sides, in new pixels
    float (*weigh)(float); // null for the exact share of each pixel
};

constexpr Filter filters[] = {
    {SAMPLINGTYPE_AVERAGE, 0.5, nullptr},
    {SAMPLINGTYPE_LINEAR, 1.0, weighTriangle},
    {SAMPLINGTYPE_CUBIC, 2.0, weighCubic},
};

const Filter& findFilter(GSMP_SAMPLINGTYPE type) {
    const auto* found = std::ranges::find(filters, type, &Filter::type);
    return found == std::end(filters) ? filters[0] : *found;
}

/// Which old pixels a new one is made of.
struct Span {
    int first = 0;
    int count = 0;
    std::size_t weights = 0; // index of the first
};

/// The spans of all new pixels along one axis.
struct Axis {
    Axis(int from, int to, const Filter& filter) {
        const double ratio = static_cast<double>(from) / to;
        spans.reserve(static_cast<std::size_t>(to));
        for (int i = 0; i < to; ++i) {
            addSpan(from, (i + 0.5) * ratio, ratio, filter);
        }
    }

    void addSpan(int from, double middle, double ratio, const Filter& filter) {
        const double low = middle - filter.reach * ratio;
        const double high = middle + filter.reach * ratio;
        Span span;
        span.first = std::max(0, static_cast<int>(std::floor(low)));
        span.count = std::min(from, static_cast<int>(std::ceil(high))) - span.first;
        span.weights = weights.size();
        double sum = 0.0;
        for (int j = span.first; j < span.first + span.count; ++j) {
            const double share = std::min(j + 1.0, high) - std::max<double>(j, low);
            const auto distance = static_cast<float>((j + 0.5 - middle) / ratio);
            const float weight =
                filter.weigh ? filter.weigh(distance) : static_cast<float>(std::max(share, 0.0));
            weights.push_back(weight);
            sum += static_cast<double>(weight);
        }
        for (std::size_t j = span.weights; j < weights.size(); ++j) {
            weights[j] = static_cast<float>(static_cast<double>(weights[j]) / sum);
        }
        spans.push_back(span);
    }

    std::vector<Span> spans;
    std::vector<float> weights;
};

/// Turns a row into linear light, multiplied by alpha.
template <int channels> void linearise(const std::uint8_t* from, int columns, float* to) {
    const Curve& curve = getCurve();
    constexpr bool hasAlpha = channels % 2 == 0;
    constexpr int colors = hasAlpha ? channels - 1 : channels;
    for (int x = 0; x < columns; ++x, from += channels, to += channels) {
        const float alpha = hasAlpha ? static_cast<float>(from[channels - 1]) / fullByte : 1.0F;
        for (int i = 0; i < colors; ++i) {
            to[i] = curve.toLinear(from[i]) * alpha;
        }
        if constexpr (hasAlpha) {
            to[channels - 1] = alpha;
        }
    }
}

template <int channels> void narrowRow(const Axis& axis, const float* from, float* to) {
    for (const Span& span : axis.spans) {
        const float* pixel = from + static_cast<std::ptrdiff_t>(span.first) * channels;
        const float* weight = axis.weights.data() + span.weights;
        std::array<float, channels> sum = {};
        for (int j = 0; j < span.count; ++j, pixel += channels) {
            for (std::size_t i = 0; i < channels; ++i) {
                sum[i] += pixel[i] * weight[j];
            }
        }
        to = std::copy(sum.begin(), sum.end(), to);
    }
}

template <int channels> void storeRow(const float* from, int columns, std::uint8_t* to) {
    const Curve& curve = getCurve();
    constexpr bool hasAlpha = channels % 2 == 0;
    constexpr int colors = hasAlpha ? channels - 1 : channels;
    for (int x = 0; x < columns; ++x, from += channels, to += channels) {
        const float alpha = hasAlpha ? std::clamp(from[channels - 1], 0.0F, 1.0F) : 1.0F;
        for (int i = 0; i < colors; ++i) {
            to[i] = alpha > 0.0F ? curve.toByte(from[i] / alpha) : std::uint8_t{0};
        }
        if constexpr (hasAlpha) {
            to[channels - 1] = static_cast<std::uint8_t>(std::lround(alpha * fullByte));
        }
    }
}

/// Goes over the old rows once. Each is narrowed and then added to those new rows that it is part
/// of, which are few: their sums lie in a ring.
template <int channels> class Resampling {
public:
    Resampling(const GS_Bitmap& from, GS_Bitmap& to, const Filter& filter)
        : source(from), target(to), across(from.columns, to.columns, filter),
          down(from.rows, to.rows, filter), line(static_cast<std::size_t>(from.columns) * channels),
          narrow(static_cast<std::size_t>(to.columns) * channels) {
        for (std::vector<float>& sum : sums) {
            sum.assign(narrow.size(), 0.0F);
        }
    }

    void run() {
        for (int y = 0; y < source.rows; ++y) {
            linearise<channels>(source.getRow(y), source.columns, line.data());
            narrowRow<channels>(across, line.data(), narrow.data());
            addRow(y);
        }
    }

private:
    static constexpr int ringSize = 8; // a row is part of 5 at most

    void addRow(int y) {
        for (int i = firstOpen; i < target.rows; ++i) {
            const Span& span = down.spans[static_cast<std::size_t>(i)];
            if (span.first > y) {
                return;
            }
            const int last = span.first + span.count - 1;
            if (y <= last) {
                addTo(i, down.weights[span.weights + static_cast<std::size_t>(y - span.first)]);
            }
            if (y == last) {
                closeRow(i);
            }
        }
    }

    void addTo(int row, float weight) {
        float* sum = sums[static_cast<std::size_t>(row % ringSize)].data();
        for (std::size_t i = 0; i < narrow.size(); ++i) {
            sum[i] += narrow[i] * weight;
        }
    }

    void closeRow(int row) {
        std::vector<float>& sum = sums[static_cast<std::size_t>(row % ringSize)];
        storeRow<channels>(sum.data(), target.columns, target.getRow(row));
        std::ranges::fill(sum, 0.0F);
        firstOpen = row + 1;
    }

    const GS_Bitmap& source;
    GS_Bitmap& target;
    Axis across;
    Axis down;
    std::vector<float> line;   // an old row
    std::vector<float> narrow; // the same, as wide as a new one
    std::array<std::vector<float>, ringSize> sums;
    int firstOpen = 0; // the first new row that is not finished
};

template <int channels>
void resample(const GS_Bitmap& source, GS_Bitmap& target, const Filter& filter) {
    Resampling<channels>(source, target, filter).run();
}

constexpr void (*resamplers[])(const GS_Bitmap&, GS_Bitmap&, const Filter&) = {
    resample<1>, resample<2>, resample<3>, resample<4>};

} // namespace

bool resampleBitmap(const GS_Bitmap& source, int columns, int rows, GSMP_SAMPLINGTYPE type,
                    GS_Bitmap& target) {
    if (!target.allocate(columns, rows, source.channels)) {
        return false;
    }
    target.profile = source.profile;
    resamplers[source.channels - 1](source, target, findFilter(type));
    return true;
}

} // namespace MoxGraphicService_NS
