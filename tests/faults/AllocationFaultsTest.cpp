// Memory gives out at every place there is, and at all that follow: nothing crashes or leaks, what
// is lost is reported, and the next run is as good as ever.
#include "foundation/fontservice/FS_FaceCache.h"
#include "images/SVGImageText.h"
#include "tests/faults/MemoryFaults.h"
#include "tests/support/Gunzip.h"
#include "tests/support/OpenFiles.h"
#include "tests/support/TempDir.h"
#include "tests/support/WholeRun.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <sstream>

namespace DrawmereTest {
namespace {

constexpr RunOptions runs[] = {
    {.name = "Full", .profile = SVGConfig::SVGTYPE_FULL, .output = RunOptions::PAGES},
    {.name = "FullCompressed",
     .profile = SVGConfig::SVGTYPE_FULL,
     .output = RunOptions::SINGLE_FILE,
     .gzip = true},
    {.name = "Basic",
     .profile = SVGConfig::SVGTYPE_BASIC,
     .output = RunOptions::STREAM,
     .encoding = u"ISO-8859-1"},
    {.name = "Tiny",
     .profile = SVGConfig::SVGTYPE_TINY,
     .output = RunOptions::PAGES,
     .copiesImages = true},
    {.name = "SmallDevice",
     .profile = SVGConfig::SVGTYPE_TINY,
     .output = RunOptions::SINGLE_FILE,
     .wispMode = true},
    {.name = "Plazmic",
     .profile = SVGConfig::SVGTYPE_PLAZMIC,
     .output = RunOptions::STREAM,
     .gzip = true},
};

std::string nameRun(const testing::TestParamInfo<RunOptions>& info) { return info.param.name; }

/// What is told when memory gives out where the library goes on or a stream tells it.
const std::set<int> expectedCodes = {16405, 16414, 16929, 16931, 16932, 16940, 16941, 16942, 16943};

RunOutcome runOnce(const RunOptions& options, MemoryFaults::Mode mode, std::size_t number,
                   bool stops) {
    MoxFontService_NS::FS_FaceCache::shared().clear(); // so that each run opens its faces
    WholeRun run(options, stops);
    std::ostringstream target;
    {
        const MemoryFaults faults(mode, number);
        run.draw(target);
    }
    RunOutcome outcome = run.collect();
    if (options.output == RunOptions::STREAM) {
        outcome.files["stream"] = target.str();
    }
    return outcome;
}

bool areExpected(const std::set<int>& codes) {
    return std::includes(expectedCodes.begin(), expectedCodes.end(), codes.begin(), codes.end());
}

std::string describe(const std::set<int>& codes) {
    std::string text;
    for (const int code : codes) {
        text += " " + std::to_string(code);
    }
    return text;
}

class AllocationFaults : public testing::TestWithParam<RunOptions> {
protected:
    AllocationFaults() {
        // The first runs fill what the process keeps.
        runOnce(GetParam(), MemoryFaults::ONE, 0, /*stops=*/true);
        runClean();
        reference = runClean();
        EXPECT_TRUE(reference.thrown.empty())
            << describe(reference.thrown) + describe(reference.queued);
        EXPECT_EQ(reference.others, "");
    }

    RunOutcome runClean() {
        RunOutcome outcome = runOnce(GetParam(), MemoryFaults::NONE, 0, /*stops=*/true);
        count = MemoryFaults::countAsked();
        return outcome;
    }

    /// Lets one allocation fail, or all from one on. Returns: what is wrong with what follows,
    /// nothing when all is well.
    std::string check(MemoryFaults::Mode mode, std::size_t number) {
        const bool stops = number % 2 == 0;
        const std::ptrdiff_t before = MemoryFaults::countLive();
        RunOutcome outcome = runOnce(GetParam(), mode, number, stops);
        std::string faults = judge(outcome);
        outcome = RunOutcome();
        if (runClean().files != reference.files) {
            faults += "the next run differs, ";
        }
        if (!faults.empty()) {
            return faults;
        }
        const std::ptrdiff_t leaked = MemoryFaults::countLive() - before;
        return leaked > 0 ? std::to_string(leaked) + " blocks are not freed" : "";
    }

    std::string judge(const RunOutcome& outcome) const {
        std::string faults;
        if (!outcome.others.empty()) {
            faults += outcome.others + " is thrown, ";
        }
        for (const std::set<int>* codes : {&outcome.thrown, &outcome.queued}) {
            faults += areExpected(*codes) ? "" : describe(*codes) + " are told, ";
        }
        if (!isReported(outcome) && outcome.files != reference.files) {
            faults += "a loss is not told, ";
        }
        // What was finished is a document, whatever had been lost from it before.
        for (const auto& [name, bytes] : outcome.files) {
            if (outcome.isFinished && !name.starts_with("images/") && !isDocument(bytes)) {
                faults += name + " is no document, ";
            }
        }
        return faults;
    }

    /// Returns: whether more is told than that a profile lacks something.
    bool isReported(const RunOutcome& outcome) const {
        return outcome.memoryErrors > 0 || !outcome.thrown.empty() ||
               outcome.queued != reference.queued;
    }

    static bool isDocument(const std::string& bytes) {
        return readXml(GetParam().gzip ? gunzip(bytes) : bytes).error.empty();
    }

    /// Checks every `stride`th allocation, or all of them when the environment asks for that.
    void walk(MemoryFaults::Mode mode, std::size_t usualStride) {
        const std::size_t stride = std::getenv("DRAWMERE_EVERY_FAULT") ? 1 : usualStride;
        const std::size_t last = count;
        for (std::size_t number = 0; number < last; number += stride) {
            EXPECT_EQ(check(mode, number), "") << "allocation " << number << " of " << last;
        }
        RecordProperty("allocations", static_cast<int>(last));
    }

    RunOutcome reference;
    std::size_t count = 0;
};

// Primes, which come to every place of a loop.
TEST_P(AllocationFaults, EachAlone) { walk(MemoryFaults::ONE, /*usualStride=*/47); }

TEST_P(AllocationFaults, AllFromOneOn) { walk(MemoryFaults::ALL_FROM_THEN_ON, /*usualStride=*/53); }

INSTANTIATE_TEST_SUITE_P(Runs, AllocationFaults, testing::ValuesIn(runs), nameRun);

// Images that wait in a file.

/// Keeps an image in a file and reads its text. Returns: the text, nothing when there was no
/// memory.
std::string keepInFile(const std::string& directory, std::istream& source, std::size_t count) {
    try {
        SVGImageStore store(/*budget=*/0, directory);
        SVGStoredImage image;
        if (!store.keep(source, count, image)) {
            return "";
        }
        const MoxCommonNS::MoxPtr<SVGImageText> text(new SVGImageText("", std::move(image)));
        return std::string(text->getText());
    } catch (const std::bad_alloc&) {
        return "";
    }
}

TEST(AllocationFaultsOfFiles, LoseTheImageButNoPartOfIt) {
    const TempDir directory;
    const std::string place = directory.path();
    const std::string bytes(1000, 'x');
    std::istringstream source(bytes);
    const std::string whole = keepInFile(place, source, bytes.size());
    std::size_t number = 0;
    for (bool hasFailed = true; hasFailed; ++number) {
        source.seekg(0);
        const std::ptrdiff_t before = MemoryFaults::countLive();
        MemoryFaults faults(MemoryFaults::ONE, number);
        const std::string text = keepInFile(place, source, bytes.size());
        MemoryFaults::end();
        hasFailed = MemoryFaults::countFailed() > 0;
        EXPECT_EQ(text, hasFailed ? "" : whole) << number;
        EXPECT_EQ(MemoryFaults::countLive() - before, text.empty() ? 0 : 1) << number;
        EXPECT_EQ(countOpenFiles(place), 0);
    }
    EXPECT_GT(number, 5U);
}

} // namespace
} // namespace DrawmereTest
