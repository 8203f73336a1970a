#include "tools/convert/OutlineText.h"

namespace DrawmereConvert {
namespace {

void readSpan(GlyphOutlines& outlines, const fz_text_span& span, const fz_matrix& matrix,
              PathData& path) {
    fz_matrix place = span.trm;
    for (int i = 0; i < span.len; ++i) {
        const fz_text_item& item = span.items[i];
        if (item.gid >= 0) {
            place.e = item.x;
            place.f = item.y;
            outlines.append(span.font, item.gid, fz_concat(place, matrix), path);
        }
    }
}

} // namespace

void readOutlines(GlyphOutlines& outlines, const fz_text& text, const fz_matrix& matrix,
                  PathData& path) {
    for (const fz_text_span* span = text.head; span; span = span->next) {
        readSpan(outlines, *span, matrix, path);
    }
    path.tidy();
}

} // namespace DrawmereConvert
