/// Converts all documents of a run.
#pragma once

#include "tools/convert/RunOptions.h"

namespace DrawmereConvert {

/// Returns: an `EXITSTATUS`. A signal that ends the program takes effect when all is cleaned up.
int runProgram(const RunOptions& options);

} // namespace DrawmereConvert
