#include "tools/convert/PaintColors.h"

#include "tools/convert/FitzCall.h"

#include <algorithm>
#include <cmath>

namespace DrawmereConvert {
namespace {

int toByte(float part) {
    return static_cast<int>(std::lround(std::clamp(part, 0.0F, 1.0F) * 255.0F));
}

} // namespace

PaintColors::~PaintColors() { fz_drop_colorspace(ctx, lastSpace); }

bool PaintColors::isLast(fz_colorspace* space, const float* numbers, int count) const {
    return space == lastSpace && use == lastUse &&
           std::equal(numbers, numbers + count, lastNumbers.begin());
}

MoxColor PaintColors::convert(fz_colorspace* space, const float* numbers, float alpha,
                              const fz_color_params& params) {
    if (forced) {
        return *forced;
    }
    if (!space) {
        space = fz_device_gray(ctx);
    }
    if (use == COLORUSE_ALPHA) {
        return {255, 255, 255, toByte(alpha)};
    }
    const int count = fz_colorspace_n(ctx, space);
    if (!isLast(space, numbers, count)) {
        float color[FZ_MAX_COLORS] = {};
        fz_colorspace* target = use == COLORUSE_PICTURE ? fz_device_rgb(ctx) : fz_device_gray(ctx);
        // A failure leaves black.
        callFitz(ctx,
                 [&] { fz_convert_color(ctx, space, numbers, target, color, nullptr, params); });
        fz_drop_colorspace(ctx, lastSpace);
        lastSpace = fz_keep_colorspace(ctx, space);
        lastUse = use;
        std::copy_n(numbers, count, lastNumbers.begin());
        const bool isGray = use == COLORUSE_LUMINOSITY;
        lastColor = {color[0], isGray ? color[0] : color[1], isGray ? color[0] : color[2]};
    }
    return {toByte(lastColor[0]), toByte(lastColor[1]), toByte(lastColor[2]), toByte(alpha)};
}

} // namespace DrawmereConvert
