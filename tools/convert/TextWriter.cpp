#include "tools/convert/TextWriter.h"

#include <algorithm>
#include <cmath>

namespace DrawmereConvert {
namespace {

constexpr float closeEnough = 0.009F; // points
constexpr std::size_t maxLine = 2000;

float round(float value, float steps) { return std::rint(value * steps) / steps; }

float toHundredth(float value) { return round(value, 100.0F); }

/// Returns: the number with the fewest digits that is close enough.
float shorten(float value) {
    const float tenth = round(value, 10.0F);
    return std::abs(tenth - value) < closeEnough ? tenth : toHundredth(value);
}

bool isBlank(const TextSpan::Cluster& cluster) { return cluster.text == u" "; }

/// Returns: how many positions a viewer takes for the text, one for each character.
std::size_t countCharacters(const std::u16string& text) {
    const auto isSecondHalf = [](char16_t unit) { return unit >= 0xDC00 && unit < 0xE000; };
    return text.size() - static_cast<std::size_t>(std::ranges::count_if(text, isSecondHalf));
}

} // namespace

void TextWriter::write(const TextSpan& span, const TextPaint& paint) {
    canvas.flush();
    if (span.isTurned) {
        canvas.push();
        canvas.transform(span.turn);
    }
    for (const TextSpan::Cluster& cluster : span.clusters) {
        if (isLeftOut(cluster)) {
            continue;
        }
        const int variant = mode == TEXTMODE_FONTS
                                ? span.font.findVariant(cluster.text, cluster.glyph, line.variant)
                                : 0;
        const bool isNext = follows(cluster, variant, span.font);
        if (!isNext && startsLine(cluster, variant)) {
            flushLine(span, paint);
            if (isBlank(cluster)) {
                continue;
            }
            line.variant = variant;
            line.y = toHundredth(cluster.at.y);
        }
        add(cluster, isNext, span.font);
    }
    flushLine(span, paint);
    if (span.isTurned) {
        canvas.pop();
    }
}

/// Returns: whether the cluster is a blank that some viewers leave out, and with it a position of
/// the list: the first of a text, and one after another. They show nothing; what comes behind them
/// has a position.
bool TextWriter::isLeftOut(const TextSpan::Cluster& cluster) const {
    return isBlank(cluster) && (line.clusters.empty() || isBlank(*line.clusters.back()));
}

/// Returns: whether the cluster is where it belongs without a position of its own. In a font of the
/// viewer nobody knows; and the viewer puts it in order where there is another direction.
bool TextWriter::follows(const TextSpan::Cluster& cluster, int variant, TextFont& font) const {
    return mode == TEXTMODE_FONTS && !line.clusters.empty() && variant == line.variant &&
           !cluster.isRightToLeft && !line.clusters.back()->isRightToLeft &&
           std::abs(cluster.at.y - line.y) <= closeEnough &&
           std::abs(line.next - cluster.at.x) <= closeEnough &&
           font.joinLetters(variant, line.clusters.back()->text.back(), cluster.text.front());
}

// Viewers lose the shape of a ligature when each of its letters has a position: so it is among
// those without. In a font of the viewer there is no ligature.
bool TextWriter::startsLine(const TextSpan::Cluster& cluster, int variant) const {
    return line.clusters.empty() || variant != line.variant || line.hasLigature ||
           std::abs(cluster.at.y - line.y) > closeEnough || line.x.size() >= maxLine;
}

void TextWriter::add(const TextSpan::Cluster& cluster, bool isNext, TextFont& font) {
    const bool embeds = mode == TEXTMODE_FONTS;
    const std::size_t count = countCharacters(cluster.text);
    const float x = shorten(cluster.at.x);
    // In a font of the viewer the characters of a ligature share its room.
    const float step = cluster.advance / static_cast<float>(count);
    for (std::size_t i = 0; i < count; ++i) {
        line.x.push_back(i == 0 ? x : shorten(cluster.at.x + step * static_cast<float>(i)));
    }
    if (!isNext) {
        line.placed = embeds ? line.x.size() - count + 1 : line.x.size();
    }
    line.next = (isNext ? line.next : x) + cluster.advance;
    line.hasLigature = line.hasLigature || (embeds && cluster.text.size() > 1);
    line.hasRightToLeft = line.hasRightToLeft || cluster.isRightToLeft;
    line.isFilledAlike = line.isFilledAlike && (!embeds || font.isFilledAlike(cluster.glyph));
    line.clusters.push_back(&cluster);
    line.text.append(cluster.text.data(), static_cast<std::int32_t>(cluster.text.size()));
    line.glyphs.push_back({static_cast<std::int16_t>(cluster.text.size()),
                           static_cast<std::uint16_t>(cluster.glyph)});
}

/// Puts a blank wherever words are apart without one, so that they can be searched for and copied.
void TextWriter::separateWords(const TextSpan& span) {
    const bool embeds = mode == TEXTMODE_FONTS;
    const std::optional<int> blank = embeds ? span.font.findBlank(line.variant) : 0;
    if (!blank) {
        return;
    }
    const WordGaps gaps(line.clusters, span.size);
    // The lesser profiles have no word spacing.
    const bool canFill =
        embeds && line.placed > 1 && !line.hasRightToLeft && canvas.getClipping() != CLIPPING_NONE;
    if (!(canFill && fillGaps(span, gaps, *blank))) {
        insertBlanks(gaps, *blank);
    }
    if (embeds && !gaps.isEmpty()) {
        span.font.findVariant(u" ", *blank, line.variant);
    }
}

/// Spaces words equally, when the line needs no further position then. Returns: whether it does.
bool TextWriter::fillGaps(const TextSpan& span, const WordGaps& gaps, int blank) {
    const float advance = span.font.getAdvance(blank) * span.size;
    const std::optional<float> width = measureBlank(span.font, gaps, advance);
    if (!width) {
        return false;
    }
    const float spacing = round(*width - advance, 1000.0F);
    const std::optional<float> start = findStart(gaps, advance + spacing, spacing);
    if (!start || !isShorter(gaps, spacing)) {
        return false;
    }
    insertBlanks(gaps, blank);
    line.wordSpacing = spacing;
    line.x.front() = *start;
    line.placed = 1;
    return true;
}

/// Returns: the width of a blank for all gaps, `usual` without any, or nothing when that is not
/// all it needs.
std::optional<float> TextWriter::measureBlank(TextFont& font, const WordGaps& gaps,
                                              float usual) const {
    float sum = 0;
    int count = 0;
    for (std::size_t i = 1; i < line.clusters.size(); ++i) {
        const TextSpan::Cluster& before = *line.clusters[i - 1];
        const float gap = line.clusters[i]->at.x - before.at.x - before.advance;
        if (gaps.isBefore(i) && gap > closeEnough) {
            sum += gap;
            ++count;
        } else if (std::abs(gap) > closeEnough ||
                   !font.joinLetters(line.variant, before.text.back(),
                                     line.clusters[i]->text.front())) {
            return std::nullopt;
        }
    }
    return count > 0 ? sum / static_cast<float>(count) : usual;
}

/// Returns: the position of the first glyph that takes every glyph to where it belongs, or nothing.
std::optional<float> TextWriter::findStart(const WordGaps& gaps, float width,
                                           float wordSpacing) const {
    const float start = line.clusters.front()->at.x;
    float next = start;
    float least = 0;
    float most = 0;
    for (std::size_t i = 0; i < line.clusters.size(); ++i) {
        const TextSpan::Cluster& cluster = *line.clusters[i];
        next += gaps.isBefore(i) ? width : 0;
        least = std::min(least, next - cluster.at.x);
        most = std::max(most, next - cluster.at.x);
        next += cluster.advance + (cluster.text == u" " ? wordSpacing : 0);
    }
    const float best = toHundredth(start - (least + most) / 2);
    const bool isClose = start - best - least <= closeEnough && best - start + most <= closeEnough;
    return isClose ? std::optional(best) : std::nullopt;
}

/// Returns: whether equal blanks take less room than the positions, those of blanks among them.
bool TextWriter::isShorter(const WordGaps& gaps, float wordSpacing) const {
    constexpr std::size_t positionLength = 7;
    constexpr std::size_t blankPositionLength = 4;
    constexpr std::size_t attributeLength = 22;
    return (wordSpacing == 0 ? 0 : attributeLength) <
           positionLength * (line.placed - 1) + blankPositionLength * gaps.size();
}

/// Puts blanks into gaps behind which a glyph has a position, which is then as it was.
void TextWriter::insertBlanks(const WordGaps& gaps, int blank) {
    if (gaps.isEmpty()) {
        return;
    }
    Line spaced;
    std::size_t read = 0; // characters
    for (std::size_t i = 0; i < line.clusters.size(); ++i) {
        if (gaps.isBefore(i) && read < line.placed) {
            spaced.text.append(u' ');
            spaced.x.push_back(gaps.findPlace(i));
            spaced.glyphs.push_back({1, static_cast<std::uint16_t>(blank)});
        }
        const std::u16string& text = line.clusters[i]->text;
        spaced.text.append(text.data(), static_cast<std::int32_t>(text.size()));
        spaced.glyphs.push_back(line.glyphs[i]);
        for (const std::size_t end = read + countCharacters(text); read < end; ++read) {
            spaced.x.push_back(line.x[read]);
        }
    }
    line.placed += spaced.x.size() - line.x.size();
    line.text = spaced.text;
    line.x = std::move(spaced.x);
    line.glyphs = std::move(spaced.glyphs);
}

void TextWriter::flushLine(const TextSpan& span, const TextPaint& paint) {
    if (line.text.isEmpty()) {
        return;
    }
    separateWords(span);
    std::vector<MoxLength> x;
    std::transform(line.x.begin(), line.x.begin() + static_cast<std::ptrdiff_t>(line.placed),
                   std::back_inserter(x), pt);
    SVGFont font;
    FS_ExtraFonts* file = nullptr;
    if (mode == TEXTMODE_FONTS && paint.mode != PAINTMODE_NONE) {
        file = span.font.describe(line.variant, span.size, font);
    } else {
        span.font.describePlain(span.size, font);
    }
    canvas.beginElement();
    setPaint(paint);
    canvas.out.setFont(&font, file);
    canvas.out.setWordSpacing(pt(line.wordSpacing));
    TalFont::TLStringWithGlyphInfo glyphs(line.glyphs);
    canvas.out.drawText(line.text, x, {pt(line.y)}, {}, paint.mode, &glyphs, /*wholeRun=*/false,
                        /*leftToRight=*/true);
    canvas.endElement();
    line = Line();
}

void TextWriter::setPaint(const TextPaint& paint) {
    PaintState& settings = canvas.settings;
    if ((paint.mode & PAINTMODE_FILL) != 0) {
        settings.setFill(paint.fill);
    } else {
        settings.setNoFill();
    }
    if ((paint.mode & PAINTMODE_STROKE) != 0) {
        settings.setStroke(paint.stroke, paint.pen);
    } else {
        settings.setNoStroke();
    }
    // The rule reaches the outlines of embedded fonts, and those of font files mean this one.
    settings.setFillRule(line.isFilledAlike ? FILLRULE_EVENODD : FILLRULE_NONZERO);
}

} // namespace DrawmereConvert
