/// What the header of an image file tells.
#pragma once

#include <cstdint>

namespace MoxGraphicService_NS {

/// The facts of a raster file that are known without its pixels.
struct GS_ImageInfo {
    int columns = 0; ///< as stored, before any orientation
    int rows = 0;
    int orientation = 1; ///< how the pixels are to be turned, 1 to 8, as Exif counts
    bool mayBeTransparent = false;
    double xResolution = 0.0; ///< in pixels an inch, 0 when not stated
    double yResolution = 0.0;

    /// Sets the size.
    /// Returns: false when it is nothing or beyond the limits, and the file must not be read on.
    bool setSize(std::uint64_t columnCount, std::uint64_t rowCount);

    /// Sets the resolution from pixels a unit and the inches of a unit; what is no sensible number
    /// leaves it unstated.
    void setResolution(double x, double y, double inches);

    /// Returns: whether the orientation makes columns of the rows.
    bool isTurned() const;
};

/// The least size at which somebody can use the pixels of a file, as stored.
struct GS_WantedSize {
    int columns;
    int rows;
};

} // namespace MoxGraphicService_NS
