#include "foundation/graphicservice/GS_FileImage.h"

#include "foundation/graphicservice/GS_ImageClassifier.h"
#include "foundation/graphicservice/GS_JpegWriter.h"
#include "foundation/graphicservice/GS_Orientation.h"
#include "foundation/graphicservice/GS_PngWriter.h"
#include "foundation/graphicservice/GS_Resampler.h"

#include <algorithm>
#include <cstdio>
#include <fstream>

namespace MoxGraphicService_NS {
namespace {

using Writer = bool (*)(const GS_Bitmap& bitmap, const GS_WriteOptions& options, GS_Output& output);

struct Conversion {
    IMAGE_CONVERT_TYPE type;
    Writer write;
};

constexpr Conversion conversions[] = {
    {CONVERT_BMP_JPEG, writeJpeg},  {CONVERT_BMP_PNG, writePng},    {CONVERT_GIF_JPEG, writeJpeg},
    {CONVERT_GIF_PNG, writePng},    {CONVERT_TIFF_JPEG, writeJpeg}, {CONVERT_TIFF_PNG, writePng},
    {CONVERT_WEBP_JPEG, writeJpeg}, {CONVERT_WEBP_PNG, writePng},   {CONVERT_PNG_JPEG, writeJpeg},
    {CONVERT_PNG_PNG, writePng},    {CONVERT_JPEG_JPEG, writeJpeg},
};

} // namespace

GS_FileImage::GS_FileImage(std::istream& source, const GS_Format& fileFormat,
                           const GS_ImageInfo& facts, float resolution)
    : GS_RasterImage(facts.isTurned() ? facts.rows : facts.columns,
                     facts.isTurned() ? facts.columns : facts.rows),
      stream(source), format(fileFormat), info(facts) {
    const bool isStated = facts.xResolution > 0.0;
    const double fallback = resolution >= 1.0F ? static_cast<double>(resolution) : 0.0;
    xResolution = isStated ? facts.xResolution : fallback;
    yResolution = isStated ? facts.yResolution : fallback;
    if (facts.isTurned()) {
        std::swap(xResolution, yResolution);
    }
}

int GS_FileImage::getRasterKind() { return format.kind; }

void GS_FileImage::writeToStream(std::ostream& target, IMAGE_CONVERT_TYPE type, int quality) {
    GS_Bitmap resampled;
    GS_Bitmap turned;
    const GS_Bitmap* bitmap = prepare(resampled, turned);
    if (bitmap) {
        GS_Output output(target);
        write(*bitmap, output, type, quality);
    }
}

void GS_FileImage::writeToFile(const char* path, IMAGE_CONVERT_TYPE type, int quality) {
    GS_Bitmap resampled;
    GS_Bitmap turned;
    const GS_Bitmap* bitmap = prepare(resampled, turned);
    if (!bitmap) {
        return;
    }
    std::ofstream file;
    if (path) {
        file.open(path, std::ios::binary);
    }
    if (!file.is_open()) {
        fail(FAILURE_TARGET);
        return;
    }
    GS_Output output(file);
    const bool isWritten = write(*bitmap, output, type, quality);
    file.close();
    if (!isWritten || file.fail()) {
        fail(FAILURE_TARGET);
        std::remove(path);
    }
}

int GS_FileImage::getImageClass() { return load() ? classifyBitmap(pixels) : IMAGECLASS_UNKNOWN; }

bool GS_FileImage::load() {
    const bool isLoaded = decode({info.columns, info.rows});
    if (!isLoaded) {
        fail(FAILURE_SOURCE);
    }
    return isLoaded;
}

bool GS_FileImage::findTransparency() const {
    if (!info.mayBeTransparent || format.kind == RASTERKIND_PNG) {
        return info.mayBeTransparent;
    }
    return !decode({info.columns, info.rows}) || pixels.isTransparent();
}

/// Returns: the size to write, with the sides as they are stored.
GS_WantedSize GS_FileImage::getWantedSize() const {
    const int width = targetColumns > 0 ? targetColumns : columns;
    const int height = targetRows > 0 ? targetRows : rows;
    return info.isTurned() ? GS_WantedSize{height, width} : GS_WantedSize{width, height};
}

/// Has `pixels` decoded in at least the wanted size.
bool GS_FileImage::decode(GS_WantedSize wanted) const {
    if (isBroken) {
        return false;
    }
    if (pixels.pixels && pixels.columns >= wanted.columns && pixels.rows >= wanted.rows) {
        return true;
    }
    pixels = GS_Bitmap();
    GS_Input input(stream);
    try {
        isBroken = !format.readPixels(input, info, wanted, pixels);
    } catch (const std::exception&) { // no memory
        isBroken = true;
    }
    input.seek(0);
    if (isBroken) {
        pixels = GS_Bitmap();
    }
    return !isBroken;
}

/// Returns: the pixels to write, kept in one of the arguments or in the image; null without memory.
const GS_Bitmap* GS_FileImage::makeBitmap(GS_Bitmap& resampled, GS_Bitmap& turned) const {
    const GS_WantedSize wanted = getWantedSize();
    const bool isSmaller = wanted.columns != pixels.columns || wanted.rows != pixels.rows;
    if (isSmaller &&
        !resampleBitmap(pixels, wanted.columns, wanted.rows, samplingType, resampled)) {
        return nullptr;
    }
    const GS_Bitmap& upright = isSmaller ? resampled : pixels;
    if (info.orientation == 1) {
        return &upright;
    }
    return turnBitmap(upright, info.orientation, turned) ? &turned : nullptr;
}

/// Decodes, resamples and turns. Returns: null when that failed.
const GS_Bitmap* GS_FileImage::prepare(GS_Bitmap& resampled, GS_Bitmap& turned) {
    const GS_Bitmap* bitmap = nullptr;
    try {
        bitmap = decode(getWantedSize()) ? makeBitmap(resampled, turned) : nullptr;
    } catch (const std::exception&) { // no memory
        bitmap = nullptr;
    }
    if (!bitmap) {
        fail(FAILURE_SOURCE);
    }
    return bitmap;
}

bool GS_FileImage::write(const GS_Bitmap& bitmap, GS_Output& output, IMAGE_CONVERT_TYPE type,
                         int quality) {
    constexpr int bestQuality = 100;
    const auto* found = std::ranges::find(conversions, type, &Conversion::type);
    const GS_WriteOptions options = {std::clamp(quality, 1, bestQuality), xResolution, yResolution};
    bool isWritten = false;
    try {
        isWritten = found != std::end(conversions) && found->write(bitmap, options, output);
    } catch (const std::exception&) { // no memory
        isWritten = false;
    }
    if (!isWritten) {
        fail(FAILURE_TARGET);
    }
    return isWritten;
}

void GS_FileImage::fail(GS_Failure reason) {
    if (failure == FAILURE_NONE) {
        failure = reason;
    }
}

} // namespace MoxGraphicService_NS
