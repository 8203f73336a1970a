#include "tests/structure/SourceTree.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace DrawmereTest {
namespace {

using Lines = std::vector<std::string>;

// What stands between the line `opening` and the next line `closing`.
Lines cutOut(const Lines& lines, const std::string& opening, const std::string& closing) {
    auto first = std::ranges::find(lines, opening);
    if (first != lines.end()) {
        ++first;
    }
    return {first, std::find(first, lines.end(), closing)};
}

TEST(Readme, ShowsTheProgramThatIsBuiltAndRun) {
    const Lines program = readLines("examples/hello.cpp");
    EXPECT_FALSE(program.empty());
    EXPECT_LE(program.size(), 20U);
    EXPECT_EQ(program, cutOut(readLines("README.md"), "```cpp", "```"));
}

} // namespace
} // namespace DrawmereTest
