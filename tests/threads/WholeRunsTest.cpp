// Two runs with everything on their pages, on two threads: they share the default error handler,
// the table of names, the fonts and the caches, and each writes what it writes alone.
#include "foundation/fontservice/FS_FaceCache.h"
#include "tests/support/WholeRun.h"

#include <gtest/gtest.h>

#include <array>
#include <barrier>
#include <thread>

namespace DrawmereTest {
namespace {

constexpr int runCount = 2;
constexpr int roundCount = 5;

/// The runs that are on the two threads together.
constexpr RunOptions pairs[][runCount] = {
    {{.name = "pages", .profile = SVGConfig::SVGTYPE_FULL, .output = RunOptions::PAGES},
     {.name = "a gzip stream",
      .profile = SVGConfig::SVGTYPE_FULL,
      .output = RunOptions::STREAM,
      .gzip = true}},
    {{.name = "copies",
      .profile = SVGConfig::SVGTYPE_TINY,
      .output = RunOptions::PAGES,
      .copiesImages = true},
     {.name = "a small device",
      .profile = SVGConfig::SVGTYPE_TINY,
      .output = RunOptions::SINGLE_FILE,
      .wispMode = true}},
    {{.name = "an encoding",
      .profile = SVGConfig::SVGTYPE_BASIC,
      .output = RunOptions::STREAM,
      .encoding = u"ISO-8859-1"},
     {.name = "the same",
      .profile = SVGConfig::SVGTYPE_BASIC,
      .output = RunOptions::STREAM,
      .encoding = u"ISO-8859-1"}},
};

std::map<std::string, std::string> drawFiles(const RunOptions& options) {
    WholeRun run(options, /*stopsAtErrors=*/true);
    std::ostringstream target;
    run.draw(target);
    RunOutcome outcome = run.collect();
    outcome.files["stream"] = target.str();
    return outcome.files;
}

/// Draws on a thread for each run; at the start of each round the cache of faces is emptied, so
/// that both open the same faces.
std::array<int, runCount> countEqualRounds(const RunOptions (&pair)[runCount]) {
    std::array<std::map<std::string, std::string>, runCount> alone;
    std::array<int, runCount> equal = {};
    std::barrier round(runCount,
                       []() noexcept { MoxFontService_NS::FS_FaceCache::shared().clear(); });
    std::array<std::thread, runCount> threads;
    for (int run = 0; run < runCount; ++run) {
        alone[run] = drawFiles(pair[run]);
    }
    for (int run = 0; run < runCount; ++run) {
        threads[run] = std::thread([&, run] {
            for (int i = 0; i < roundCount; ++i) {
                round.arrive_and_wait();
                equal[run] += drawFiles(pair[run]) == alone[run] ? 1 : 0;
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    return equal;
}

TEST(WholeRuns, TwoAtOnceWriteWhatEachWritesAlone) {
    for (const auto& pair : pairs) {
        EXPECT_EQ(countEqualRounds(pair), (std::array<int, runCount>{roundCount, roundCount}))
            << pair[0].name << " beside " << pair[1].name;
    }
}

/// Asks for fonts of the system by names that are no fonts, each once, and for some that are.
std::string drawInSystemFonts(int run) {
    constexpr int nameCount = 20;
    std::ostringstream stream;
    SVGConfig config;
    SVGPageUri uri(u"page.svg");
    Drawmere page(&config, &uri);
    page.initRootSvg(&stream);
    for (int i = 0; i < nameCount; ++i) {
        const std::string name = i % 2 == 0 ? "serif" : "None " + std::to_string(run * 100 + i);
        SVGFont font;
        font.setFontAttribute(UnicodeString::fromUTF8(name), MoxLength::fromRaw(10),
                              FONTWEIGHT_NORMAL, FSTYLE_NORMAL, u"", false);
        font.setEmbedAttribute(/*embed=*/true, /*byGlyphIds=*/false);
        page.setFont(&font, nullptr);
        page.drawText(u"A", MoxLength(), MoxLength(), PAINTMODE_FILL, nullptr, true, true);
    }
    page.finishRootSvg();
    page.finish();
    return stream.str();
}

TEST(WholeRuns, TwoThreadsMayLookForFontsOfTheSystem) {
    std::array<std::string, runCount> drawn;
    std::array<std::thread, runCount> threads;
    for (int run = 0; run < runCount; ++run) {
        threads[run] = std::thread([run, &drawn] { drawn[run] = drawInSystemFonts(run); });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    for (int run = 0; run < runCount; ++run) {
        EXPECT_EQ(drawn[run], drawInSystemFonts(run));
    }
}

} // namespace
} // namespace DrawmereTest
