/// The decoded pixels of an image.
#pragma once

#include <mupdf/fitz.h>

#include <cstdint>
#include <memory>
#include <vector>

namespace DrawmereConvert {

/// Pixels as 0xAARRGGBB, colours not multiplied by alpha; those of a mask are white.
class ImagePixels {
public:
    /// Decodes `image`, of its own size. Empty when it can't be decoded.
    ImagePixels(fz_context* context, fz_image* image);

    /// Takes decoded pixels over.
    ImagePixels(fz_context* context, fz_pixmap* pixels) : ctx(context), pixmap(pixels) {}

    ImagePixels(const ImagePixels&) = delete;
    ImagePixels& operator=(const ImagePixels&) = delete;
    ~ImagePixels();

    bool isEmpty() const { return !pixmap; }

    int getWidth() const { return pixmap->w; }

    int getHeight() const { return pixmap->h; }

    void readRow(int y, std::vector<std::uint32_t>& row) const;

    /// Reads the row as a mask: the alpha of an image without colours, else its brightness.
    void readMaskRow(int y, std::vector<std::uint8_t>& row) const;

private:
    void decode(fz_image* image);
    void convertToPlain();

    const unsigned char* getRow(int y) const { return pixmap->samples + y * pixmap->stride; }

    fz_context* ctx;
    fz_pixmap* pixmap = nullptr; // owned: grey, RGB or alpha alone
};

/// Pixels of a part of the page.
struct PlacedPixels {
    PlacedPixels() = default;

    /// Takes over `pixels`, `scale` of which are a point long; they know where they are.
    PlacedPixels(fz_context* context, fz_pixmap* pixels, float scale);

    std::unique_ptr<ImagePixels> pixels; ///< null when nothing could be drawn
    fz_matrix matrix = fz_identity;      ///< where the unit square goes
};

} // namespace DrawmereConvert
