#include "tools/convert/JobPool.h"

#include "tools/convert/InterruptGuard.h"
#include "tools/convert/PageConfig.h"
#include "tools/convert/PageWriter.h"

#include <algorithm>

#include <poll.h>

namespace DrawmereConvert {
namespace {

using Clock = WorkerProcess::Clock;

constexpr int endOfDocument = -1;

// A page that is told to end has as long again to do so, and to be written as far as it came.
constexpr double patience = 2;

timespec toTimespec(Clock::duration span) {
    const auto seconds = std::chrono::floor<std::chrono::seconds>(span);
    const auto rest = std::chrono::duration_cast<std::chrono::nanoseconds>(span - seconds);
    return {seconds.count(), rest.count()};
}

} // namespace

JobPool::JobPool(const PoolTask& poolTask, const InterruptGuard& interruptGuard)
    : task(poolTask), guard(interruptGuard), waiting(task.pages.begin(), task.pages.end()) {
    const int jobs = task.isOneDocument ? 1 : task.jobs;
    workers.resize(std::min<std::size_t>(static_cast<std::size_t>(jobs), task.pages.size()));
}

JobPool::~JobPool() = default;

bool JobPool::run() {
    bool isDone = runAll();
    if (isDone && task.isOneDocument) {
        waiting = {endOfDocument};
        isDone = runAll();
    }
    workers.clear();
    return isDone;
}

bool JobPool::runAll() {
    for (;;) {
        handOut();
        if (!isBusy()) {
            return true;
        }
        if (!wait()) {
            return false;
        }
        endOverdue();
    }
}

void JobPool::handOut() {
    for (Worker& worker : workers) {
        if (waiting.empty()) {
            return;
        }
        if (worker && worker->getPage()) {
            continue;
        }
        if (!worker) {
            const int room = roomCount++;
            worker = std::make_unique<WorkerProcess>([&] { return task.makeWriter(room); }, guard);
        }
        const int page = waiting.front();
        waiting.pop_front();
        worker->start(page, page < 0 ? 0 : task.timeout * patience);
    }
}

bool JobPool::isBusy() const {
    return std::ranges::any_of(workers,
                               [](const Worker& worker) { return worker && worker->getPage(); });
}

/// Waits until there is something to collect, and collects it. Returns: false on an interrupt.
bool JobPool::wait() {
    std::vector<pollfd> channels;
    Clock::time_point deadline = Clock::time_point::max();
    for (const Worker& worker : workers) {
        const bool isWatched = worker && worker->getPage();
        channels.push_back({isWatched ? worker->getDescriptor() : -1, POLLIN, 0});
        deadline = isWatched ? std::min(deadline, worker->getDeadline()) : deadline;
    }
    const bool isLimited = deadline != Clock::time_point::max();
    const timespec span =
        toTimespec(isLimited ? std::max(deadline - Clock::now(), Clock::duration::zero())
                             : Clock::duration::zero());
    const int count =
        ppoll(channels.data(), channels.size(), isLimited ? &span : nullptr, guard.getWaitMask());
    if (guard.isInterrupted()) {
        return false;
    }
    for (std::size_t i = 0; count > 0 && i < workers.size(); ++i) {
        if (channels[i].revents != 0) {
            collect(workers[i]);
        }
    }
    return true;
}

void JobPool::collect(Worker& worker) {
    PageOutcome lost;
    lost.page = worker->getPage().value_or(endOfDocument);
    const std::optional<PageOutcome> outcome = worker->receive();
    if (!outcome) {
        noteFault(lost, worker->describeEnd());
        handleLoss(worker, lost);
        return;
    }
    if (task.isOneDocument && outcome->page >= 0) {
        done.push_back(outcome->page);
    }
    task.take(*outcome);
}

/// What was in the one document before is lost with the process and begun anew, without the page.
void JobPool::handleLoss(Worker& worker, PageOutcome lost) {
    worker.reset();
    task.take(lost);
    if (lost.page >= 0) {
        waiting.insert(waiting.begin(), done.begin(), done.end());
        done.clear();
    }
}

void JobPool::endOverdue() {
    const Clock::time_point now = Clock::now();
    for (Worker& worker : workers) {
        if (worker && worker->isOverdue(now)) {
            PageOutcome lost;
            lost.page = *worker->getPage();
            lost.isLate = true;
            noteFault(lost, "it takes too long");
            handleLoss(worker, lost);
        }
    }
}

} // namespace DrawmereConvert
