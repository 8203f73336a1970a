#include "tools/convert/TextPainter.h"

#include "tools/convert/FitzCall.h"

#include <optional>
#include <utility>

namespace DrawmereConvert {

void TextPainter::fill(const fz_text& text, const fz_matrix& matrix, const Paint& paint) {
    if (tools.options.textMode != TEXTMODE_OUTLINES) {
        write(text, matrix, {PAINTMODE_FILL, paint});
        return;
    }
    std::vector<DrawnGlyph> drawn;
    for (const fz_text_span* span = text.head; span; span = span->next) {
        readSpan(*span, matrix, paint, drawn);
    }
    fillRun(paint);
    drawGlyphs(drawn, matrix, paint);
}

/// Takes up the outlines of a span, and fills those before it when their grid is another.
void TextPainter::readSpan(const fz_text_span& span, const fz_matrix& matrix, const Paint& paint,
                           std::vector<DrawnGlyph>& drawn) {
    const fz_matrix placed = tools.layers.place(matrix);
    GridFont& grid = outlines.findGrid(span.font, fz_concat(span.trm, placed));
    if (!run.accepts(grid.getStep())) {
        fillRun(paint);
    }
    readRun(grid, span, placed, run, drawn);
}

void TextPainter::fillRun(const Paint& paint) {
    if (!run.isEmpty() && tools.layers.enter(run.getBounds())) {
        paths.noteLength(run.countPoints());
        tools.canvas.fillText(run, paint);
    }
    run.clear();
}

void TextPainter::write(const fz_text& text, const fz_matrix& matrix, const TextPaint& paint) {
    for (const fz_text_span* span = text.head; span; span = span->next) {
        if (writeSpan(*span, matrix, paint)) {
            continue;
        }
        std::vector<DrawnGlyph> drawn;
        readSpan(*span, matrix, paint.fill, drawn);
        fillRun(paint.fill);
        drawGlyphs(drawn, matrix, paint.fill);
    }
}

bool TextPainter::writeSpan(const fz_text_span& span, const fz_matrix& matrix,
                            const TextPaint& paint) {
    if (fz_font_t3_procs(tools.ctx, span.font)) {
        return paint.mode == PAINTMODE_NONE;
    }
    TextFont& font = fonts.find(span.font);
    const bool embeds = tools.options.textMode == TEXTMODE_FONTS && paint.mode != PAINTMODE_NONE;
    if (embeds && !font.canEmbed()) {
        tools.report.note(APPROXIMATION_TEXT);
        return false;
    }
    const TextSpan text(span, tools.layers.place(matrix), font);
    // For what has no character the viewer's font would show something else. It stays text unseen.
    const bool isDrawn = tools.options.textMode == TEXTMODE_PLAIN && paint.mode != PAINTMODE_NONE &&
                         text.hasUnknown && !text.isEmpty();
    if (isDrawn) {
        tools.report.note(APPROXIMATION_TEXT);
    }
    if (!text.isEmpty() && tools.layers.enter(text.getBounds())) {
        writeEntered(text, isDrawn ? TextPaint{PAINTMODE_NONE} : paint);
    }
    return !isDrawn;
}

void TextPainter::writeEntered(const TextSpan& text, const TextPaint& paint) {
    if (text.isTurned) {
        tools.layers.drawMoved(text.getBounds(), [&] { writer.write(text, paint); });
    } else {
        writer.write(text, paint);
    }
}

// Text that doesn't show can still be searched for, if it is text.
void TextPainter::ignore(const fz_text& text, const fz_matrix& matrix) {
    if (tools.options.textMode != TEXTMODE_OUTLINES) {
        write(text, matrix, {PAINTMODE_NONE});
    }
}

// A glyph without colours of its own has those of the text.
void TextPainter::drawGlyphs(const std::vector<DrawnGlyph>& glyphs, const fz_matrix& matrix,
                             const Paint& paint) {
    const bool wasReplaying = std::exchange(tools.layers.isReplaying, true);
    const std::optional<MoxColor> before = tools.colors.forced;
    for (const DrawnGlyph& drawn : glyphs) {
        if (drawn.glyph > 255) {
            continue;
        }
        const bool isColored = (drawn.font->t3flags[drawn.glyph] & FZ_DEVFLAG_MASK) == 0;
        if (!isColored) {
            tools.colors.forced = paint.color;
        }
        const fz_matrix placed = fz_concat(drawn.matrix, matrix);
        callFitz(tools.ctx,
                 [&] { fz_run_t3_glyph(tools.ctx, drawn.font, drawn.glyph, placed, device); });
        tools.colors.forced = before;
    }
    tools.layers.isReplaying = wasReplaying;
}

void TextPainter::stroke(const fz_text& text, const fz_stroke_state& style, const fz_matrix& matrix,
                         const Paint& paint) {
    const StrokeMatrices matrices = splitMatrix(tools.layers.place(matrix));
    current.clear();
    // A pen that becomes an ellipse is for outlines alone.
    const bool isWritten = tools.options.textMode != TEXTMODE_OUTLINES && matrices.isPlain;
    const TextPaint pen = {PAINTMODE_STROKE, {}, paint, toPen(style, matrices.penScale)};
    std::vector<DrawnGlyph> drawn;
    for (const fz_text_span* span = text.head; span; span = span->next) {
        if (!isWritten || !writeSpan(*span, matrix, pen)) {
            appendRun(outlines, *span, matrices.points, current, drawn); // as what is filled
        }
    }
    paths.strokeRead(current, style, matrices, paint);
    drawGlyphs(drawn, matrix, paint); // which have nothing for a pen
}

void TextPainter::clip(const fz_text& text, const fz_matrix& matrix) {
    current.clear();
    readOutlines(outlines, text, tools.layers.place(matrix), current);
    tools.layers.pushClip(current, /*isEvenOdd=*/false);
}

void TextPainter::clipStroke(const fz_text& text, const fz_stroke_state& style,
                             const fz_matrix& matrix) {
    const StrokeMatrices matrices = splitMatrix(tools.layers.place(matrix));
    current.clear();
    readOutlines(outlines, text, matrices.points, current);
    tools.layers.pushStrokeClip({current, matrices, toPen(style, matrices.penScale)});
}

} // namespace DrawmereConvert
