/// Hands pages out to processes and collects what becomes of them.
#pragma once

#include "tools/convert/WorkerProcess.h"

#include <deque>
#include <vector>

namespace DrawmereConvert {

/// What a pool is asked to do.
struct PoolTask {
    std::vector<int> pages;     ///< counted from 0
    bool isOneDocument = false; ///< one process writes all pages, and must be told of the end
    int jobs = 1;
    double timeout = 0; ///< seconds until a page is given up; 0 for no limit
    /// Runs in the new process. Shape: a number that no other process of the pool has.
    std::function<std::unique_ptr<PageWriter>(int)> makeWriter;
    /// Called for each page, in the order in which they are done, which may be any. When one
    /// document is begun anew, for pages that were done before again.
    std::function<void(const PageOutcome&)> take;
};

/// Lives for one document.
class JobPool {
public:
    /// Borrows: both, for the life of the pool.
    JobPool(const PoolTask& poolTask, const InterruptGuard& interruptGuard);
    JobPool(const JobPool&) = delete;
    JobPool& operator=(const JobPool&) = delete;
    ~JobPool();

    /// Returns: false when it was interrupted.
    bool run();

private:
    using Worker = std::unique_ptr<WorkerProcess>;

    bool runAll();
    void handOut();
    bool isBusy() const;
    bool wait();
    void collect(Worker& worker);
    void handleLoss(Worker& worker, PageOutcome lost);
    void endOverdue();

    const PoolTask& task;
    const InterruptGuard& guard;
    std::deque<int> waiting;
    std::vector<int> done; // in the one document
    std::vector<Worker> workers;
    int roomCount = 0;
};

} // namespace DrawmereConvert
