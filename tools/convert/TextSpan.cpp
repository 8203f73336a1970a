#include "tools/convert/TextSpan.h"

#include <algorithm>
#include <cmath>

namespace DrawmereConvert {
namespace {

constexpr float closeEnough = 0.009F;  // points
constexpr std::size_t maxLigature = 4; // a glyph of more characters is no picture of them
constexpr int firstPrivate = 0xE000;
constexpr int privateCount = 0x1900;
constexpr int unknownCharacter = 0xFFFD;
constexpr char16_t noBreak = 0xA0; // a blank that viewers never leave out

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
    size = std::rint(std::hypot(linear.c, linear.d) * 1000.0F) / 1000.0F;
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
        cluster.width =
            font.findStretchedWidth(item.gid).value_or(font.getAdvance(item.gid)) * size;
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

} // namespace DrawmereConvert
