/// A raster image that is written anew.
#pragma once

#include "DrawmereExport.h"
#include "foundation/graphicservice/GS_Types.h"

#include <iosfwd>

namespace MoxGraphicService_NS {

/// An image of pixels behind a stream. What a header tells is known from the start; the pixels are
/// read when something first asks for them. That reading may then find the file damaged: no call
/// throws, `getFailure` tells.
class DRAWMERE_API GS_RasterImage {
public:
    GS_RasterImage(const GS_RasterImage&) = delete;
    GS_RasterImage& operator=(const GS_RasterImage&) = delete;

    /// Returns: the form of the file, a `GS_RasterKind`.
    virtual int getRasterKind() = 0;

    /// Writes the image as PNG or JPEG, as `type` says, with the sampling and resolution set
    /// before. The orientation that a file asks for is worked into the pixels. JPEG shows
    /// transparent pixels on white. A colour profile is kept where it fits the pixels written.
    /// Shape: `quality`, 1 to 100 and brought into these bounds, for JPEG alone.
    /// Nothing is written when the pixels can't be read; `getFailure` tells the reason.
    virtual void writeToStream(std::ostream& target, IMAGE_CONVERT_TYPE type, int quality) = 0;

    /// Writes the same into the file `path`, UTF-8, which is made or replaced. On failure there is
    /// no such file afterwards; one that stood there stays when the source was at fault.
    virtual void writeToFile(const char* path, IMAGE_CONVERT_TYPE type, int quality) = 0;

    /// Returns: what kind of picture this is, a `GS_ImageClass`. Reads the pixels.
    virtual int getImageClass() = 0;

    virtual ~GS_RasterImage();

    /// Reads the pixels unless they are there already.
    /// Returns: false when that fails, and `getFailure` answers `FAILURE_SOURCE` from then on.
    virtual bool load() = 0;

    /// Returns: whether any pixel is not opaque. For a PNG the header is asked: whether one may be.
    /// Reads the pixels of other files whose header says that one may be; true when that fails.
    bool hasTransparency() const;

    /// Returns: the width in pixels as the image is to be shown, that is with the orientation
    /// applied that the file asks for; a downsampling set changes nothing here.
    int Columns() const;

    /// Returns: the height in pixels, in the same way.
    int Rows() const;

    /// Sets the size in pixels at which the image is written. Neither side is ever enlarged, and
    /// none falls below 1.
    void gl_setDownsample(int width, int height, GSMP_SAMPLINGTYPE type);

    /// Sets the resolution that the written file states. Numbers below 1 state none. Without this
    /// call the written file states that of the source.
    void gl_setResolution(int x, int y, GS_ResolutionUnit unit);

    /// Returns: the first reason for which reading or writing failed.
    GS_Failure getFailure() const;

    int columns = 0;                                       ///< in pixels, as shown
    int rows = 0;                                          ///< in pixels, as shown
    int targetColumns = 0;                                 ///< 0 while no downsampling is set
    int targetRows = 0;                                    ///< likewise
    GSMP_SAMPLINGTYPE samplingType = SAMPLINGTYPE_AVERAGE; ///< of the downsampling
    double xResolution = 0.0;                              ///< in pixels an inch, 0 for none
    double yResolution = 0.0;                              ///< likewise
    GS_Failure failure = FAILURE_NONE;                     ///< the first, as `getFailure` gives it

protected:
    /// Shape: the size in pixels as shown.
    GS_RasterImage(int columnCount, int rowCount);

    /// Answers `hasTransparency`.
    virtual bool findTransparency() const = 0;
};

} // namespace MoxGraphicService_NS
