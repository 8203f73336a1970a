// Runs of text from the first call to the saved file.
#include "bench/BenchShapes.h"
#include "bench/DrawContest.h"

#include <benchmark/benchmark.h>

namespace DrawmereNS {
namespace {

constexpr std::size_t textCount = 100'000;
constexpr std::uint32_t textColor = 0x1A2B5E;
constexpr const char* fontFamily = "Helvetica";
constexpr float fontSize = 10.5F;

using Texts = std::vector<BenchText>;

// How each of the three is told its style.

void prepare(Drawmere& drawmere) {
    SVGFont font;
    const UnicodeString family = UnicodeString::fromUTF8(fontFamily);
    font.setFontAttribute(family, pt(fontSize), FONTWEIGHT_NORMAL, FSTYLE_NORMAL, family,
                          /*familyOnly=*/true);
    drawmere.setFont(&font, nullptr);
    drawmere.setFillColor(MoxColor(textColor));
}

template <typename Target> void prepare(Target& target) {
    target.setFont(fontFamily, fontSize);
    target.setFillColor(textColor);
}

// One position for the run.

void drawWord(Drawmere& drawmere, const BenchText& run) {
    drawmere.drawText(run.text, pt(run.x[0]), pt(run.y), PAINTMODE_FILL, nullptr,
                      /*wholeRun=*/true, /*leftToRight=*/true);
}

void drawWord(PlainWriter& writer, const BenchText& run) {
    writer.drawText(run.bytes, std::span(run.x).first(1), run.y);
}

void drawWord(CairoPeer& cairo, const BenchText& run) {
    cairo.drawText(run.bytes.c_str(), run.x[0], run.y);
}

// One for each character.

void drawLetters(Drawmere& drawmere, const BenchText& run) {
    std::vector<MoxLength> positions;
    positions.reserve(run.x.size());
    for (const float x : run.x) {
        positions.push_back(pt(x));
    }
    drawmere.drawText(run.text, positions, {pt(run.y)}, {}, PAINTMODE_FILL, nullptr,
                      /*wholeRun=*/true, /*leftToRight=*/true);
}

void drawLetters(PlainWriter& writer, const BenchText& run) {
    writer.drawText(run.bytes, run.x, run.y);
}

void drawLetters(CairoPeer& cairo, const BenchText& run) {
    cairo.drawText(run.bytes.c_str(), run.x.data(), run.y);
}

/// Draws one workload on any of the three.
constexpr auto words = [](auto& target, const Texts& texts) {
    prepare(target);
    for (const BenchText& run : texts) {
        drawWord(target, run);
    }
};

constexpr auto letters = [](auto& target, const Texts& texts) {
    prepare(target);
    for (const BenchText& run : texts) {
        drawLetters(target, run);
    }
};

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    const Texts texts = makeBenchTexts(scaleCount(textCount));
    runContests({makeDrawContest("text runs of 12 characters, one position", words, texts, file,
                                 {.wall = 2.5}),
                 makeDrawContest("text runs of 12 characters, twelve positions", letters, texts,
                                 file, {})});
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
