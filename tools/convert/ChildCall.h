/// A call in a process of its own.
#pragma once

#include <functional>
#include <string>

namespace DrawmereConvert {

/// What became of such a call.
struct ChildResult {
    bool isDone = false;
    std::string bytes; ///< what the call returned
    /// Why it is not done, when the process has not had time to say it itself.
    std::string reason;
};

/// Runs `call` in a process that is forked off and sees all that this one has, so that a crash or
/// an endless loop is the loss of its result alone.
/// Units: `seconds` until the process is ended; 0 for no limit.
/// Throws: std::system_error when there can be no process.
ChildResult callApart(const std::function<std::string()>& call, double seconds);

} // namespace DrawmereConvert
