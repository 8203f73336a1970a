/// The device that MuPDF draws a page on.
#pragma once

#include "tools/convert/PagePainter.h"

#include <mupdf/fitz.h>

namespace DrawmereConvert {

/// Makes a device that hands on to `painter`. After the first exception it draws nothing more, and
/// the painter's `failure` holds it.
/// Borrows: `painter`, for the life of the device. Fails as MuPDF does: call it through `callFitz`.
fz_device* makePageDevice(fz_context* ctx, PagePainter* painter);

} // namespace DrawmereConvert
