#include "tools/convert/OutlineText.h"

namespace DrawmereConvert {

void readOutlines(GlyphOutlines& outlines, const fz_text_span& span, const fz_matrix& matrix,
                  PathData& path, std::vector<DrawnGlyph>& drawn) {
    fz_matrix place = span.trm;
    for (int i = 0; i < span.len; ++i) {
        const fz_text_item& item = span.items[i];
        if (item.gid >= 0) {
            place.e = item.x;
            place.f = item.y;
            if (!outlines.append(span.font, item.gid, fz_concat(place, matrix), path)) {
                drawn.push_back({span.font, item.gid, place});
            }
        }
    }
}

std::vector<DrawnGlyph> readOutlines(GlyphOutlines& outlines, const fz_text& text,
                                     const fz_matrix& matrix, PathData& path) {
    std::vector<DrawnGlyph> drawn;
    for (const fz_text_span* span = text.head; span; span = span->next) {
        readOutlines(outlines, *span, matrix, path, drawn);
    }
    path.tidy();
    return drawn;
}

} // namespace DrawmereConvert
