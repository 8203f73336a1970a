/// A span of text of the document.
#pragma once

#include "tools/convert/TextFont.h"

#include <mupdf/fitz.h>

#include <string>
#include <vector>

namespace DrawmereConvert {

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
        float advance = 0; ///< of the font file, in points
        float width = 0;   ///< of the room it has in the document, in points
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

} // namespace DrawmereConvert
