/// Writes JPEG files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_Output.h"
#include "foundation/graphicservice/GS_WriteOptions.h"

namespace MoxGraphicService_NS {

/// Writes `bitmap` as a baseline JPEG file, transparent pixels on white, with its profile and the
/// resolution.
/// Returns: false when the output takes no bytes, memory ran out, or a side is longer than the
/// 65,500 pixels that the encoder takes.
bool writeJpeg(const GS_Bitmap& bitmap, const GS_WriteOptions& options, GS_Output& output);

} // namespace MoxGraphicService_NS
