/// A document's file, for a reader that forks.
#pragma once

#include "tools/convert/FitzCall.h"

namespace DrawmereConvert {

/// Opens the file `path` as a stream that keeps its own place in the file. Processes that were
/// forked off with an open stream of the usual kind share one place, and move it under each other's
/// feet.
/// Throws: as MuPDF does, by a jump.
fz_stream* openSharedFile(fz_context* ctx, const char* path);

} // namespace DrawmereConvert
