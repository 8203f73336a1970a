/// The memory that a bench really takes up.
#pragma once

#include <cstddef>
#include <cstdio>
#include <malloc.h>
#include <unistd.h>

namespace DrawmereNS {

/// Returns: the bytes of memory that stand behind the process now, after free blocks went back.
inline std::size_t countResidentBytes() {
    malloc_trim(0);
    std::FILE* file = std::fopen("/proc/self/statm", "r");
    unsigned long total = 0;
    unsigned long resident = 0;
    if (file) {
        if (std::fscanf(file, "%lu %lu", &total, &resident) != 2) {
            resident = 0;
        }
        std::fclose(file);
    }
    return resident * static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
}

/// Begins to watch the largest count of resident bytes anew.
inline void resetPeakBytes() {
    if (std::FILE* file = std::fopen("/proc/self/clear_refs", "w")) {
        std::fputs("5", file);
        std::fclose(file);
    }
}

/// Returns: the most bytes of memory that have stood behind the process since the reset.
inline std::size_t countPeakBytes() {
    constexpr std::size_t kilobyte = 1024;
    unsigned long peak = 0;
    if (std::FILE* file = std::fopen("/proc/self/status", "r")) {
        char line[256];
        while (std::fgets(line, sizeof(line), file) &&
               std::sscanf(line, "VmHWM: %lu", &peak) != 1) {
        }
        std::fclose(file);
    }
    return peak * kilobyte;
}

} // namespace DrawmereNS
