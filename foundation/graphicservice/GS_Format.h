/// The forms of image files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"
#include "foundation/graphicservice/GS_Types.h"

#include <string_view>

namespace MoxGraphicService_NS {

/// How a form of raster files is read.
struct GS_Format {
    GS_RasterKind kind;
    bool (*readInfo)(GS_Input& input, GS_ImageInfo& info);
    bool (*readPixels)(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize wanted,
                       GS_Bitmap& bitmap);
};

/// How many bytes of a file tell its form.
constexpr std::size_t formatHeadSize = 1024;

/// Returns: the form of the raster file that begins with `head`, null when it is none.
const GS_Format* findFormat(std::string_view head);

/// Returns: whether a file that begins with `head` is an image that is not made of pixels.
bool isVectorFile(std::string_view head);

} // namespace MoxGraphicService_NS
