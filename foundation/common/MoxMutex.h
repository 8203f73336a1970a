/// Changes counters that several threads may share.
#pragma once

#include <atomic>
#include <sys/single_threaded.h>

namespace MoxCommonNS {

/// Counter changes that are plain while the process has one thread and atomic afterwards.
class MoxMutex {
public:
    /// Adds one to `count`. Returns: the new value.
    static int interlockedIncrement(int& count) {
        if (__libc_single_threaded) {
            return ++count;
        }
        return std::atomic_ref(count).fetch_add(1, std::memory_order_relaxed) + 1;
    }

    /// Takes one from `count`. Returns: the new value.
    static int interlockedDecrement(int& count) {
        if (__libc_single_threaded) {
            return --count;
        }
        return std::atomic_ref(count).fetch_sub(1, std::memory_order_acq_rel) - 1;
    }
};

} // namespace MoxCommonNS
