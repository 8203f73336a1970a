/// Processes that are forked off this one, each with a channel to it.
#pragma once

#include <functional>
#include <string>

#include <sys/types.h>

namespace DrawmereConvert {

/// A process and this side's end of the channel. Who has it closes the channel and waits for the
/// process.
struct ForkedProcess {
    pid_t id = -1;
    int channel = -1; ///< both ways
};

/// Forks a process off that sees all that this one has. It calls `run` with its end of the channel,
/// and ends when that returns (with 0) or throws (with 1), or when this process ends.
/// Throws: std::system_error when there can be no process.
ForkedProcess forkOff(const std::function<void(int channel)>& run);

/// Waits until the process has ended. Returns: its state as `waitpid` gives it.
int waitFor(pid_t process);

/// Returns: how a process ended that a signal put an end to, by its state.
std::string describeBreak(int state);

} // namespace DrawmereConvert
