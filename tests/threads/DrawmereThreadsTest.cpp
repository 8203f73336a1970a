// Two runs on two threads: each has its own configuration, and neither sees the other.
#include "frontend/DrawmereError.h"
#include "tests/frontend/RunFiles.h"
#include "tests/support/Gunzip.h"

#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <thread>

namespace DrawmereTest {
namespace {

constexpr int runCount = 2;
constexpr int roundCount = 10;
constexpr int shapeCount = 400;

UnicodeString numbered(const char16_t* text, int number) {
    return UnicodeString(text) + UnicodeString::fromUTF8(std::to_string(number));
}

/// Draws shapes whose paints are names that were never seen before, so that the shared table of
/// names grows while both runs read it.
void drawShapes(Drawmere& drawmere, int run, int round) {
    for (int i = 0; i < shapeCount; ++i) {
        const auto place = static_cast<float>(run * 1000 + i);
        drawmere.setFillColorName(numbered(u"paint", run * 1000 + i));
        drawmere.setTransMatrix(SVGMatrix(1, 0, 0, 1, 1, 0));
        drawmere.pushState();
        drawmere.startLink(numbered(u"link", i), MoxName(numbered(u"show", round * 1000 + i)));
        drawmere.drawCircle(pt(place), pt(2.5F), pt(0.1F), PAINTMODE_FILLSTROKE);
        drawmere.endLink();
        drawmere.popState();
    }
}

/// Returns: the document of one run, which differs from run to run but not from round to round.
std::string drawDocument(int run, int round) {
    std::ostringstream stream;
    SVGConfig config;
    config.gzip = run == 1;
    config.encoding = run == 1 ? u"ISO-8859-1" : u"";
    SVGPageUri uri(u"out.svg");
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(&stream);
    drawmere.startPage(run, MoxRectT<MoxLength>());
    drawShapes(drawmere, run, round);
    config.pushError(MoxError(16929, numbered(u"of run ", run), u"", -1, -1, u""));
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
    const std::string error = utf8(drawmere.popError().getMessage());
    return (config.gzip ? gunzip(stream.str()) : stream.str()) + error;
}

TEST(DrawmereThreads, TwoRunsWriteWhatEachWritesAlone) {
    std::array<std::string, runCount> alone;
    for (int run = 0; run < runCount; ++run) {
        alone[run] = drawDocument(run, /*round=*/0);
        ASSERT_TRUE(alone[run].ends_with("</svg>\nof run " + std::to_string(run)));
    }
    ASSERT_NE(alone[0], alone[1]);

    std::atomic<int> ready = 0;
    std::array<int, runCount> equal = {};
    std::array<std::thread, runCount> threads;
    for (int run = 0; run < runCount; ++run) {
        threads[run] = std::thread([run, &ready, &equal, &alone] {
            for (++ready; ready < runCount;) {
                std::this_thread::yield();
            }
            for (int round = 1; round <= roundCount; ++round) {
                equal[run] += drawDocument(run, round) == alone[run] ? 1 : 0;
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    EXPECT_EQ(equal, (std::array<int, runCount>{roundCount, roundCount}));
}

TEST(DrawmereThreads, ADocumentMayBeDrawnOnOneThreadAndFinishedOnAnother) {
    const std::string whole = drawDocument(/*run=*/0, /*round=*/0);
    std::ostringstream stream;
    SVGConfig config;
    SVGPageUri uri(u"out.svg");
    Drawmere drawmere(&config, &uri);
    std::thread([&drawmere, &stream] {
        drawmere.initRootSvg(&stream);
        drawmere.startPage(0, MoxRectT<MoxLength>());
        drawShapes(drawmere, /*run=*/0, /*round=*/0);
    }).join();
    std::thread([&drawmere] { drawmere.finishRootSvg(); }).join();
    drawmere.finish();
    EXPECT_EQ(stream.str() + "of run 0", whole);
}

TEST(DrawmereThreads, ErrorsThatAreThrownMayCrossThreads) {
    std::exception_ptr thrown;
    std::thread([&thrown] {
        try {
            DrawmereError::throwError(16414, u"a path");
        } catch (const MoxError&) {
            thrown = std::current_exception();
        }
    }).join();
    EXPECT_EQ(errorOf([thrown] { std::rethrow_exception(thrown); }), unwritable("a path"));
}

} // namespace
} // namespace DrawmereTest
