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

} // namespace DrawmereNS
