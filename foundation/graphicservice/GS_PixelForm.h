/// The smallest form in which a PNG file holds pixels without loss.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"

#include <cstdint>
#include <vector>

namespace MoxGraphicService_NS {

/// What the pixels of a bitmap need: those of a converted GIF or fax are mostly of few colours.
class GS_PixelForm {
public:
    /// Looks at all pixels of `bitmap`.
    explicit GS_PixelForm(const GS_Bitmap& bitmap);

    /// Writes row `y` in this form, one sample a byte.
    /// Shape: `target`, as many bytes as the row of the bitmap has.
    void convertRow(const GS_Bitmap& bitmap, int y, std::uint8_t* target) const;

    int channels;                      ///< as those of a bitmap; 1 with a palette
    int depth = 8;                     ///< bits of a sample: fewer only for grey or a palette
    std::vector<std::uint32_t> colors; ///< the palette, 0xAARRGGBB, transparent ones first, or none

private:
    void dropAlpha(const GS_Bitmap& bitmap);
    void dropColor(const GS_Bitmap& bitmap);
    void collectColors(const GS_Bitmap& bitmap);
    void reduceDepth();
    void index(const GS_Bitmap& bitmap, int y, std::uint8_t* target) const;
};

} // namespace MoxGraphicService_NS
