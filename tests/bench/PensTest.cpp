#include "tests/support/Command.h"
#include "tests/support/Picture.h"
#include "tests/support/TempDir.h"
#include "tests/support/TinyImages.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace DrawmereTest {
namespace {

using Words = std::vector<std::string>;

constexpr const char* peers[] = {"plain", "mupdf", "qt", "cairo"};
constexpr PixelBox page = {0, 0, 595, 842};

/// Edges move a little, as numbers are rounded in different places; some write text as outlines
/// with advances of their own; the pixels of an image that is not stretched are exact.
struct WorkloadRow {
    const char* name;
    int tolerance; ///< in a channel
    bool hasClips = false;
};

constexpr WorkloadRow workloads[] = {
    {"rects", 32},
    {"paths", 32},
    {"text", 64},
    {"state", 32},
    {"mixed", 64, /*hasClips=*/true},
    {"mixed1", 64, /*hasClips=*/true},
    {"images", 0},
    {"imagesdup", 0},
};

bool isBuilt(const std::string& writer) {
    return std::filesystem::exists(std::string(PENS) + writer);
}

// The generator of Qt 5 leaves clips out.
bool canDraw(const std::string& writer, const WorkloadRow& row) {
    return isBuilt(writer) && !(row.hasClips && writer == "qt");
}

// A thousandth of the workload as one writer draws it.
std::string draw(const std::string& writer, const std::string& workload) {
    const TempDir directory;
    std::filesystem::create_directory(directory.path("out"));
    Words words = {PENS + writer, workload, "1000", directory.path("out")};
    for (const bool hasAlpha : {false, true}) {
        const std::string name = hasAlpha ? "alpha.png" : "opaque.png";
        directory.write(name, makePng(100, 80, hasAlpha));
        words.push_back(directory.path(name));
    }
    const CommandResult result = runCommand(words);
    EXPECT_EQ(0, result.status) << result.output;
    return directory.read("out/page1.svg");
}

class Pens : public testing::TestWithParam<WorkloadRow> {};

TEST_P(Pens, DrawTheSamePicture) {
    constexpr double largestShare = 0.0005;
    const WorkloadRow& row = GetParam();
    const Picture ours(draw("drawmere", row.name));
    EXPECT_LT(7000, ours.countInk());
    for (const std::string peer : peers) {
        if (canDraw(peer, row)) {
            const Picture theirs(draw(peer, row.name));
            const double share = ours.differenceShare(theirs, page, row.tolerance);
            EXPECT_LE(share, row.tolerance == 0 ? 0.0 : largestShare) << peer;
        }
    }
}

TEST_P(Pens, KeepTheElementsOfThePlainWriterInATree) {
    if (!isBuilt("pugixml")) {
        GTEST_SKIP() << "pugixml is not installed";
    }
    std::string plain = draw("plain", GetParam().name);
    std::string tree = draw("pugixml", GetParam().name);
    std::erase(plain, '\n');
    std::erase(tree, '\n');
    EXPECT_EQ(plain, tree);
}

INSTANTIATE_TEST_SUITE_P(Workloads, Pens, testing::ValuesIn(workloads),
                         [](const auto& row) { return std::string(row.param.name); });

} // namespace
} // namespace DrawmereTest
