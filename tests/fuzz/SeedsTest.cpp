// Every seed of the fuzz targets, and every input that once was a finding, keeps its property.
#include "tests/fuzz/Require.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <set>
#include <vector>

// Each target under the name that the build gives it here.
extern "C" {
int fuzz_calls(const std::uint8_t* data, std::size_t size);
int fuzz_fonts(const std::uint8_t* data, std::size_t size);
int fuzz_gzip(const std::uint8_t* data, std::size_t size);
int fuzz_images(const std::uint8_t* data, std::size_t size);
int fuzz_links(const std::uint8_t* data, std::size_t size);
int fuzz_options(const std::uint8_t* data, std::size_t size);
int fuzz_uris(const std::uint8_t* data, std::size_t size);
int fuzz_values(const std::uint8_t* data, std::size_t size);
}

namespace DrawmereTest {
namespace {

struct Target {
    std::string name;
    int (*run)(const std::uint8_t* data, std::size_t size);
};

const Target targets[] = {
    {"calls", fuzz_calls}, {"fonts", fuzz_fonts},     {"gzip", fuzz_gzip}, {"images", fuzz_images},
    {"links", fuzz_links}, {"options", fuzz_options}, {"uris", fuzz_uris}, {"values", fuzz_values},
};

const std::filesystem::path seedFolder = TEST_SOURCE_DIR "/fuzz/seeds";

/// Returns: the seeds of a target, files that other tests have among them.
std::vector<std::filesystem::path> listSeeds(const std::string& target) {
    std::vector<std::filesystem::path> files;
    for (const auto& folder :
         {seedFolder / target, std::filesystem::path(TEST_SOURCE_DIR "/data") / target}) {
        if (std::filesystem::is_directory(folder)) {
            std::copy(std::filesystem::directory_iterator(folder), {}, std::back_inserter(files));
        }
    }
    return files;
}

std::vector<std::uint8_t> readBytes(const std::filesystem::path& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

class Seeds : public testing::TestWithParam<Target> {};

TEST_P(Seeds, KeepTheProperty) {
    const std::vector<std::filesystem::path> seeds = listSeeds(GetParam().name);
    EXPECT_FALSE(seeds.empty());
    for (const std::filesystem::path& seed : seeds) {
        SCOPED_TRACE(seed.string());
        const std::vector<std::uint8_t> bytes = readBytes(seed);
        EXPECT_EQ(GetParam().run(bytes.data(), bytes.size()), 0);
    }
}

INSTANTIATE_TEST_SUITE_P(Of, Seeds, testing::ValuesIn(targets),
                         [](const auto& row) { return row.param.name; });

TEST(SeedFolders, AreThoseOfTheTargets) {
    std::set<std::string> names;
    for (const Target& target : targets) {
        names.insert(target.name);
    }
    std::set<std::string> folders;
    for (const auto& folder : std::filesystem::directory_iterator(seedFolder)) {
        folders.insert(folder.path().filename().string());
    }
    EXPECT_EQ(folders, names);
}

} // namespace
} // namespace DrawmereTest
