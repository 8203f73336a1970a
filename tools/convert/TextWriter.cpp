#include "tools/convert/TextWriter.h"

#include <algorithm>
#include <cmath>

namespace DrawmereConvert {
namespace {

constexpr float closeEnough = 0.009F; // points
constexpr std::size_t maxLine = 2000;
constexpr int firstPrivate = 0xE000;
constexpr int privateCount = 0x1900;
constexpr int unknownCharacter = 0xFFFD;

float round(float value, float steps) { return std::rint(value * steps) / steps; }

float toHundredth(float value) { return round(value, 100.0F); }

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
                append(clusters.back().text, item.ucs);
            }
            continue;
        }
        Cluster& cluster = clusters.emplace_back();
        appendGlyph(cluster.text, item.ucs, item.gid);
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
        const int variant = mode == TEXTMODE_FONTS
                                ? span.font.findVariant(cluster.text, cluster.glyph, line.variant)
                                : 0;
        if (startsLine(cluster, variant)) {
            flushLine(span, paint);
            line.variant = variant;
            line.y = toHundredth(cluster.at.y);
            line.isLigature = cluster.text.size() > 1;
        }
        add(cluster);
    }
    flushLine(span, paint);
    if (span.isTurned) {
        canvas.pop();
    }
}

// Viewers take a ligature for its letters wherever they follow each other, and lose its shape where
// each letter has a position: so it stands alone. In a font of the viewer there is no ligature.
bool TextWriter::startsLine(const TextSpan::Cluster& cluster, int variant) const {
    if (line.text.isEmpty()) {
        return true;
    }
    const bool isLigature = mode == TEXTMODE_FONTS && cluster.text.size() > 1;
    return variant != line.variant || std::abs(cluster.at.y - line.y) > closeEnough || isLigature ||
           (mode == TEXTMODE_FONTS && line.isLigature) || line.x.size() >= maxLine;
}

void TextWriter::add(const TextSpan::Cluster& cluster) {
    const std::size_t count = cluster.text.size();
    const float x = toHundredth(cluster.at.x);
    // What follows by itself is put in order by the viewer, where there is another direction.
    const bool isOrdered = cluster.isRightToLeft || line.endsRightToLeft;
    line.endsRightToLeft = cluster.isRightToLeft;
    const bool follows = mode == TEXTMODE_FONTS && !line.x.empty() && !isOrdered &&
                         std::abs(line.next - cluster.at.x) <= closeEnough;
    // In a font of the viewer the characters of a ligature share its room.
    const float step = cluster.advance / static_cast<float>(count);
    for (std::size_t i = 0; i < count; ++i) {
        line.x.push_back(toHundredth(x + step * static_cast<float>(i)));
    }
    if (!follows) {
        line.placed = mode == TEXTMODE_FONTS ? line.x.size() - count + 1 : line.x.size();
    }
    line.next = (follows ? line.next : x) + cluster.advance;
    line.text.append(cluster.text.data(), static_cast<std::int32_t>(count));
    line.glyphs.push_back(
        {static_cast<std::int16_t>(count), static_cast<std::uint16_t>(cluster.glyph)});
}

void TextWriter::flushLine(const TextSpan& span, const TextPaint& paint) {
    if (line.text.isEmpty()) {
        return;
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
    settings.setFillRule(mode == TEXTMODE_FONTS ? FILLRULE_NONZERO : FILLRULE_EVENODD);
}

} // namespace DrawmereConvert
