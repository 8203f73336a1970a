#include "tests/structure/SourceTree.h"

#include <algorithm>
#include <filesystem>
#include <fstream>

namespace DrawmereTest {
namespace {

const std::filesystem::path root = std::filesystem::path(TEST_SOURCE_DIR).parent_path();

} // namespace

const std::vector<std::string> libraryFolders = {
    "config",  "draw", "fonts", "foundation", "frontend", "images",
    "include", "path", "post",  "refs",       "state",    "tree",
};

std::vector<std::string> findFiles(const std::string& folder,
                                   const std::vector<std::string>& endings) {
    std::vector<std::string> found;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(root / folder)) {
        const std::string ending = entry.path().extension().string();
        if (entry.is_regular_file() && std::ranges::count(endings, ending) > 0) {
            found.push_back(entry.path().lexically_relative(root).generic_string());
        }
    }
    std::ranges::sort(found);
    return found;
}

bool isFile(const std::string& path) { return std::filesystem::is_regular_file(root / path); }

std::vector<std::string> readLines(const std::string& path) {
    std::ifstream file(root / path);
    std::vector<std::string> lines;
    for (std::string line; std::getline(file, line);) {
        lines.push_back(line);
    }
    return lines;
}

} // namespace DrawmereTest
