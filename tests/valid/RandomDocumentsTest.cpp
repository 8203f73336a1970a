// Whatever is drawn, in whatever order that the public header allows, is a valid document of its
// profile, but for a short list of things that are as they are on purpose.
#include "tests/support/RandomRun.h"
#include "tests/support/SvgValidator.h"
#include "tests/support/WholeRun.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <set>

namespace DrawmereTest {
namespace {

struct Profile {
    const char* name;
    SVGConfig::SVGTYPE number;
};

constexpr Profile profiles[] = {
    {"Full", SVGConfig::SVGTYPE_FULL},       {"Basic", SVGConfig::SVGTYPE_BASIC},
    {"Tiny", SVGConfig::SVGTYPE_TINY},       {"Wisp", SVGConfig::SVGTYPE_WISP},
    {"Plazmic", SVGConfig::SVGTYPE_PLAZMIC},
};

using Lengths = int[3];
constexpr Lengths callCounts = {40, 100, 300}; // short runs reach more of the rare endings

class RandomDocuments : public testing::TestWithParam<Profile> {
protected:
    /// Draws by one seed and validates what was written.
    void check(unsigned seed) {
        RandomCalls calls(seed, RandomCalls::ORDERLY);
        RandomRun run(calls);
        run.config.svgType = GetParam().number;
        for (const std::string& document : run.draw(callCounts[seed % std::size(callCounts)])) {
            judge(document, "seed " + std::to_string(seed));
        }
    }

    /// Does so with a document that has everything, what is rarely met by chance too.
    void checkWholeRun() {
        WholeRun run({.name = "whole", .profile = GetParam().number, .output = RunOptions::STREAM},
                     /*stopsAtErrors=*/true);
        std::ostringstream stream;
        run.draw(stream);
        judge(stream.str(), "the whole run");
    }

    void judge(const std::string& document, const std::string& name) {
        ++count;
        for (const std::string& fault : validator.listFaults(document)) {
            const SvgValidator::KnownFault* const known = validator.findKnown(fault);
            EXPECT_NE(known, nullptr) << name << ": " << fault;
            met.insert(known);
        }
    }

    SvgValidator validator{GetParam().number};
    std::set<const SvgValidator::KnownFault*> met;
    int count = 0;
};

#if defined(__SANITIZE_ADDRESS__)
constexpr unsigned usualSeeds = 150; // each takes ten times as long
#else
constexpr unsigned usualSeeds = 600;
#endif

/// Returns: how many seeds each profile has; the environment may ask for more.
unsigned countSeeds() {
    const char* const wish = std::getenv("DRAWMERE_RANDOM_DOCUMENTS");
    return wish ? static_cast<unsigned>(std::atoi(wish)) : usualSeeds;
}

TEST_P(RandomDocuments, AreValidButForTheKnownFaults) {
    const unsigned seeds = countSeeds();
    checkWholeRun();
    for (unsigned seed = 0; seed < seeds; ++seed) {
        check(seed);
    }
    RecordProperty("documents", count);
    EXPECT_GE(count, static_cast<int>(seeds * 9 / 10));
    for (const SvgValidator::KnownFault& known : SvgValidator::listKnownFaults()) {
        EXPECT_EQ(met.contains(&known), known.concerns(GetParam().number)) << known.reason;
    }
}

INSTANTIATE_TEST_SUITE_P(Profiles, RandomDocuments, testing::ValuesIn(profiles),
                         [](const auto& row) { return row.param.name; });

} // namespace
} // namespace DrawmereTest
