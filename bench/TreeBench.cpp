// The tree alone: building, saving and freeing it, its memory, and a very deep one.
#include "bench/BenchFile.h"
#include "bench/BenchShapes.h"
#include "bench/Contest.h"
#include "bench/PlainWriter.h"
#include "bench/ResidentMemory.h"
#include "foundation/common/MoxColor.h"
#include "tree/SVGDocument.h"

#include <benchmark/benchmark.h>
#include <cstdio>
#include <fstream>
#include <utility>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxColor;

constexpr std::size_t elementCount = 200'000;
constexpr std::size_t deepLevels = 1'000'000;

using Rects = std::vector<BenchRect>;
using DocumentPtr = MoxPtr<SVGDocument>;

DocumentPtr makeDocument() {
    DocumentPtr document(new SVGDocument);
    const MoxPtr<MoxElement> root = document->createElementNS(MoxCommonNS::MOXNAME_SVG_NAMESPACE,
                                                              MoxName(), MoxCommonNS::MOXNAME_SVG);
    root->setAttribute(SVGName(SVGName::width), MoxValue(benchPageWidth));
    root->setAttribute(SVGName(SVGName::height), MoxValue(benchPageHeight));
    document->appendChild(root.get());
    return document;
}

DocumentPtr buildTree(const Rects& rects) {
    DocumentPtr document = makeDocument();
    MoxElement* root = document->getDocumentElement();
    for (const BenchRect& rect : rects) {
        const MoxPtr<SVGElement> element = document->createSVGElement(SVGName::rect);
        element->setSVGAttribute(SVGName::x, MoxValue(rect.x));
        element->setSVGAttribute(SVGName::y, MoxValue(rect.y));
        element->setSVGAttribute(SVGName::width, MoxValue(rect.width));
        element->setSVGAttribute(SVGName::height, MoxValue(rect.height));
        element->setSVGAttribute(SVGName::fill, MoxValue(MoxColor(rect.fillColor)));
        element->setSVGAttribute(SVGName::stroke_width, MoxValue(rect.strokeWidth));
        root->appendChild(element.get());
    }
    return document;
}

void saveTree(const SVGDocument& document, const std::string& path) {
    std::ofstream stream(path, std::ios::binary);
    document.save(UnicodeString(), UnicodeString(), stream, nullptr, u"decimals=3",
                  UnicodeString());
}

ContestResult runPlain(const Rects& rects, const std::string& path) {
    const Stopwatch watch;
    PlainWriter writer(path);
    writer.startPage(benchPageWidth, benchPageHeight);
    for (const BenchRect& rect : rects) {
        writer.startElement("rect");
        writer.addNumber("x", rect.x);
        writer.addNumber("y", rect.y);
        writer.addNumber("width", rect.width);
        writer.addNumber("height", rect.height);
        writer.addColor("fill", rect.fillColor);
        writer.addNumber("stroke-width", rect.strokeWidth);
        writer.endEmptyElement();
    }
    const std::size_t bytes = writer.finish();
    return {watch.getTime(), bytes};
}

ContestResult runBuildAndSave(const Rects& rects, const BenchFile& file) {
    const Stopwatch watch;
    const DocumentPtr document = buildTree(rects);
    saveTree(*document, file.getPath());
    return {watch.getTime(), file.getSize()};
}

ContestResult runWholeLife(const Rects& rects, const BenchFile& file) {
    const Stopwatch watch;
    saveTree(*buildTree(rects), file.getPath());
    return {watch.getTime(), file.getSize()};
}

ContestResult runSave(const SVGDocument& document, const BenchFile& file) {
    const Stopwatch watch;
    saveTree(document, file.getPath());
    return {watch.getTime(), file.getSize()};
}

Contest makeTreeContest(const Rects& rects, const DocumentPtr& built, const BenchFile& file) {
    return {"tree of rectangles with six attributes",
            {
                {"plain", [&] { return runPlain(rects, file.getPath()); }},
                {"build, save", [&] { return runBuildAndSave(rects, file); }},
                {"... and free", [&] { return runWholeLife(rects, file); }},
                {"save alone", [&] { return runSave(*built, file); }},
            },
            2.0};
}

void printMemory(const Rects& rects) {
    const std::size_t before = countResidentBytes();
    const DocumentPtr document = buildTree(rects);
    const std::size_t used = countResidentBytes() - before;
    std::printf("\nmemory\n  %.1f bytes for an element with six attributes; goal: at most 250\n",
                static_cast<double>(used) / static_cast<double>(rects.size()));
}

DocumentPtr buildDeepTree(std::size_t levels) {
    DocumentPtr document = makeDocument();
    MoxElement* parent = document->getDocumentElement();
    for (std::size_t i = 0; i < levels; ++i) {
        const MoxPtr<SVGElement> group = document->createSVGElement(SVGName::g);
        parent->appendChild(group.get());
        parent = group.get();
    }
    return document;
}

void printDeepTree(std::size_t levels, const BenchFile& file) {
    const Stopwatch buildWatch;
    DocumentPtr document = buildDeepTree(levels);
    const double build = buildWatch.getTime().cpu;
    const ContestResult save = runSave(*document, file);
    const Stopwatch freeWatch;
    document = nullptr;
    std::printf("\ntree nested %zu deep, on the default stack\n"
                "  build %.0f ms, save %.0f ms (%.2f MB), free %.0f ms\n",
                levels, build * 1e3, save.time.cpu * 1e3, static_cast<double>(save.bytes) / 1e6,
                freeWatch.getTime().cpu * 1e3);
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    const Rects rects = makeBenchRects(scaleCount(elementCount));
    const DocumentPtr built = buildTree(rects);
    runContests({makeTreeContest(rects, built, file)});
    printMemory(rects);
    printDeepTree(scaleCount(deepLevels), file);
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
