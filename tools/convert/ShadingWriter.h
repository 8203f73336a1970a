/// Shadings as gradients and as images.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/ImagePixels.h"
#include "tools/convert/PaintColors.h"
#include "tools/convert/ShadingStops.h"

#include <mupdf/fitz.h>

#include <vector>

namespace DrawmereConvert {

/// Defines gradients in one document; one that comes again is found again.
class ShadingWriter {
public:
    ShadingWriter(fz_context* context, Canvas& target, PaintColors& paintColors)
        : ctx(context), canvas(target), colors(paintColors) {}

    ShadingWriter(const ShadingWriter&) = delete;
    ShadingWriter& operator=(const ShadingWriter&) = delete;
    ~ShadingWriter();

    /// Defines a gradient that shows `shade`. Returns: its id, empty when no gradient does.
    UnicodeString define(fz_shade* shade, const fz_matrix& matrix);

    /// Draws the part `area` of `shade` as pixels.
    PlacedPixels draw(fz_shade* shade, const fz_matrix& matrix, const fz_rect& area, int dpi);

private:
    struct Circle {
        float x = 0;
        float y = 0;
        float r = 0;
    };

    struct Defined {
        fz_shade* shade; // kept
        fz_matrix matrix;
        COLORUSE use;
        UnicodeString id;
    };

    UnicodeString make(const fz_shade& shade, const fz_matrix& matrix);
    UnicodeString makeLinear(const fz_shade& shade, const fz_matrix& matrix);
    UnicodeString makeRadial(const fz_shade& shade, const fz_matrix& matrix);
    void writeStops(const std::vector<ShadingStop>& stops, bool startsEmpty, bool endsEmpty);

    fz_context* ctx;
    Canvas& canvas;
    PaintColors& colors;
    std::vector<Defined> defined;
};

} // namespace DrawmereConvert
