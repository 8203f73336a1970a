// Embedded fonts: collecting the texts that are drawn, the memory that takes, and writing glyphs.
#include "Drawmere.h"
#include "bench/BenchScripts.h"
#include "bench/Contest.h"
#include "fonts/SVGEmbFont.h"
#include "tree/SVGTreeManager.h"

#include "SVGConfig.h"

#include <algorithm>
#include <benchmark/benchmark.h>
#include <cstdio>
#include <cstdlib>
#include <malloc.h>
#include <new>
#include <sstream>
#include <stdexcept>

#include <ft2build.h>
#include FT_FREETYPE_H

namespace {

/// The bytes in use that came from operator new, with what the heap keeps for each block.
std::size_t heapBytes = 0;
bool isCounting = false; // it would slow down what is timed

std::size_t countBlock(void* block) {
    return isCounting && block ? malloc_usable_size(block) + sizeof(std::size_t) : 0;
}

} // namespace

void* operator new(std::size_t size) {
    void* block = std::malloc(size);
    if (!block) {
        throw std::bad_alloc();
    }
    heapBytes += countBlock(block);
    return block;
}

void operator delete(void* block) noexcept {
    heapBytes -= countBlock(block);
    std::free(block);
}

void operator delete(void* block, std::size_t /*size*/) noexcept { operator delete(block); }

namespace DrawmereNS {
namespace {

constexpr std::size_t charCount = 1'000'000;
constexpr std::size_t wordLength = 5;
constexpr std::size_t lineLength = 60;
constexpr std::size_t glyphCount = 5'000;
constexpr std::size_t manyGlyphs = 20'000;
constexpr char16_t firstKanji = 0x4E00;
constexpr const char16_t* kanjiFont = u"Noto Sans CJK JP";

using Runs = std::vector<BenchRun>;

MoxLength pt(float number) { return MoxLength::fromRaw(number); }

/// What a font takes of the texts drawn with it.
enum class Taking { nothing, characters, clusters, wholeRuns };

SVGFont makeFont(const char16_t* name, Taking taking) {
    SVGFont font;
    font.setFontAttribute(name, pt(10.5F), FONTWEIGHT_NORMAL, FSTYLE_NORMAL, name, true);
    font.setEmbedAttribute(taking != Taking::nothing,
                           taking == Taking::clusters || taking == Taking::wholeRuns);
    return font;
}

/// Draws the runs, up to where the fonts would be written; a document that is not finished has the
/// same calls behind it whether fonts are embedded or not.
ContestResult drawRuns(const Runs& runs, Taking taking) {
    SVGConfig config;
    SVGPageUri uri(u"page.svg");
    std::ostringstream stream;
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(&stream);
    drawmere.setCanvasSize(pt(595), pt(842));
    std::vector<SVGFont> fonts;
    for (const BenchScript& script : benchScripts) {
        fonts.push_back(makeFont(script.fontName, taking));
        drawmere.setFont(&fonts.back(), nullptr); // opens the face, once a document
    }
    const Stopwatch watch;
    TalFont::TLStringWithGlyphInfo glyphs;
    std::size_t script = benchScriptCount;
    float y = 0.0F;
    for (const BenchRun& run : runs) {
        if (run.script != script) {
            script = run.script;
            drawmere.setFont(&fonts[script], nullptr);
        }
        y += 0.125F;
        // A formatter has just shaped the run, so its glyphs are at hand and not somewhere in
        // memory.
        glyphs.entries.assign(run.glyphs.entries.begin(), run.glyphs.entries.end());
        drawmere.drawText(run.text, pt(72.25F), pt(y), PAINTMODE_FILL, &glyphs,
                          taking == Taking::wholeRuns, run.leftToRight);
    }
    return {watch.getTime(), 0};
}

Contest makeCollectContest(const char* title, const Runs& runs) {
    return {title,
            {
                {"drawn alone", [&runs] { return drawRuns(runs, Taking::nothing); }},
                {"clusters", [&runs] { return drawRuns(runs, Taking::clusters); }},
                {"characters", [&runs] { return drawRuns(runs, Taking::characters); }},
                {"whole runs", [&runs] { return drawRuns(runs, Taking::wholeRuns); }},
            },
            1.25};
}

// Memory.

struct Collected {
    std::size_t bytes;
    std::size_t texts;
};

template <typename Collect> Collected measureMemory(const char16_t* name, Collect collect) {
    SVGEmbFont font(makeFont(name, Taking::characters), nullptr);
    heapBytes = 0;
    isCounting = true;
    collect(font);
    isCounting = false;
    return {heapBytes, font.horizontalGlyphs.size() + font.verticalGlyphs.size()};
}

void printMemory(const char* title, const Collected& collected) {
    std::printf("  %-34s %7zu texts %7.1f bytes for each\n", title, collected.texts,
                static_cast<double>(collected.bytes) / static_cast<double>(collected.texts));
}

UnicodeString makeKanji(std::size_t count) {
    UnicodeString text;
    for (std::size_t i = 0; i < count; ++i) {
        text.append(static_cast<char16_t>(firstKanji + i));
    }
    return text;
}

void printMemories(const Runs& runs) {
    const UnicodeString kanji = makeKanji(scaleCount(manyGlyphs));
    const TalFont::TLStringWithGlyphInfo glyphs(
        std::vector<TalFont::TLGlyphEntry>(kanji.length(), {1, 77}));
    std::printf("\nmemory of the registry; goal: at most 192.0 bytes for each\n");
    printMemory("kanji by characters",
                measureMemory(kanjiFont, [&](SVGEmbFont& font) { font.embedText(kanji, false); }));
    printMemory("kanji by clusters", measureMemory(kanjiFont, [&](SVGEmbFont& font) {
                    font.embedGlyphId(kanji, &glyphs, false, false);
                }));
    printMemory("kanji by both", measureMemory(kanjiFont, [&](SVGEmbFont& font) {
                    font.embedText(kanji, false);
                    font.embedGlyphId(kanji, &glyphs, false, false);
                }));
    for (std::size_t script = 0; script < benchScriptCount; ++script) {
        for (const bool byGlyphs : {false, true}) {
            const auto collect = [&](SVGEmbFont& font) {
                for (const BenchRun& run : runs) {
                    if (run.script == script && byGlyphs) {
                        font.embedGlyphId(run.text, &run.glyphs, false, false);
                    } else if (run.script == script) {
                        font.embedText(run.text, false);
                    }
                }
            };
            std::string title;
            UnicodeString(benchScripts[script].fontName).toUTF8String(title);
            title += byGlyphs ? ", clusters" : ", characters";
            printMemory(title.c_str(), measureMemory(benchScripts[script].fontName, collect));
        }
    }
}

// Writing glyphs.

/// The face as FreeType alone opens it.
class PlainFace {
public:
    explicit PlainFace(const BenchFontFile& file) {
        if (FT_Init_FreeType(&library) != 0 ||
            FT_New_Face(library, file.path.c_str(), file.face, &face) != 0) {
            throw std::runtime_error("no face in " + file.path);
        }
    }

    PlainFace(const PlainFace&) = delete;
    PlainFace& operator=(const PlainFace&) = delete;

    ~PlainFace() {
        FT_Done_Face(face);
        FT_Done_FreeType(library);
    }

    FT_Library library = nullptr;
    FT_Face face = nullptr;
};

ContestResult loadGlyphs(const PlainFace& plain, const SVGEmbFont& font) {
    const Stopwatch watch;
    std::size_t points = 0;
    for (const auto& [text, ids] : font.horizontalGlyphs) {
        FT_Load_Glyph(plain.face, ids.front(), FT_LOAD_NO_SCALE);
        points += static_cast<std::size_t>(plain.face->glyph->outline.n_points);
    }
    return {watch.getTime(), points};
}

ContestResult writeGlyphs(SVGEmbFont& font) {
    SVGConfig config;
    SVGTreeManager tree;
    tree.setSVGDocProp(u"1.1", &config);
    const Stopwatch watch;
    font.doEmbedFont(&tree);
    return {watch.getTime(), 0};
}

void run(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    const Runs words = makeBenchRuns(scaleCount(charCount), wordLength);
    const Runs lines = makeBenchRuns(scaleCount(charCount), lineLength);
    SVGEmbFont font(makeFont(kanjiFont, Taking::characters), nullptr);
    font.embedText(makeKanji(scaleCount(glyphCount)), false);
    const PlainFace plain(findBenchFont(kanjiFont));
    runContests({makeCollectContest("drawing 1,000,000 characters a word a call", words),
                 makeCollectContest("drawing 1,000,000 characters a line a call", lines),
                 {"5,000 glyphs of a CJK font",
                  {
                      {"FT_Load_Glyph", [&] { return loadGlyphs(plain, font); }},
                      {"doEmbedFont", [&] { return writeGlyphs(font); }},
                  },
                  1.5}});
    printMemories(lines);
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) {
    try {
        DrawmereNS::run(argc, argv);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "FontBench: %s\n", error.what());
        return 1;
    }
}
