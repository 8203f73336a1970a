/// The numbers by which the graphic service is told what to do.
#pragma once

#include <cstdint>

namespace MoxGraphicService_NS {

/// What a raster file is: the kinds that `GS_RasterImage::getRasterKind` answers.
enum GS_RasterKind : std::int32_t {
    RASTERKIND_PNG = 0,
    RASTERKIND_JPEG = 1,
    RASTERKIND_GIF = 2,
    RASTERKIND_TIFF = 3,
    RASTERKIND_BMP = 4,
    RASTERKIND_WEBP = 5,
};

/// The form of a converted image.
enum GS_GraphicType : std::int32_t {
    GRAPHICTYPE_PNG = 0,
    GRAPHICTYPE_JPEG = 1,
};

/// From which form to which an image is written.
enum IMAGE_CONVERT_TYPE : std::int32_t {
    CONVERT_BMP_JPEG = 0,
    CONVERT_BMP_PNG = 1,
    CONVERT_GIF_JPEG = 7,
    CONVERT_GIF_PNG = 8,
    CONVERT_TIFF_JPEG = 13,
    CONVERT_TIFF_PNG = 14,
    CONVERT_WEBP_JPEG = 20,
    CONVERT_WEBP_PNG = 21,
    CONVERT_PNG_JPEG = 24,
    CONVERT_PNG_PNG = 25,
    CONVERT_JPEG_JPEG = 29,
};

/// How pixels are put together when an image gets fewer of them. Any other number reads as
/// `SAMPLINGTYPE_AVERAGE`. All of them work in linear light, with colours weighted by their alpha.
enum GSMP_SAMPLINGTYPE : std::int32_t {
    SAMPLINGTYPE_AVERAGE = 1, ///< the mean of the area that a new pixel covers
    SAMPLINGTYPE_LINEAR = 2,  ///< triangles, softer
    SAMPLINGTYPE_CUBIC = 3,   ///< Catmull-Rom, sharper
};

/// The length that a resolution counts pixels on. Any other number reads as an inch.
enum GS_ResolutionUnit : std::int32_t {
    RESOLUTIONUNIT_INCH = 1,
    RESOLUTIONUNIT_CENTIMETER = 2,
};

/// What kind of picture the pixels show: the classes that `GS_RasterImage::getImageClass` answers.
enum GS_ImageClass : std::int32_t {
    IMAGECLASS_UNKNOWN = 0,    ///< the pixels can't be read
    IMAGECLASS_BILEVEL = 1,    ///< two colours at most
    IMAGECLASS_DRAWING = 2,    ///< few colours or even areas: lines, text, charts
    IMAGECLASS_PHOTOGRAPH = 3, ///< many colours that change from pixel to pixel
};

/// Why an image could not be written.
enum GS_Failure : std::int32_t {
    FAILURE_NONE = 0,
    FAILURE_SOURCE = 1, ///< the file is damaged, lies about itself, or memory ran out
    FAILURE_TARGET = 2, ///< the target took no bytes, or the conversion asked for is none
};

} // namespace MoxGraphicService_NS
