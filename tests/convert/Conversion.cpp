#include "tests/convert/Conversion.h"

#include <algorithm>
#include <filesystem>

namespace DrawmereTest {

CommandResult Conversion::run(const std::vector<std::string>& words) const {
    std::vector<std::string> all = {"env", "-C", directory.path(), CONVERT};
    all.insert(all.end(), words.begin(), words.end());
    return runCommand(all);
}

CommandResult Conversion::runShell(const std::string& line) const {
    return runCommand({"env", "-C", directory.path(), "convert=" CONVERT, "bash", "-c", line});
}

std::vector<std::string> Conversion::list(const std::string& place) const {
    std::vector<std::string> names;
    std::error_code failure;
    for (const auto& entry : std::filesystem::directory_iterator(directory.path(place), failure)) {
        names.push_back(entry.path().filename().string());
    }
    std::ranges::sort(names);
    return names;
}

std::string Conversion::document(const std::string& name) {
    return TEST_SOURCE_DIR "/convert/documents/" + name;
}

} // namespace DrawmereTest
