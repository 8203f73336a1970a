// Runs of many pages with links between them: files written as they come, files that wait for the
// end of the run, the solving alone, and the memory that a run takes up while it goes on.
#include "Drawmere.h"
#include "bench/BenchFile.h"
#include "bench/BenchShapes.h"
#include "bench/Contest.h"
#include "bench/PlainWriter.h"
#include "bench/ResidentMemory.h"
#include "refs/SVGReferenceId.h"

#include <benchmark/benchmark.h>
#include <cstdio>
#include <filesystem>
#include <memory>

namespace DrawmereNS {
namespace {

constexpr std::size_t pageCount = 20'000;
constexpr int linksOfPage = 50;
constexpr float linkSize = 10;

/// A run of pages, counted from 1, each with destinations of its own.
struct Run {
    int pages;
    int links = linksOfPage;
    int anchors = 1;
    bool forward = false; ///< links lead to later pages, otherwise to earlier ones
};

MoxLength pt(float number) { return MoxLength::fromRaw(number); }

/// Returns: the page that a link leads to; the first or the last page leads to itself.
int findTarget(const Run& run, int page, int link) {
    const int choices = run.forward ? run.pages - page : page - 1;
    if (choices == 0) {
        return page;
    }
    const int distance = 1 + (page * 7919 + link * 104'729) % choices;
    return run.forward ? page + distance : page - distance;
}

std::string nameFile(const BenchFile& file, int page) {
    return std::filesystem::path(file.getPath()).replace_extension().string() +
           std::to_string(page) + ".svg";
}

std::size_t countBytes(const BenchFile& file, int pages) {
    std::size_t bytes = 0;
    for (int page = 1; page <= pages; ++page) {
        bytes += std::filesystem::file_size(nameFile(file, page));
    }
    return bytes;
}

// The yardstick knows every target beforehand.

void writePlainPage(const Run& run, const BenchFile& file, int page) {
    PlainWriter writer(nameFile(file, page));
    writer.startPage(benchPageWidth, benchPageHeight);
    for (int i = 0; i < run.links; ++i) {
        const std::string target = std::to_string(findTarget(run, page, i));
        writer.startLink(run.forward ? "bench" + target + ".svg" : "#d" + target);
        writer.drawRect(linkSize, linkSize * static_cast<float>(i), linkSize, linkSize,
                        {.fill = true, .stroke = false});
        writer.endLink();
    }
    writer.finish();
}

ContestResult runPlain(const Run& run, const BenchFile& file) {
    const Stopwatch watch;
    for (int page = 1; page <= run.pages; ++page) {
        writePlainPage(run, file, page);
    }
    return {watch.getTime(), countBytes(file, run.pages)};
}

/// The library in a run of one file a page.
class LinkedRun {
public:
    LinkedRun(const Run& description, const BenchFile& file)
        : run(description), uri(UnicodeString::fromUTF8(file.getPath())) {
        config.streamOutput = false;
    }

    void drawPages(int first, int last) {
        for (int page = first; page <= last; ++page) {
            drawPage(page);
        }
    }

    Drawmere& getDrawmere() { return drawmere; }

private:
    void drawPage(int page) {
        drawmere.initRootSvg(uri.getText());
        drawmere.startPage(
            page, MoxRectT<MoxLength>(pt(0), pt(0), pt(benchPageWidth), pt(benchPageHeight)));
        drawmere.setCanvasSize(pt(benchPageWidth), pt(benchPageHeight));
        drawAnchors(page);
        drawLinks(page);
        drawmere.endPage();
        drawmere.finishRootSvg();
    }

    void drawAnchors(int page) {
        const UnicodeString name = u"d" + toText(page);
        drawmere.setInternalLinkAnchor(name, 0, 0);
        for (int i = 1; i < run.anchors; ++i) {
            drawmere.setInternalLinkAnchor(name + u"-" + toText(i), 0, 0);
        }
    }

    void drawLinks(int page) {
        for (int i = 0; i < run.links; ++i) {
            drawmere.startLink(u"#d" + toText(findTarget(run, page, i)), MoxName());
            drawmere.drawRect(pt(linkSize), pt(linkSize * static_cast<float>(i)), pt(linkSize),
                              pt(linkSize), pt(0), pt(0), PAINTMODE_FILL);
            drawmere.endLink();
        }
    }

    static UnicodeString toText(int number) {
        return UnicodeString::fromUTF8(std::to_string(number));
    }

    Run run;
    SVGConfig config;
    SVGPageUri uri;
    Drawmere drawmere{&config, &uri};
};

ContestResult runDrawmere(const Run& run, const BenchFile& file) {
    const Stopwatch watch;
    {
        LinkedRun linked(run, file);
        linked.drawPages(1, run.pages);
        linked.getDrawmere().finish();
    }
    return {watch.getTime(), countBytes(file, run.pages)};
}

Contest makeContest(const char* title, const Run& run, const BenchFile& file, double goal) {
    return {title,
            {
                {"plain", [=, &file] { return runPlain(run, file); }},
                {"drawmere", [=, &file] { return runDrawmere(run, file); }},
            },
            goal};
}

/// How long the links of kept pages take alone, to be seen to be a matter of their number.
void printSolving(int pages, const BenchFile& file) {
    const Run run = {.pages = pages, .forward = true};
    LinkedRun linked(run, file);
    linked.drawPages(1, pages);
    const Drawmere& drawmere = linked.getDrawmere();
    const Stopwatch watch;
    SVGReferenceId references;
    references.setRefernceIdInfo(/*isSingleFile=*/false, drawmere.allAnchors, drawmere.anchorPages,
                                 drawmere.pageFiles);
    for (const auto& [page, document] : drawmere.documents) {
        references.solveReferenceId(page, document->getDocumentElement());
    }
    const double seconds = watch.getTime().cpu;
    const double links = static_cast<double>(pages) * run.links;
    std::printf("  %9.0f links on %6d pages: %7.1f ms, %4.0f ns a link\n", links, pages,
                seconds * 1e3, seconds * 1e9 / links);
}

/// What a run takes up for each page that it goes on by.
double measureGrowth(const Run& run, const BenchFile& file) {
    LinkedRun linked(run, file);
    const int settled = run.pages / 10;
    linked.drawPages(1, settled);
    const std::size_t before = countResidentBytes();
    linked.drawPages(settled + 1, run.pages);
    const std::size_t after = countResidentBytes();
    return static_cast<double>(after - before) / (run.pages - settled);
}

void printMemory(int pages, const BenchFile& file) {
    constexpr int moreAnchors = 10;
    const double alone = measureGrowth({.pages = pages, .links = 1, .anchors = 1}, file);
    const double more =
        measureGrowth({.pages = pages, .links = 1, .anchors = 1 + moreAnchors}, file);
    std::printf("\nmemory of a run of %d pages\n"
                "  links backward: %.0f bytes for a page with an anchor, goal: at most 600;"
                " %.0f for a further anchor, goal: at most 300\n",
                pages, alone, (more - alone) / moreAnchors);
    for (const int links : {1, linksOfPage}) {
        std::printf("  links forward: %.0f bytes for a page with %d that is kept\n",
                    measureGrowth({.pages = pages, .links = links, .forward = true}, file), links);
    }
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const BenchFile file;
    const auto pages = static_cast<int>(scaleCount(pageCount));
    runContests({makeContest("1,000,000 links backward on 20,000 pages",
                             {.pages = pages, .forward = false}, file, 3.0),
                 makeContest("1,000,000 links forward on 20,000 pages",
                             {.pages = pages, .forward = true}, file, 4.0)});
    std::printf("\nsolving\n");
    for (const int part : {4, 2, 1}) {
        printSolving(pages / part, file);
    }
    printMemory(pages, file);
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) { DrawmereNS::run(argc, argv); }
