#include "bench/BenchFile.h"

#include <filesystem>
#include <stdexcept>
#include <system_error>

#include <stdlib.h> // mkdtemp is no part of standard C++
#include <unistd.h>

namespace DrawmereNS {
namespace {

std::filesystem::path findPlace() {
    const char* memory = "/dev/shm";
    return access(memory, W_OK) == 0 ? memory : std::filesystem::temp_directory_path();
}

} // namespace

BenchFile::BenchFile() : directory(findPlace() / "drawmere-bench-XXXXXX") {
    if (!mkdtemp(directory.data())) {
        throw std::runtime_error("no directory for the output");
    }
    path = directory + "/bench.svg";
}

BenchFile::~BenchFile() {
    std::error_code failure;
    std::filesystem::remove_all(directory, failure);
}

std::size_t BenchFile::getSize() const {
    std::error_code failure;
    const std::uintmax_t size = std::filesystem::file_size(path, failure);
    return failure ? 0 : static_cast<std::size_t>(size);
}

} // namespace DrawmereNS
