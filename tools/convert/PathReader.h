/// Reads paths of MuPDF.
#pragma once

#include "tools/convert/PathData.h"

#include <mupdf/fitz.h>

namespace DrawmereConvert {

/// Appends `path`, with `matrix` applied, to `data`.
/// Throws: std::bad_alloc.
void readPath(fz_context* ctx, const fz_path* path, const fz_matrix& matrix, PathData& data);

} // namespace DrawmereConvert
