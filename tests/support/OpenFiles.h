/// The files without a name that this process has open.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace DrawmereTest {

/// Returns: paths by which the unnamed files in `directory` can be opened again.
inline std::vector<std::string> findOpenFiles(const std::string& directory) {
    std::vector<std::string> found;
    for (const auto& entry : std::filesystem::directory_iterator("/proc/self/fd")) {
        std::error_code failure;
        const std::string target = std::filesystem::read_symlink(entry.path(), failure).string();
        if (target.starts_with(directory + "/") && target.ends_with(" (deleted)")) {
            found.push_back(entry.path().string());
        }
    }
    return found;
}

/// Returns: how many there are.
inline int countOpenFiles(const std::string& directory) {
    return static_cast<int>(findOpenFiles(directory).size());
}

/// Takes from each of them all bytes behind the first `size`.
inline void cutOpenFiles(const std::string& directory, std::uintmax_t size) {
    for (const std::string& path : findOpenFiles(directory)) {
        std::filesystem::resize_file(path, size);
    }
}

} // namespace DrawmereTest
