/// Lines of the example `page`: words are measured, gathered into lines and spread over a width.
#pragma once

#include "Drawmere.h"
#include "PageFonts.h"

#include <vector>

/// A face in a size and colour.
struct Type {
    const Face& face;
    float size;
    DrawmereNS::MoxColor color;
    DrawmereNS::FONTWEIGHT weight = DrawmereNS::FONTWEIGHT_NORMAL;
};

struct Paragraph {
    const char16_t* text;
    Type type;
    float leading;    ///< from one baseline to the next
    float indent;     ///< of the first line
    float letterPart; ///< how much of the spare room goes between letters, 0 to 1
};

/// The words of one line.
struct Line {
    float room;        ///< the width to fill
    float width = 0;   ///< of the words alone, without spaces
    float letters = 0; ///< a count, like the words
    std::vector<icu::UnicodeString> words = {};

    float getGaps() const { return static_cast<float>(words.size()) - 1; }
};

/// The room between two words, and what comes on top of each advance within a word.
struct Spacing {
    float word;
    float letter;
};

/// Returns: how far the character at `index` moves the text on.
inline float getAdvance(const Type& type, const icu::UnicodeString& text, int index) {
    const char16_t next = index + 1 < text.length() ? text[index + 1] : u' ';
    const int advance = type.face.getAdvance(text[index], next);
    return type.size * static_cast<float>(advance) / unitsPerEm;
}

inline float getWidth(const Type& type, const icu::UnicodeString& text) {
    float width = 0;
    for (int i = 0; i < text.length(); ++i) {
        width += getAdvance(type, text, i);
    }
    return width;
}

inline std::vector<icu::UnicodeString> splitWords(const icu::UnicodeString& text) {
    std::vector<icu::UnicodeString> words;
    for (int start = 0; start < text.length();) {
        const int blank = text.indexOf(u' ', start);
        const int end = blank < 0 ? text.length() : blank;
        words.emplace_back(text, start, end - start);
        start = end + 1;
    }
    return words;
}

/// Returns: the lines of a paragraph that is `measure` wide, each as full as it goes.
inline std::vector<Line> breakLines(const Paragraph& paragraph, float measure) {
    const float space = getWidth(paragraph.type, u" ");
    std::vector<Line> lines = {{measure - paragraph.indent}};
    for (const icu::UnicodeString& word : splitWords(paragraph.text)) {
        const float width = getWidth(paragraph.type, word);
        const Line& last = lines.back();
        if (last.width + space * (last.getGaps() + 1) + width > last.room) {
            lines.push_back({measure});
        }
        lines.back().words.push_back(word);
        lines.back().width += width;
        lines.back().letters += static_cast<float>(word.length());
    }
    return lines;
}

/// Returns: the spacing of a line that ends where its words do.
inline Spacing getNaturalSpacing(const Paragraph& paragraph) {
    return {getWidth(paragraph.type, u" "), 0};
}

/// Returns: the spacing with which `line`, of two words or more, fills its room.
inline Spacing getFullSpacing(const Paragraph& paragraph, const Line& line) {
    const float space = getWidth(paragraph.type, u" ");
    const float spare = line.room - line.width - space * line.getGaps();
    const float forLetters = spare * paragraph.letterPart;
    const float letterGaps = line.letters - line.getGaps() - 1;
    return {space + (spare - forLetters) / line.getGaps(), forLetters / letterGaps};
}
