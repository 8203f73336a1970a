/// Holds signals that end the program back until it has cleaned up.
#pragma once

#include <csignal>

namespace DrawmereConvert {

/// While it lives, an interrupt, a termination or a hang-up takes effect only where the program
/// waits with `getWaitMask`, and is then noted and no more.
class InterruptGuard {
public:
    InterruptGuard();
    InterruptGuard(const InterruptGuard&) = delete;
    InterruptGuard& operator=(const InterruptGuard&) = delete;

    /// Takes everything back. A signal that came meanwhile ends the program here, as it would have.
    ~InterruptGuard();

    /// Takes everything back in a process that was forked off.
    void disarm() const;

    /// Returns: whether such a signal was noted.
    bool isInterrupted() const;

    /// Returns: the signal mask to wait with.
    const sigset_t* getWaitMask() const { return &maskBefore; }

private:
    static constexpr int signals[] = {SIGINT, SIGTERM, SIGHUP};
    static constexpr int signalCount = 3;

    sigset_t maskBefore = {};
    struct sigaction actionsBefore[signalCount] = {};
};

} // namespace DrawmereConvert
