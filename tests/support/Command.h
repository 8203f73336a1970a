/// Runs the programs that judge documents from outside.
#pragma once

#include <string>
#include <vector>

namespace DrawmereTest {

/// What a program said.
struct CommandResult {
    int status = -1;    ///< its exit status, -1 when it could not be run or was ended by a signal
    std::string output; ///< the bytes of both its output and its error stream
};

/// Runs a program to its end.
/// Shape: `words`, the program, looked up in the path, and its arguments; no shell reads them.
CommandResult runCommand(const std::vector<std::string>& words);

} // namespace DrawmereTest
