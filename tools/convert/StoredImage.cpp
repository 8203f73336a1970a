// Images that go into the document as they are stored.
#include "tools/convert/FitzCall.h"
#include "tools/convert/ImageEncoder.h"
#include "tools/convert/PngWriter.h"

#include <array>
#include <string_view>

#include <zlib.h>

namespace DrawmereConvert {
namespace {

std::string_view getBytes(fz_context* ctx, const fz_compressed_buffer& stored) {
    unsigned char* data = nullptr;
    const std::size_t size = fz_buffer_storage(ctx, stored.buffer, &data);
    return {reinterpret_cast<const char*>(data), size};
}

bool isPlain(fz_context* ctx, fz_image* image) {
    fz_colorspace* space = image->colorspace;
    const bool isKnown =
        space && (fz_colorspace_is_gray(ctx, space) || fz_colorspace_is_rgb(ctx, space));
    return isKnown && !image->use_decode && !image->use_colorkey && !image->imagemask;
}

bool isShownJpeg(fz_context* ctx, fz_image* image, const fz_compression_params& params) {
    return isPlain(ctx, image) && image->bpc == 8 && params.u.jpeg.color_transform != 0;
}

/// Rows that PDF filtered as PNG does need only new headers.
bool isPngRows(fz_context* ctx, fz_image* image, const fz_compression_params& params) {
    constexpr int firstPngPredictor = 10;
    const auto& flate = params.u.flate;
    return isPlain(ctx, image) && flate.predictor >= firstPngPredictor &&
           flate.columns == image->w && flate.colors == image->n && flate.bpc == image->bpc;
}

/// Counts the bytes that a zlib stream unpacks to, as far as it is sound.
std::size_t countUnpacked(std::string_view bytes) {
    z_stream stream{};
    std::array<Bytef, 16384> rest;
    auto* source = reinterpret_cast<const Bytef*>(bytes.data());
    stream.next_in = const_cast<Bytef*>(source); // NOLINT(cppcoreguidelines-pro-type-const-cast)
    stream.avail_in = static_cast<uInt>(bytes.size());
    if (inflateInit(&stream) != Z_OK) {
        return 0;
    }
    int state = Z_OK;
    while (state == Z_OK) {
        stream.next_out = rest.data();
        stream.avail_out = static_cast<uInt>(rest.size());
        state = inflate(&stream, Z_NO_FLUSH);
    }
    const std::size_t count = state == Z_STREAM_END ? stream.total_out : 0;
    inflateEnd(&stream);
    return count;
}

std::string wrapRows(fz_image* image, std::string_view bytes) {
    const std::size_t rowBytes =
        (static_cast<std::size_t>(image->w) * image->n * image->bpc + 7) / 8 + 1;
    if (countUnpacked(bytes) != rowBytes * static_cast<std::size_t>(image->h)) {
        return {}; // damaged: the parser of the document makes more of it than viewers do
    }
    PngHeader header;
    header.width = static_cast<std::uint32_t>(image->w);
    header.height = static_cast<std::uint32_t>(image->h);
    header.depth = image->bpc;
    header.colors = image->n == 3 ? PNGCOLORS_RGB : PNGCOLORS_GRAY;
    return wrapPng(header, reinterpret_cast<const unsigned char*>(bytes.data()), bytes.size());
}

} // namespace

std::string findStoredImage(fz_context* ctx, fz_image* image) {
    const fz_compressed_buffer* stored = fz_compressed_image_buffer(ctx, image);
    if (!stored || !stored->buffer) {
        return {};
    }
    const std::string_view bytes = getBytes(ctx, *stored);
    switch (stored->params.type) {
    case FZ_IMAGE_JPEG:
        return isShownJpeg(ctx, image, stored->params) ? std::string(bytes) : std::string();
    case FZ_IMAGE_PNG:
        return image->use_colorkey || image->imagemask ? std::string() : std::string(bytes);
    case FZ_IMAGE_FLATE:
        return isPngRows(ctx, image, stored->params) ? wrapRows(image, bytes) : std::string();
    default:
        return {};
    }
}

} // namespace DrawmereConvert
