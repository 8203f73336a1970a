/// An image file of any form.
#pragma once

#include "DrawmereExport.h"
#include "foundation/graphicservice/GS_RasterImage.h"

#include <cstdint>
#include <iosfwd>

namespace MoxGraphicService_NS {

/// Tells by its content what the bytes of a stream are, and holds the raster image in them.
class DRAWMERE_API GS_Graphic {
public:
    /// Looks through the file in `source`, which begins at the stream's position 0, and leaves the
    /// stream there. No pixel is decoded: headers are read and checked; PNG is followed chunk by
    /// chunk with all checksums to its end, JPEG marker by marker, and so are the blocks of the
    /// first picture of a GIF and the chunks of a WebP.
    /// Shape: `resolution`, in pixels an inch, of files that state none.
    /// Borrows: `source`, for the life of this object.
    GS_Graphic(std::istream& source, float resolution);

    GS_Graphic(const GS_Graphic&) = delete;
    GS_Graphic& operator=(const GS_Graphic&) = delete;
    ~GS_Graphic();

    /// Returns: false for what is no image, is damaged, is of a form that can't be read, or has
    /// more pixels than `getPixelLimit`.
    bool Loaded() const;

    /// Returns: true for an image of pixels. An image that is none (SVG, PDF, PostScript, EMF, WMF)
    /// is known by its first bytes, and loaded only in so far.
    bool isRaster() const;

    /// Sets for the whole process how many pixels, width times height, an image may have that is
    /// read from then on. Numbers below 1 change nothing; a single side never exceeds 2^24.
    static void setPixelLimit(std::int64_t pixels);

    /// Returns: the limit, 256 times 1024 times 1024 unless it was set.
    static std::int64_t getPixelLimit();

    GS_RasterImage* raster = nullptr; ///< owned
    bool isLoaded = false;            ///< whether the source could be decoded
};

} // namespace MoxGraphicService_NS
