#include "tools/convert/WordGaps.h"

#include <unicode/uchar.h>

#include <algorithm>
#include <cmath>

namespace DrawmereConvert {
namespace {

// All in parts of the size of the font. The narrowest blanks of justified lines are wider than the
// first, and the thin spaces within a number or an abbreviation, a sixth, are not.
constexpr float minGap = 0.175F;
constexpr float looseGap = 0.08F;  // no font has letters so far apart
constexpr float maxSpacing = 0.5F; // letters of typewriters that are farther apart are words

// Words of one letter have a gap on either side, and hardly ever follow each other.
constexpr std::size_t minSpacedGaps = 4;

/// From left to right.
struct Extent {
    float start;
    float end;
};

Extent extentOf(const TextSpan::Cluster& cluster) {
    return {cluster.at.x, cluster.at.x + cluster.width};
}

bool isBlank(const TextSpan::Cluster& cluster) {
    constexpr char16_t noBreak = 0xA0;
    return cluster.text.front() == u' ' || cluster.text.front() == noBreak;
}

// Dots that lead to the number of a page, or an ellipsis.
bool isDot(const TextSpan::Cluster& cluster) { return cluster.text == u"."; }

bool isLetter(char16_t character) { return u_isalpha(character) != 0; }

} // namespace

WordGaps::WordGaps(const Clusters& clusters, float size) : gaps(clusters.size()) {
    measure(clusters, size);
    findRuns(size);
}

// Measures from the word so far and not from the glyph before, which may be an accent. In whatever
// direction the text runs, there is nothing between the two.
void WordGaps::measure(const Clusters& clusters, float size) {
    Extent word = extentOf(*clusters.front());
    for (std::size_t i = 1; i < clusters.size(); ++i) {
        const Extent glyph = extentOf(*clusters[i]);
        const float toRight = glyph.start - word.end;
        const float toLeft = word.start - glyph.end;
        Gap& gap = gaps[i];
        gap.start = toRight >= toLeft ? word.end : glyph.end;
        gap.width = std::max(toRight, toLeft);
        gap.isLeftOut = isBlank(*clusters[i - 1]) || isBlank(*clusters[i]) ||
                        (isDot(*clusters[i - 1]) && isDot(*clusters[i]));
        gap.isInLetters =
            isLetter(clusters[i - 1]->text.back()) && isLetter(clusters[i]->text.front());
        word = gap.isLeftOut || gap.width >= minGap * size
                   ? glyph
                   : Extent{std::min(word.start, glyph.start), std::max(word.end, glyph.end)};
    }
}

/// Finds runs of glyphs that are all apart.
void WordGaps::findRuns(float size) {
    std::vector<Gap*> run;
    for (std::size_t i = 1; i < gaps.size(); ++i) {
        if (gaps[i].isLeftOut) {
            continue;
        }
        if (gaps[i].width >= looseGap * size) {
            run.push_back(&gaps[i]);
        } else {
            judge(run, size);
            run.clear();
        }
    }
    judge(run, size);
}

/// Where letters are spaced out, words are farther apart than letters, and what is beside them and
/// is not spaced out is another word.
void WordGaps::judge(const std::vector<Gap*>& run, float size) {
    float spacing = isSpacedOut(run) ? maxSpacing * size : 0;
    for (const Gap* gap : run) {
        spacing = std::min(spacing, gap->width);
    }
    const float least = std::min(spacing + minGap * size, maxSpacing * size);
    for (Gap* gap : run) {
        const bool isEdge =
            (gap == run.front() && gap != &gaps[1]) || (gap == run.back() && gap != &gaps.back());
        gap->isBetweenWords = gap->width >= (isEdge ? minGap * size : least);
        count += gap->isBetweenWords ? 1U : 0U;
    }
}

/// Returns: whether these are gaps of spaced letters, and not those of columns of digits, of
/// formulas or of dots.
bool WordGaps::isSpacedOut(const std::vector<Gap*>& run) const {
    const auto letters =
        std::ranges::count_if(run, [](const Gap* gap) { return gap->isInLetters; });
    const bool isLong = run.size() >= minSpacedGaps || run.size() + 1 == gaps.size();
    return isLong && 2 * static_cast<std::size_t>(letters) >= run.size();
}

float WordGaps::findPlace(std::size_t index) const {
    const Gap& gap = gaps[index];
    const float whole = std::ceil(gap.start);
    constexpr float tenths = 10.0F;
    return whole <= gap.start + gap.width
               ? whole
               : std::rint((gap.start + gap.width / 2) * tenths) / tenths;
}

} // namespace DrawmereConvert
