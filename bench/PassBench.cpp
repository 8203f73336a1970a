// The passes over a finished tree: how they grow with it, and what they add to building it.
#include "bench/BenchShapes.h"
#include "bench/Contest.h"
#include "draw/SVGTinyImpl.h"
#include "foundation/names/SVGName.h"
#include "post/QuilletExtention.h"
#include "post/SVGOptimizer.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGTreeManager.h"

#include <algorithm>
#include <benchmark/benchmark.h>
#include <cstdio>
#include <malloc.h>
#include <vector>

namespace DrawmereNS {
namespace {

constexpr std::size_t elementCount = 200'000;
constexpr std::size_t runCount = 20'000;
constexpr int rounds = 7;
constexpr double nano = 1e9;
constexpr double percent = 100.0;

MoxLength pt(float number) { return MoxLength::fromRaw(number); }

/// The input of all documents; each takes the first so many of both.
struct Input {
    std::vector<BenchRect> rects;
    std::vector<BenchText> texts;
};

/// Processor time, in seconds.
struct Times {
    double build = 0.0;
    double optimize = 0.0;
    double flatten = 0.0;
};

QuilletExtention makeQuillet() {
    QuilletExtention quillet;
    for (const SVGName::Number element :
         {SVGName::circle, SVGName::ellipse, SVGName::line, SVGName::path, SVGName::polygon,
          SVGName::polyline, SVGName::rect, SVGName::text}) {
        quillet.paintableElements.insert(SVGName(element));
    }
    quillet.paintAttributes = {SVGName(SVGName::fill), SVGName(SVGName::stroke)};
    return quillet;
}

void drawRect(DrawmereImpl& impl, const BenchRect& rect) {
    impl.getGContext()->setFillColor(MoxColor(rect.fillColor));
    impl.getGContext()->setStrokeWidth(pt(rect.strokeWidth));
    impl.drawRect(pt(rect.x), pt(rect.y), pt(rect.width), pt(rect.height), pt(0), pt(0),
                  PAINTMODE_FILLSTROKE);
}

void drawText(DrawmereImpl& impl, const UnicodeString& text, float x, float y) {
    impl.drawText(text, pt(x), pt(y), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

/// One document: shapes and words in turn, every twentieth a link.
constexpr auto pages = [](DrawmereImpl& impl, const Input& input, std::size_t count) {
    for (std::size_t i = 0; i < count; ++i) {
        const BenchText& text = input.texts[i];
        if (i % 2 != 0) {
            drawRect(impl, input.rects[i]);
        } else if (i % 20 != 0) {
            drawText(impl, text.text, text.x[0], text.y);
        } else {
            impl.startLink(u"#target", MoxName());
            drawText(impl, text.text, text.x[0], text.y);
            impl.endLink();
        }
    }
};

/// Runs with a position for each letter, which the small-device pass takes apart.
constexpr auto runs = [](DrawmereImpl& impl, const Input& input, std::size_t count) {
    for (std::size_t i = 0; i < count; ++i) {
        const BenchText& text = input.texts[i];
        std::vector<MoxLength> x;
        for (const float number : text.x) {
            x.push_back(pt(number));
        }
        impl.drawText(text.text, x, {pt(text.y)}, {}, PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                      /*leftToRight=*/true);
    }
};

/// The same letters, each a text from the start.
constexpr auto letters = [](DrawmereImpl& impl, const Input& input, std::size_t count) {
    for (std::size_t i = 0; i < count; ++i) {
        const BenchText& text = input.texts[i];
        for (std::size_t k = 0; k < benchRunLength; ++k) {
            drawText(impl, text.text.tempSubString(static_cast<std::int32_t>(k), 1), text.x[k],
                     text.y);
        }
    }
};

template <typename Draw> Times runOnce(Draw draw, const Input& input, std::size_t count) {
    malloc_trim(0);
    SVGConfig config;
    config.svgType = SVGConfig::SVGTYPE_TINY;
    Times times;
    const Stopwatch build;
    SVGTinyImpl impl(&config);
    impl.initRootSvg();
    impl.getGContext()->setStrokeColor(MoxColor(benchStrokeColor));
    draw(impl, input, count);
    impl.finishRootSvg();
    times.build = build.getTime().cpu;
    MoxElement* root = impl.getDocument()->getDocumentElement();
    const Stopwatch optimize;
    SVGOptimizer::optimize(root);
    times.optimize = optimize.getTime().cpu;
    const Stopwatch flatten;
    makeQuillet().optimizeQuillet(root);
    times.flatten = flatten.getTime().cpu;
    return times;
}

double findMedian(const std::vector<Times>& all, double Times::*member) {
    std::vector<double> values;
    values.reserve(all.size());
    for (const Times& times : all) {
        values.push_back(times.*member);
    }
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

template <typename Draw> Times runRounds(Draw draw, const Input& input, std::size_t count) {
    std::vector<Times> all(isSmokeRun() ? 1 : rounds);
    for (Times& times : all) {
        times = runOnce(draw, input, count);
    }
    return {findMedian(all, &Times::build), findMedian(all, &Times::optimize),
            findMedian(all, &Times::flatten)};
}

void printPages(const Input& input, std::size_t count) {
    const Times times = runRounds(pages, input, count);
    const auto number = static_cast<double>(count);
    std::printf("  %9zu %10.1f %10.1f %10.1f %9.1f %%\n", count, times.build / number * nano,
                times.optimize / number * nano, times.flatten / number * nano,
                (times.optimize + times.flatten) / times.build * percent);
}

void printLetters(const Input& input, std::size_t count) {
    const Times whole = runRounds(runs, input, count);
    const Times single = runRounds(letters, input, count);
    const double number = static_cast<double>(count) * benchRunLength;
    std::printf("\nruns with a position for each letter, cpu ns for each letter\n"
                "  run drawn %.1f and taken apart %.1f, against %.1f for letters drawn one by one: "
                "%.2fx\n",
                whole.build / number * nano, whole.flatten / number * nano,
                single.build / number * nano, (whole.build + whole.flatten) / single.build);
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const std::size_t most = 4 * scaleCount(elementCount);
    const Input input = {makeBenchRects(most), makeBenchTexts(most)};
    std::printf("\npasses over a tree of shapes, words and links, cpu ns for each element\n"
                "  %9s %10s %10s %10s %11s\n",
                "elements", "build", "optimise", "flatten", "both/build");
    for (std::size_t count = most / 16; count <= most; count *= 4) {
        printPages(input, count);
    }
    std::printf("  goal: the same for any count, and both at most 15 %% of building\n");
    printLetters(input, scaleCount(runCount));
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
