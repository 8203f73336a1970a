/// Turns the colours of documents into those of SVG.
#pragma once

#include "tools/convert/Canvas.h"

#include <mupdf/fitz.h>

#include <array>
#include <optional>

namespace DrawmereConvert {

/// What colours are for.
enum COLORUSE : std::int32_t {
    COLORUSE_PICTURE = 0,    ///< to be seen
    COLORUSE_LUMINOSITY = 1, ///< to mask by their brightness, so they become greys of the same
    COLORUSE_ALPHA = 2,      ///< to mask by their opacity, so they become white
};

/// Converts colours, and remembers the last one, since colours come in rows.
class PaintColors {
public:
    explicit PaintColors(fz_context* context) : ctx(context) {}

    PaintColors(const PaintColors&) = delete;
    PaintColors& operator=(const PaintColors&) = delete;
    ~PaintColors();

    /// Returns: the colour of `numbers` in `space`; black when it can't be converted. A null
    /// `space` is grey.
    MoxColor convert(fz_colorspace* space, const float* numbers, float alpha,
                     const fz_color_params& params);

    COLORUSE use = COLORUSE_PICTURE;
    std::optional<MoxColor> forced; ///< what all colours become

private:
    bool isLast(fz_colorspace* space, const float* numbers, int count) const;

    fz_context* ctx;
    fz_colorspace* lastSpace = nullptr; // kept, so that no other gets its address
    COLORUSE lastUse = COLORUSE_PICTURE;
    std::array<float, FZ_MAX_COLORS> lastNumbers{};
    std::array<float, 3> lastColor{};
};

} // namespace DrawmereConvert
