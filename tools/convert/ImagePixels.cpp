#include "tools/convert/ImagePixels.h"

#include "tools/convert/FitzCall.h"

#include <algorithm>

namespace DrawmereConvert {
namespace {

constexpr std::uint32_t opaque = 255;

std::uint32_t pack(std::uint32_t red, std::uint32_t green, std::uint32_t blue,
                   std::uint32_t alpha) {
    return alpha << 24U | red << 16U | green << 8U | blue;
}

std::uint32_t divideByAlpha(std::uint32_t part, std::uint32_t alpha) {
    return alpha == 0 ? 0 : std::min((part * opaque + alpha / 2) / alpha, opaque);
}

std::uint32_t readPixel(const unsigned char* samples, int colors, bool hasAlpha) {
    std::uint32_t red = samples[0];
    std::uint32_t green = colors == 3 ? samples[1] : red;
    std::uint32_t blue = colors == 3 ? samples[2] : red;
    const std::uint32_t alpha = hasAlpha ? samples[colors] : opaque;
    if (alpha != opaque) {
        red = divideByAlpha(red, alpha);
        green = divideByAlpha(green, alpha);
        blue = divideByAlpha(blue, alpha);
    }
    return pack(red, green, blue, alpha);
}

} // namespace

ImagePixels::ImagePixels(fz_context* context, fz_image* image) : ctx(context) {
    decode(image);
    if (pixmap) {
        convertToPlain();
    }
}

ImagePixels::~ImagePixels() { fz_drop_pixmap(ctx, pixmap); }

void ImagePixels::decode(fz_image* image) {
    callFitz(ctx, [&] {
        pixmap = fz_get_pixmap_from_image(ctx, image, nullptr, nullptr, nullptr, nullptr);
    });
}

void ImagePixels::convertToPlain() {
    const bool isPlain = !pixmap->colorspace || pixmap->colorspace == fz_device_gray(ctx) ||
                         pixmap->colorspace == fz_device_rgb(ctx);
    if (isPlain && pixmap->s == 0) {
        return;
    }
    fz_pixmap* plain = nullptr;
    fz_pixmap* source = pixmap;
    callFitz(ctx, [&] {
        plain = fz_convert_pixmap(ctx, source, fz_device_rgb(ctx), nullptr, nullptr,
                                  fz_default_color_params, 1);
    });
    fz_drop_pixmap(ctx, pixmap);
    pixmap = plain;
}

void ImagePixels::readRow(int y, std::vector<std::uint32_t>& row) const {
    const bool hasAlpha = pixmap->alpha != 0;
    const int colors = pixmap->n - pixmap->alpha;
    const unsigned char* samples = getRow(y);
    row.resize(static_cast<std::size_t>(pixmap->w));
    for (std::uint32_t& pixel : row) {
        pixel = colors == 0 ? pack(opaque, opaque, opaque, *samples)
                            : readPixel(samples, colors, hasAlpha);
        samples += pixmap->n;
    }
}

void ImagePixels::readMaskRow(int y, std::vector<std::uint8_t>& row) const {
    const int colors = pixmap->n - pixmap->alpha;
    const unsigned char* samples = getRow(y);
    row.resize(static_cast<std::size_t>(pixmap->w));
    for (std::uint8_t& value : row) {
        value = colors == 3 ? static_cast<std::uint8_t>(
                                  (samples[0] * 77 + samples[1] * 151 + samples[2] * 28) / 256)
                            : samples[0];
        samples += pixmap->n;
    }
}

PlacedPixels::PlacedPixels(fz_context* context, fz_pixmap* newPixels, float scale)
    : pixels(std::make_unique<ImagePixels>(context, newPixels)),
      matrix{static_cast<float>(newPixels->w) / scale,
             0,
             0,
             static_cast<float>(newPixels->h) / scale,
             static_cast<float>(newPixels->x) / scale,
             static_cast<float>(newPixels->y) / scale} {}

} // namespace DrawmereConvert
