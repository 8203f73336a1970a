/// Places images.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/ImageEncoder.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/PaintColors.h"

#include <mupdf/fitz.h>

#include <compare>
#include <map>
#include <string>

namespace DrawmereConvert {

/// Draws images of one page, each stored once in it.
class ImageWriter {
public:
    ImageWriter(fz_context* context, const ConvertOptions& chosen, Canvas& target,
                PageReport& pageReport)
        : ctx(context), options(chosen), canvas(target), report(pageReport) {}

    ImageWriter(const ImageWriter&) = delete;
    ImageWriter& operator=(const ImageWriter&) = delete;
    ~ImageWriter();

    /// Draws `image` where `matrix` puts the unit square. Shape: `mask` gives its alpha, or is
    /// null.
    void draw(fz_image* image, fz_image* mask, const fz_matrix& matrix, float alpha, COLORUSE use);

    /// Returns: whether the file of `image` goes into the document as it is and is so much smaller
    /// than its pixels that a mask is better kept apart.
    bool isPhotograph(fz_image* image) const;

    /// Draws the shape of the mask `image` in one colour.
    void drawStencil(fz_image* image, const fz_matrix& matrix, const MoxColor& color);

    /// Draws pixels that belong to no image of the document.
    void drawPixels(const ImagePixels& pixels, const fz_matrix& matrix, float alpha, COLORUSE use);

private:
    /// What decides how the file of an image looks.
    struct ImageKey {
        auto operator<=>(const ImageKey&) const = default;

        fz_image* image = nullptr; // kept
        fz_image* mask = nullptr;  // kept
        COLORUSE use = COLORUSE_PICTURE;
        std::uint32_t color = 0;
        int zoom = 1;
    };

    struct ImageFile {
        std::string bytes;
        UnicodeString name;
        bool isLinked = false; ///< the name says where it lies
    };

    const ImageFile& findFile(const ImageKey& key);
    bool isLinkedFile(const std::string& bytes) const;
    std::string makeBytes(const ImageKey& key);
    std::string decode(const ImageKey& key);
    std::string packBitmap(std::string bytes);
    UnicodeString makeName(const std::string& bytes);
    void place(const ImageFile& file, const fz_matrix& matrix, float alpha);
    void drawUnit(const ImageFile& file, float width, float height, float x, float y);

    fz_context* ctx;
    const ConvertOptions& options;
    Canvas& canvas;
    PageReport& report;
    std::map<ImageKey, ImageFile> files;
};

} // namespace DrawmereConvert
