/// A process that converts pages, one after the other.
#pragma once

#include "tools/convert/ForkedProcess.h"
#include "tools/convert/PageOutcome.h"

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace DrawmereConvert {

class InterruptGuard;
class PageWriter;

/// Forked off the program with the document open, so starting one costs little. What a page does to
/// it (a crash, an endless loop) is the loss of that page alone.
class WorkerProcess {
public:
    using Clock = std::chrono::steady_clock;

    /// Starts the process, which makes its writer first.
    /// Throws: std::system_error when there can be none.
    WorkerProcess(const std::function<std::unique_ptr<PageWriter>()>& makeWriter,
                  const InterruptGuard& guard);
    WorkerProcess(const WorkerProcess&) = delete;
    WorkerProcess& operator=(const WorkerProcess&) = delete;

    /// Ends the process, whatever it does.
    ~WorkerProcess();

    /// Has a page converted; a number below 0 ends the document of all pages.
    /// Units: `seconds`, after which `isOverdue` is true; 0 for never.
    void start(int page, double seconds);

    /// Returns: the page that it is busy with, nothing when it is idle.
    const std::optional<int>& getPage() const { return page; }

    /// Waits for the outcome of the page. Returns: nothing when the process has come to its end
    /// instead, for the reason that `describeEnd` tells.
    std::optional<PageOutcome> receive();

    /// Returns: how the process ended. It is idle then, and can't be used again.
    std::string describeEnd();

    bool isOverdue(Clock::time_point now) const { return page && now >= deadline; }

    Clock::time_point getDeadline() const { return deadline; }

    int getDescriptor() const { return process.channel; } ///< readable when there is an outcome

private:
    int end();

    ForkedProcess process;
    std::optional<int> page;
    Clock::time_point deadline = Clock::time_point::max();
};

} // namespace DrawmereConvert
