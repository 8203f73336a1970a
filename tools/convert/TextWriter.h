/// Text that keeps its characters.
#pragma once

#include "foundation/records/TLStringWithGlyphInfo.h"
#include "tools/convert/Canvas.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/TextSpan.h"
#include "tools/convert/WordGaps.h"

#include <optional>
#include <vector>

namespace DrawmereConvert {

/// How a text is painted.
struct TextPaint {
    PAINTMODE mode = PAINTMODE_FILL; ///< nothing, for text that is only to be found
    Paint fill{};
    Paint stroke{};
    Pen pen{};
};

/// Writes spans as text elements, as few as put every glyph where it belongs.
class TextWriter {
public:
    TextWriter(Canvas& target, TEXTMODE textMode) : canvas(target), mode(textMode) {}

    /// Draws a span. The document must be ready for it.
    void write(const TextSpan& span, const TextPaint& paint);

private:
    /// The text element in the making.
    struct Line {
        UnicodeString text;
        std::vector<const TextSpan::Cluster*> clusters; // borrowed from the span
        std::vector<float> x;                           // one for each character
        std::size_t placed = 0; // how many need one; the others follow by themselves
        float next = 0;         // where a character is that follows by itself
        float wordSpacing = 0;
        std::vector<TalFont::TLGlyphEntry> glyphs;
        float y = 0;
        int variant = 0;
        bool hasLigature = false;
        bool hasRightToLeft = false;
        bool isFilledAlike = true; // by both rules
    };

    bool isLeftOut(const TextSpan::Cluster& cluster) const;
    bool follows(const TextSpan::Cluster& cluster, int variant, TextFont& font) const;
    bool startsLine(const TextSpan::Cluster& cluster, int variant) const;
    void add(const TextSpan::Cluster& cluster, bool isNext, TextFont& font);
    void separateWords(const TextSpan& span);
    bool fillGaps(const TextSpan& span, const WordGaps& gaps, int blank);
    std::optional<float> measureBlank(TextFont& font, const WordGaps& gaps, float usual) const;
    std::optional<float> findStart(const WordGaps& gaps, float width, float wordSpacing) const;
    bool isShorter(const WordGaps& gaps, float wordSpacing) const;
    void insertBlanks(const WordGaps& gaps, int blank);
    void flushLine(const TextSpan& span, const TextPaint& paint);
    void setPaint(const TextPaint& paint);

    Canvas& canvas;
    TEXTMODE mode;
    Line line;
};

} // namespace DrawmereConvert
