/// The words of the command line.
#pragma once

#include "tools/convert/RunOptions.h"

#include <optional>

namespace DrawmereConvert {

/// What the command line asks for.
struct CommandLine {
    /// Nothing when the program ends with `status` at once; why has been said then.
    std::optional<RunOptions> options;
    int status = EXITSTATUS_DONE;
};

/// Reads the arguments of `main`. Prints help, the version or what is wrong with the arguments.
CommandLine readCommandLine(int argc, const char* const* argv);

} // namespace DrawmereConvert
