#include "tools/convert/TextWriter.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace DrawmereConvert {
namespace {

constexpr float closeEnough = 0.009F; // points
constexpr std::size_t maxLine = 2000;
constexpr std::size_t maxLigature = 4; // a glyph of more characters is no picture of them
constexpr int firstPrivate = 0xE000;
constexpr int privateCount = 0x1900;
constexpr int unknownCharacter = 0xFFFD;
constexpr char16_t noBreak = 0xA0; // a blank that viewers never leave out

float round(float value, float steps) { return std::rint(value * steps) / steps; }

float toHundredth(float value) { return round(value, 100.0F); }

/// Returns: the number with the fewest digits that is close enough.
float shorten(float value) {
    const float tenth = round(value, 10.0F);
    return std::abs(tenth - value) < closeEnough ? tenth : toHundredth(value);
}

/// Returns: whether XML can carry the character and a viewer shows it in its place.
bool isShown(int character) {
    return character >= 0x20 && character != unknownCharacter && character != 0xAD &&
           !(character >= 0x7F && character < 0xA0) &&
           !(character >= 0x200B && character <= 0x200F) &&
           !(character >= 0x202A && character <= 0x202E) &&
           !(character >= 0xD800 && character < 0xE000) && character < 0x110000 &&
           (character & 0xFFFE) != 0xFFFE;
}

void append(std::u16string& text, int character) {
    if (character >= 0x10000) {
        const auto rest = static_cast<unsigned>(character - 0x10000);
        text += {static_cast<char16_t>(0xD800 + (rest >> 10U)),
                 static_cast<char16_t>(0xDC00 + (rest & 0x3FFU))};
    } else {
        text += static_cast<char16_t>(character);
    }
}

/// Returns: the character that viewers show as documents show this one. They hide soft hyphens,
/// which many documents have for those at the ends of lines.
int toShown(int character) {
    constexpr int softHyphen = 0xAD;
    constexpr int hyphen = 0x2010;
    return character == softHyphen ? hyphen : character;
}

bool isBlank(const TextSpan::Cluster& cluster) { return cluster.text == u" "; }

/// Returns: how many positions a viewer takes for the text, one for each character.
std::size_t countCharacters(const std::u16string& text) {
    const auto isSecondHalf = [](char16_t unit) { return unit >= 0xDC00 && unit < 0xE000; };
    return text.size() - static_cast<std::size_t>(std::ranges::count_if(text, isSecondHalf));
}

/// A glyph without a character of its own gets one that no text means.
void appendGlyph(std::u16string& text, int character, int glyph) {
    append(text, isShown(character) ? character : firstPrivate + glyph % privateCount);
}

/// Returns: whether the character belongs to a script that runs from right to left.
bool isRightToLeft(int character) {
    return (character >= 0x590 && character < 0x900) ||
           (character >= 0xFB1D && character < 0xFE00) ||
           (character >= 0xFE70 && character < 0xFF00);
}

/// Returns: whether the glyph goes along with the script around it: blanks, marks, and glyphs of
/// which nobody knows what they are.
bool isNeutral(const TextSpan::Cluster& cluster) {
    const char16_t character = cluster.text.front();
    return cluster.isRightToLeft || (character >= 0x20 && character < 0x30) || character == 0xA0 ||
           (character >= firstPrivate && character < firstPrivate + privateCount);
}

bool isClose(const fz_matrix& one, const fz_matrix& other) {
    constexpr float limit = 1e-4F;
    return std::abs(one.a - other.a) < limit && std::abs(one.b - other.b) < limit &&
           std::abs(one.c - other.c) < limit && std::abs(one.d - other.d) < limit;
}

} // namespace

TextSpan::TextSpan(const fz_text_span& span, const fz_matrix& matrix, TextFont& textFont)
    : font(textFont) {
    fz_matrix em = span.trm;
    em.e = 0;
    em.f = 0;
    fz_matrix linear = matrix;
    linear.e = 0;
    linear.f = 0;
    linear = fz_concat(em, linear);
    size = round(std::hypot(linear.c, linear.d), 1000.0F);
    if (!(size > 0)) {
        return;
    }
    turn = {linear.a / size, linear.b / size, -linear.c / size, -linear.d / size, 0, 0};
    isTurned = !isClose(turn, fz_identity);
    const fz_matrix back = isTurned ? fz_invert_matrix(turn) : fz_identity;
    turn = isTurned ? turn : fz_identity;
    read(span, matrix, back);
    orderRightToLeft();
}

void TextSpan::read(const fz_text_span& span, const fz_matrix& matrix, const fz_matrix& back) {
    clusters.reserve(static_cast<std::size_t>(span.len));
    for (int i = 0; i < span.len; ++i) {
        const fz_text_item& item = span.items[i];
        if (item.gid < 0) {
            if (!clusters.empty() && isShown(item.ucs)) {
                std::u16string& text = clusters.back().text;
                std::ranges::replace(text, u' ', noBreak);
                append(text, item.ucs == ' ' ? noBreak : item.ucs);
                hasUnknown = hasUnknown || text.size() > maxLigature;
            }
            continue;
        }
        Cluster& cluster = clusters.emplace_back();
        const int character = toShown(item.ucs);
        const bool isInk =
            (character == ' ' || !isShown(character)) && !font.showsNothing(item.gid);
        hasUnknown = hasUnknown || (isInk && character != ' ');
        appendGlyph(cluster.text, isInk && character == ' ' ? noBreak : character, item.gid);
        cluster.glyph = item.gid;
        cluster.at = fz_transform_point(fz_transform_point_xy(item.x, item.y, matrix), back);
        cluster.advance = font.getAdvance(item.gid) * size;
        cluster.isRightToLeft = isRightToLeft(item.ucs);
    }
}

// Many documents hold such text in the order of the page, from left to right. What a reader copies
// is to be in the order of speech.
void TextSpan::orderRightToLeft() {
    const auto isStrong = [](const Cluster& cluster) { return cluster.isRightToLeft; };
    auto first = std::ranges::find_if(clusters, isStrong);
    while (first != clusters.end()) {
        auto last = first;
        for (auto next = first + 1; next != clusters.end() && isNeutral(*next) &&
                                    std::abs(next->at.y - first->at.y) < closeEnough;
             ++next) {
            last = next->isRightToLeft ? next : last;
        }
        if (last->at.x > first->at.x) {
            std::reverse(first, last + 1);
        }
        first = std::find_if(last + 1, clusters.end(), isStrong);
    }
}

fz_rect TextSpan::getBounds() const {
    fz_rect bounds = fz_empty_rect;
    for (const Cluster& cluster : clusters) {
        const fz_rect box = {cluster.at.x - 0.1F * size, cluster.at.y - 1.0F * size,
                             cluster.at.x + cluster.advance + 0.1F * size,
                             cluster.at.y + 0.35F * size};
        bounds = fz_union_rect(bounds, box);
    }
    return fz_transform_rect(bounds, turn);
}

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

/// Puts a blank into a line wherever words are that far apart, when it needs no further position
/// then.
void TextWriter::fillGaps(const TextSpan& span) {
    const std::optional<int> blank = span.font.findBlank(line.variant);
    std::optional<Gaps> gaps = blank ? measureGaps(span) : std::nullopt;
    if (!gaps) {
        return;
    }
    const float advance = span.font.getAdvance(*blank) * span.size;
    const float spacing = round(gaps->width - advance, 1000.0F);
    gaps->width = advance + spacing;
    const std::optional<float> start = findStart(*gaps, spacing);
    if (!start || !isShorter(*gaps, spacing)) {
        return;
    }
    line.wordSpacing = spacing;
    line.x.front() = *start;
    span.font.findVariant(u" ", *blank, line.variant);
    Line spaced;
    for (std::size_t i = 0; i < line.clusters.size(); ++i) {
        for (int count = gaps->blanks[i]; count > 0; --count) {
            spaced.text.append(u' ');
            spaced.glyphs.push_back({1, static_cast<std::uint16_t>(*blank)});
        }
        const std::u16string& text = line.clusters[i]->text;
        spaced.text.append(text.data(), static_cast<std::int32_t>(text.size()));
        spaced.glyphs.push_back(line.glyphs[i]);
    }
    line.text = spaced.text;
    line.glyphs = std::move(spaced.glyphs);
    line.placed = 1;
}

/// Returns: how many blanks of what width stand between the glyphs, or nothing.
std::optional<TextWriter::Gaps> TextWriter::measureGaps(const TextSpan& span) const {
    constexpr float minGap = 0.15F; // of the size of the font
    std::vector<float> widths(line.clusters.size());
    float least = 0;
    float sum = 0;
    for (std::size_t i = 1; i < widths.size(); ++i) {
        const TextSpan::Cluster& before = *line.clusters[i - 1];
        const float gap = line.clusters[i]->at.x - before.at.x - before.advance;
        if (gap > minGap * span.size) {
            if (isBlank(before) || isBlank(*line.clusters[i])) {
                return std::nullopt;
            }
            widths[i] = gap;
            least = least > 0 ? std::min(least, gap) : gap;
            sum += gap;
        } else if (std::abs(gap) > closeEnough ||
                   !span.font.joinLetters(line.variant, before.text.back(),
                                          line.clusters[i]->text.front())) {
            return std::nullopt;
        }
    }
    Gaps gaps;
    int count = 0;
    for (const float width : widths) {
        gaps.blanks.push_back(least > 0 ? static_cast<int>(std::lround(width / least)) : 0);
        count += gaps.blanks.back();
        if (gaps.blanks.back() > 1) {
            return std::nullopt;
        }
    }
    gaps.width = count > 0 ? sum / static_cast<float>(count) : 0;
    return gaps;
}

/// Returns: the position of the first glyph that takes every glyph to where it belongs, or nothing.
std::optional<float> TextWriter::findStart(const Gaps& gaps, float wordSpacing) const {
    const float start = line.clusters.front()->at.x;
    float next = start;
    float least = 0;
    float most = 0;
    for (std::size_t i = 0; i < line.clusters.size(); ++i) {
        const TextSpan::Cluster& cluster = *line.clusters[i];
        next += static_cast<float>(gaps.blanks[i]) * gaps.width;
        least = std::min(least, next - cluster.at.x);
        most = std::max(most, next - cluster.at.x);
        next += cluster.advance + (cluster.text == u" " ? wordSpacing : 0);
    }
    const float best = toHundredth(start - (least + most) / 2);
    const bool isClose = start - best - least <= closeEnough && best - start + most <= closeEnough;
    return isClose ? std::optional(best) : std::nullopt;
}

/// Returns: whether the blanks take less room than the positions.
bool TextWriter::isShorter(const Gaps& gaps, float wordSpacing) const {
    constexpr std::size_t positionLength = 7;
    constexpr std::size_t attributeLength = 22;
    const int blanks = std::accumulate(gaps.blanks.begin(), gaps.blanks.end(), 0);
    return static_cast<std::size_t>(blanks) + (wordSpacing == 0 ? 0 : attributeLength) <
           positionLength * (line.placed - 1);
}

void TextWriter::flushLine(const TextSpan& span, const TextPaint& paint) {
    if (line.text.isEmpty()) {
        return;
    }
    if (mode == TEXTMODE_FONTS && line.placed > 1 && !line.hasRightToLeft &&
        canvas.getClipping() != CLIPPING_NONE) { // the lesser profiles have no word spacing
        fillGaps(span);
    }
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
