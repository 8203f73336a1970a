#include "tests/support/Golden.h"

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <optional>
#include <sstream>

namespace DrawmereTest {
namespace {

constexpr std::ptrdiff_t maxLines = 40; // a golden document is to be read in one look

std::filesystem::path makePath(const std::string& name) {
    return std::filesystem::path(TEST_SOURCE_DIR) / "golden" / (name + ".svg");
}

std::optional<std::string> readGolden(const std::filesystem::path& path) {
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        return std::nullopt;
    }
    return std::string(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
}

testing::AssertionResult writeGolden(const std::filesystem::path& path, const std::string& text) {
    std::filesystem::create_directories(path.parent_path());
    std::ofstream file(path, std::ios::binary);
    file << text;
    if (!file.flush()) {
        return testing::AssertionFailure() << path << " can't be written";
    }
    return testing::AssertionSuccess();
}

bool updatesGolden() { return std::getenv("DRAWMERE_UPDATE_GOLDEN") != nullptr; }

} // namespace

std::string findDifference(const std::string& expected, const std::string& found) {
    std::istringstream expectedLines(expected);
    std::istringstream foundLines(found);
    for (int number = 1; expectedLines || foundLines; ++number) {
        std::string expectedLine;
        std::string foundLine;
        std::getline(expectedLines, expectedLine);
        std::getline(foundLines, foundLine);
        if (expectedLine != foundLine) {
            return "line " + std::to_string(number) + "\nexpected: " + expectedLine +
                   "\nfound:    " + foundLine + "\n";
        }
    }
    return expected == found ? "" : "the texts end differently\n";
}

testing::AssertionResult matchesGolden(const std::string& body, const std::string& name) {
    const std::string found = body.empty() ? body : body + "\n";
    if (std::count(found.begin(), found.end(), '\n') >= maxLines) {
        return testing::AssertionFailure() << name << " is too long for a golden document";
    }
    const std::filesystem::path path = makePath(name);
    if (updatesGolden()) {
        return writeGolden(path, found);
    }
    const std::optional<std::string> expected = readGolden(path);
    if (!expected) {
        return testing::AssertionFailure() << path << " is missing; the page holds\n" << found;
    }
    if (*expected == found) {
        return testing::AssertionSuccess();
    }
    return testing::AssertionFailure()
           << name << ", " << findDifference(*expected, found) << "all that was found:\n"
           << found;
}

} // namespace DrawmereTest
