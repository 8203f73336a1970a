/// What the painters of a page share.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/Layers.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/PaintColors.h"

#include <mupdf/fitz.h>

namespace DrawmereConvert {

/// All of it is borrowed.
struct PageTools {
    fz_context* ctx;
    const ConvertOptions& options;
    PageReport& report;
    Canvas& canvas;
    PaintColors& colors;
    Layers& layers;
};

} // namespace DrawmereConvert
