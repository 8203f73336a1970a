// A page that carries its fonts: Latin with ligatures, Arabic, Devanagari and vertical Japanese.
// HarfBuzz shapes the texts; the library notes the glyphs and writes their outlines into the
// document. Usage: fonts [FILE.svg]

#include "Drawmere.h"
#include "GlyphShaper.h"

#include <cstdio>
#include <stdexcept>

using namespace DrawmereNS;
using TalFont::TLGlyphEntry;
using TalFont::TLStringWithGlyphInfo;

namespace {

// All numbers are points, y grows downwards and is that of a baseline for texts.
constexpr float pageWidth = 420;
constexpr float pageHeight = 300;
constexpr float margin = 36;

const MoxColor paper(0xFDFBF7);
const MoxColor ink(0x22262E);
const MoxColor soft(0x8A8F98);
const MoxColor rust(0xB4532A);

constexpr const char16_t* latinFont = u"Noto Serif";
constexpr const char16_t* labelFont = u"Noto Sans";
constexpr const char16_t* arabicFont = u"Noto Naskh Arabic";
constexpr const char16_t* devanagariFont = u"Noto Sans Devanagari";
constexpr const char16_t* japaneseFont = u"Noto Serif CJK JP";

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

/// A place on the page.
struct Spot {
    float x;
    float y;
};

/// Sets a font whose glyphs go into the document, by the numbers that shaping gives.
void setFont(Drawmere& page, const char16_t* name, float size) {
    SVGFont font;
    font.setFontAttribute(name, pt(size), FONTWEIGHT_NORMAL, FSTYLE_NORMAL, u"", false);
    font.setEmbedAttribute(/*embed=*/true, /*byGlyphIds=*/true);
    page.setFont(&font, nullptr);
}

void drawGlyphs(Drawmere& page, const UnicodeString& text, std::vector<TLGlyphEntry> entries,
                bool wholeRun, const Spot& spot) {
    TLStringWithGlyphInfo glyphs(std::move(entries));
    page.drawText(text, pt(spot.x), pt(spot.y), PAINTMODE_FILL, &glyphs, wholeRun,
                  /*leftToRight=*/true);
}

// Text that runs to the right. A viewer sets glyph behind glyph by their advances alone, so a line
// is drawn in pieces: a new one begins wherever kerning moves the next cluster, and with each word,
// as there are viewers that round advances.

bool startsPiece(const Cluster& before, const Cluster& cluster) {
    return cluster.isMoved || before.isKerned || before.text == UnicodeString(u' ');
}

/// Returns: where the piece ends that begins with the cluster `begin`, which it holds at least.
std::size_t findPieceEnd(const std::vector<Cluster>& clusters, std::size_t begin) {
    std::size_t end = begin + 1;
    while (end < clusters.size() && !startsPiece(clusters[end - 1], clusters[end])) {
        ++end;
    }
    return end;
}

/// Returns: the width of the line.
float drawLine(Drawmere& page, const char16_t* fontName, float size, const UnicodeString& text,
               const Spot& spot) {
    const GlyphShaper shaper(fontName);
    const std::vector<Cluster> clusters = shaper.shape(text, HB_DIRECTION_LTR);
    setFont(page, fontName, size);
    float pen = 0;
    for (std::size_t begin = 0; begin < clusters.size();) {
        const std::size_t end = findPieceEnd(clusters, begin);
        std::vector<TLGlyphEntry> entries;
        UnicodeString piece;
        const Spot place = {spot.x + size * (pen + clusters[begin].xOffset), spot.y};
        for (; begin < end; ++begin) {
            const Cluster& cluster = clusters[begin];
            appendEntries(entries, cluster);
            piece += cluster.text;
            pen += cluster.advance;
        }
        drawGlyphs(page, piece, std::move(entries), /*wholeRun=*/false, place);
    }
    return size * pen;
}

// Arabic. A letter looks different at the start, in the middle and at the end of a word, and a font
// has one glyph for each text; so the text of a glyph is a whole word.

/// Returns: the width of the word.
float drawWord(Drawmere& page, const GlyphShaper& shaper, float size, const UnicodeString& word,
               const Spot& end) {
    std::vector<TLGlyphEntry> entries;
    float width = 0;
    for (const Cluster& cluster : shaper.shape(word, HB_DIRECTION_RTL)) {
        appendEntries(entries, cluster);
        width += size * cluster.advance;
    }
    drawGlyphs(page, word, std::move(entries), /*wholeRun=*/true, {end.x - width, end.y});
    return width;
}

void drawArabicLine(Drawmere& page, float size, const UnicodeString& text, const Spot& end) {
    const GlyphShaper shaper(arabicFont);
    const float space = size * shaper.getAdvance(u" ");
    setFont(page, arabicFont, size);
    float x = end.x;
    for (const UnicodeString& word : splitWords(text)) {
        x -= drawWord(page, shaper, size, word, {x, end.y}) + space;
    }
}

// Vertical Japanese: brackets, long vowels and commas have glyphs of their own.

void drawColumn(Drawmere& page, float size, const UnicodeString& text, const Spot& top) {
    const GlyphShaper shaper(japaneseFont);
    std::vector<TLGlyphEntry> entries;
    for (const Cluster& cluster : shaper.shape(text, HB_DIRECTION_TTB)) {
        appendEntries(entries, cluster);
    }
    page.setWritingMode(MoxCommonNS::MOXNAME_TB_RL);
    setFont(page, japaneseFont, size);
    drawGlyphs(page, text, std::move(entries), /*wholeRun=*/false, top);
    page.setWritingMode(MoxCommonNS::MOXNAME_LR_TB);
}

// The page.

void drawLabel(Drawmere& page, const UnicodeString& text, const Spot& spot) {
    page.setFillColor(soft);
    drawLine(page, labelFont, 7.5F, text, spot);
    page.setFillColor(ink);
}

void drawLatin(Drawmere& page) {
    drawLabel(page, u"Latin, with ligatures and kerning", {margin, 50});
    drawLine(page, latinFont, 21, u"The officer\u2019s AVIATOR waffle", {margin, 76});
    drawLine(page, latinFont, 11, u"first fluffy flight: \u201Cefficient\u201D, affluent, To. Wy.",
             {margin, 96});
}

void drawArabic(Drawmere& page) {
    drawLabel(page, u"Arabic, a word a glyph", {margin, 124});
    page.setFillColor(rust);
    drawArabicLine(page, 22, u"السلام عليكم ورحمة الله", {pageWidth - 120, 150});
    page.setFillColor(ink);
    drawArabicLine(page, 13, u"كل إنسان حر في بلده", {pageWidth - 120, 174});
}

void drawDevanagari(Drawmere& page) {
    drawLabel(page, u"Devanagari, a syllable a glyph", {margin, 202});
    drawLine(page, devanagariFont, 20, u"सभी मनुष्य स्वतन्त्र हैं", {margin, 230});
    drawLine(page, devanagariFont, 12, u"ज्ञान बल है। विश्व एक परिवार", {margin, 254});
}

void drawJapanese(Drawmere& page) {
    drawLabel(page, u"vertical Japanese", {pageWidth - 98, 50});
    drawColumn(page, 17, u"「すべての人間は、", {pageWidth - 50, 62});
    drawColumn(page, 17, u"自由である。」（一）", {pageWidth - 76, 62});
}

void drawPage(Drawmere& page) {
    page.setFillColor(paper);
    page.drawRect(pt(0), pt(0), pt(pageWidth), pt(pageHeight), pt(0), pt(0), PAINTMODE_FILL);
    drawLatin(page);
    drawArabic(page);
    drawDevanagari(page);
    drawJapanese(page);
}

/// Writes the page to the file `path`.
void writePage(const UnicodeString& path) {
    SVGConfig config;
    config.streamOutput = false;       // pages go to files, not to a stream
    config.saveOption = u"decimals=2"; // more would not be seen
    SVGPageUri uri(path);              // a run of one page ends under this plain name
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(pageWidth), pt(pageHeight)));
    drawmere.setCanvasSize(pt(pageWidth), pt(pageHeight));
    drawPage(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

} // namespace

int main(int argc, char** argv) {
    try {
        writePage(argc > 1 ? UnicodeString::fromUTF8(argv[1]) : UnicodeString(u"fonts.svg"));
    } catch (const std::exception& error) {
        std::fprintf(stderr, "fonts: %s\n", error.what());
        return 1;
    }
}
