/// Text that keeps its characters.
#pragma once

#include "foundation/records/TLStringWithGlyphInfo.h"
#include "tools/convert/Canvas.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/TextFont.h"

#include <mupdf/fitz.h>

#include <optional>
#include <string>
#include <vector>

namespace DrawmereConvert {

/// How a text is painted.
struct TextPaint {
    PAINTMODE mode = PAINTMODE_FILL; ///< nothing, for text that is only to be found
    Paint fill{};
    Paint stroke{};
    Pen pen{};
};

/// A span of text in one font, ready to be written.
class TextSpan {
public:
    /// Shape: `matrix`, of the text.
    TextSpan(const fz_text_span& span, const fz_matrix& matrix, TextFont& textFont);

    bool isEmpty() const { return clusters.empty() || !(size > 0); }

    /// Returns: where the text is, roughly, in the coordinates of the document.
    fz_rect getBounds() const;

    /// Glyphs, each with the characters it stands for. Shape: points in the coordinates of the
    /// text, which `turn` leads to those of the document.
    struct Cluster {
        std::u16string text;
        int glyph = 0;
        fz_point at{};
        float advance = 0; ///< in points
        bool isRightToLeft = false;
    };

    TextFont& font;
    float size = 0;               ///< of the font, in points
    fz_matrix turn = fz_identity; ///< does not change sizes
    bool isTurned = false;
    bool hasUnknown = false; ///< glyphs that show something else than their characters would
    std::vector<Cluster> clusters;

private:
    void read(const fz_text_span& span, const fz_matrix& matrix, const fz_matrix& back);
    void orderRightToLeft();
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

    /// Equal gaps between words.
    struct Gaps {
        std::vector<int> blanks; // before each cluster
        float width = 0;         // of a blank
    };

    bool isLeftOut(const TextSpan::Cluster& cluster) const;
    bool follows(const TextSpan::Cluster& cluster, int variant, TextFont& font) const;
    bool startsLine(const TextSpan::Cluster& cluster, int variant) const;
    void add(const TextSpan::Cluster& cluster, bool isNext, TextFont& font);
    void fillGaps(const TextSpan& span);
    std::optional<Gaps> measureGaps(const TextSpan& span) const;
    std::optional<float> findStart(const Gaps& gaps, float wordSpacing) const;
    bool isShorter(const Gaps& gaps, float wordSpacing) const;
    void flushLine(const TextSpan& span, const TextPaint& paint);
    void setPaint(const TextPaint& paint);

    Canvas& canvas;
    TEXTMODE mode;
    Line line;
};

} // namespace DrawmereConvert
