/// Writes PNG files.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_Output.h"
#include "foundation/graphicservice/GS_WriteOptions.h"

namespace MoxGraphicService_NS {

/// Writes `bitmap` as a PNG file in the smallest form that loses nothing, with its profile and the
/// resolution.
/// Returns: false when the output takes no bytes or memory ran out.
bool writePng(const GS_Bitmap& bitmap, const GS_WriteOptions& options, GS_Output& output);

} // namespace MoxGraphicService_NS
