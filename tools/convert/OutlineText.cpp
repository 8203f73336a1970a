#include "tools/convert/OutlineText.h"

namespace DrawmereConvert {
namespace {

/// Calls `take` with the number of each glyph and the matrix that places it in the text.
template <class Take> void forEachGlyph(const fz_text_span& span, const Take& take) {
    fz_matrix place = span.trm;
    for (int i = 0; i < span.len; ++i) {
        const fz_text_item& item = span.items[i];
        if (item.gid >= 0) {
            place.e = item.x;
            place.f = item.y;
            take(item.gid, place);
        }
    }
}

} // namespace

void readRun(GridFont& grid, const fz_text_span& span, const fz_matrix& matrix, GlyphRun& run,
             std::vector<DrawnGlyph>& drawn) {
    forEachGlyph(span, [&](int glyph, const fz_matrix& place) {
        const GridOutline& outline = grid.find(glyph);
        if (outline.isDrawing) {
            drawn.push_back({span.font, glyph, place});
        } else {
            run.add(outline, grid.getStep(), fz_transform_point_xy(place.e, place.f, matrix));
        }
    });
}

void appendRun(GlyphOutlines& outlines, const fz_text_span& span, const fz_matrix& matrix,
               PathData& path, std::vector<DrawnGlyph>& drawn) {
    GlyphRun run;
    readRun(outlines.findGrid(span.font, fz_concat(span.trm, matrix)), span, matrix, run, drawn);
    run.appendTo(path);
}

void readOutlines(GlyphOutlines& outlines, const fz_text& text, const fz_matrix& matrix,
                  PathData& path) {
    for (const fz_text_span* span = text.head; span; span = span->next) {
        forEachGlyph(*span, [&](int glyph, const fz_matrix& place) {
            outlines.append(span->font, glyph, fz_concat(place, matrix), path);
        });
    }
    path.tidy();
}

} // namespace DrawmereConvert
