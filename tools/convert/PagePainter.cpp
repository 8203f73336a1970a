#include "tools/convert/PagePainter.h"

#include "tools/convert/BitmapTracer.h"
#include "tools/convert/FitzCall.h"
#include "tools/convert/PathReader.h"
#include "tools/convert/Rectangles.h"

#include <algorithm>
#include <cmath>
#include <optional>
#include <utility>

namespace DrawmereConvert {
namespace {

int toByte(float part) {
    return static_cast<int>(std::lround(std::clamp(part, 0.0F, 1.0F) * 255.0F));
}

} // namespace

PagePainter::PagePainter(fz_context* context, const ConvertOptions& chosen,
                         GlyphOutlines& glyphOutlines, FontBook& fontBook, PageReport& pageReport,
                         Drawmere& drawmere, const fz_rect& area,
                         const std::function<void(GroupScan&)>& scanPage, const PageRun& pageRun)
    : canvas(drawmere), colors(context), ctx(context), report(pageReport), options(chosen),
      outlines(glyphOutlines), fonts(fontBook), texts(canvas, chosen.textMode),
      images(context, chosen, canvas, report), shadings(context, canvas, colors),
      layers(canvas, colors, images, report, area, chosen.maxDepth, scanPage),
      blended(context, pageRun) {}

// Paths.

void PagePainter::noteLength(std::size_t points) {
    if (points > options.maxPathPoints) {
        report.note(APPROXIMATION_LIMIT);
    }
}

void PagePainter::fillPath(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix,
                           const Paint& paint) {
    current.clear();
    readPath(ctx, path, layers.place(matrix), current);
    layers.cutByHand(current);
    if (!current.isEmpty() && layers.enter(current.getBounds())) {
        noteLength(current.points.size());
        canvas.fill(current, isEvenOdd, paint);
    }
}

StrokeMatrices PagePainter::startStroke(const fz_matrix& matrix) {
    current.clear();
    return splitMatrix(layers.place(matrix));
}

void PagePainter::strokePath(const fz_path* path, const fz_stroke_state& style,
                             const fz_matrix& matrix, const Paint& paint) {
    const StrokeMatrices matrices = startStroke(matrix);
    readPath(ctx, path, matrices.points, current);
    stroke(style, matrices, paint);
}

void PagePainter::stroke(const fz_stroke_state& style, const StrokeMatrices& matrices,
                         const Paint& paint) {
    const Pen pen = toPen(style, matrices.penScale);
    const fz_rect bounds = fz_expand_rect(current.getBounds(), getReach(pen));
    if (current.isEmpty() || !layers.enter(fz_transform_rect(bounds, matrices.document))) {
        return;
    }
    noteLength(current.points.size());
    if (matrices.isPlain) {
        canvas.stroke(current, paint, pen);
        return;
    }
    layers.drawMoved(fz_transform_rect(bounds, matrices.document), [&] {
        canvas.push();
        canvas.transform(matrices.document);
        canvas.stroke(current, paint, pen);
        canvas.pop();
    });
}

void PagePainter::clipPath(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix) {
    current.clear();
    readPath(ctx, path, layers.place(matrix), current);
    noteLength(current.points.size());
    layers.pushClip(current, isEvenOdd);
}

void PagePainter::clipStrokePath(const fz_path* path, const fz_stroke_state& style,
                                 const fz_matrix& matrix) {
    const StrokeMatrices matrices = startStroke(matrix);
    readPath(ctx, path, matrices.points, current);
    layers.pushStrokeClip({current, matrices, toPen(style, matrices.penScale)});
}

// Text.

void PagePainter::fillText(const fz_text& text, const fz_matrix& matrix, const Paint& paint) {
    if (options.textMode != TEXTMODE_OUTLINES) {
        writeText(text, matrix, {PAINTMODE_FILL, paint});
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
void PagePainter::readSpan(const fz_text_span& span, const fz_matrix& matrix, const Paint& paint,
                           std::vector<DrawnGlyph>& drawn) {
    const fz_matrix placed = layers.place(matrix);
    GridFont& grid = outlines.findGrid(span.font, fz_concat(span.trm, placed));
    if (!run.accepts(grid.getStep())) {
        fillRun(paint);
    }
    readRun(grid, span, placed, run, drawn);
}

void PagePainter::fillRun(const Paint& paint) {
    if (!run.isEmpty() && layers.enter(run.getBounds())) {
        noteLength(run.countPoints());
        canvas.fillText(run, paint);
    }
    run.clear();
}

void PagePainter::writeText(const fz_text& text, const fz_matrix& matrix, const TextPaint& paint) {
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

bool PagePainter::writeSpan(const fz_text_span& span, const fz_matrix& matrix,
                            const TextPaint& paint) {
    if (fz_font_t3_procs(ctx, span.font)) {
        return paint.mode == PAINTMODE_NONE;
    }
    TextFont& font = fonts.find(span.font);
    const bool embeds = options.textMode == TEXTMODE_FONTS && paint.mode != PAINTMODE_NONE;
    if (embeds && !font.canEmbed()) {
        report.note(APPROXIMATION_TEXT);
        return false;
    }
    const TextSpan text(span, layers.place(matrix), font);
    // For what has no character the viewer's font would show something else. It stays text unseen.
    const bool isDrawn = options.textMode == TEXTMODE_PLAIN && paint.mode != PAINTMODE_NONE &&
                         text.hasUnknown && !text.isEmpty();
    if (isDrawn) {
        report.note(APPROXIMATION_TEXT);
    }
    if (!text.isEmpty() && layers.enter(text.getBounds())) {
        writeEntered(text, isDrawn ? TextPaint{PAINTMODE_NONE} : paint);
    }
    return !isDrawn;
}

void PagePainter::writeEntered(const TextSpan& text, const TextPaint& paint) {
    if (text.isTurned) {
        layers.drawMoved(text.getBounds(), [&] { texts.write(text, paint); });
    } else {
        texts.write(text, paint);
    }
}

// Text that doesn't show can still be searched for, if it is text.
void PagePainter::ignoreText(const fz_text& text, const fz_matrix& matrix) {
    if (options.textMode != TEXTMODE_OUTLINES) {
        writeText(text, matrix, {PAINTMODE_NONE});
    }
}

// A glyph without colours of its own has those of the text.
void PagePainter::drawGlyphs(const std::vector<DrawnGlyph>& glyphs, const fz_matrix& matrix,
                             const Paint& paint) {
    const bool wasReplaying = std::exchange(layers.isReplaying, true);
    const std::optional<MoxColor> before = colors.forced;
    for (const DrawnGlyph& drawn : glyphs) {
        if (drawn.glyph > 255) {
            continue;
        }
        const bool isColored = (drawn.font->t3flags[drawn.glyph] & FZ_DEVFLAG_MASK) == 0;
        if (!isColored) {
            colors.forced = paint.color;
        }
        const fz_matrix placed = fz_concat(drawn.matrix, matrix);
        callFitz(ctx, [&] { fz_run_t3_glyph(ctx, drawn.font, drawn.glyph, placed, device); });
        colors.forced = before;
    }
    layers.isReplaying = wasReplaying;
}

void PagePainter::strokeText(const fz_text& text, const fz_stroke_state& style,
                             const fz_matrix& matrix, const Paint& paint) {
    const StrokeMatrices matrices = startStroke(matrix);
    // A pen that becomes an ellipse is for outlines alone.
    const bool isWritten = options.textMode != TEXTMODE_OUTLINES && matrices.isPlain;
    const TextPaint pen = {PAINTMODE_STROKE, {}, paint, toPen(style, matrices.penScale)};
    std::vector<DrawnGlyph> drawn;
    for (const fz_text_span* span = text.head; span; span = span->next) {
        if (!isWritten || !writeSpan(*span, matrix, pen)) {
            appendRun(outlines, *span, matrices.points, current, drawn); // as what is filled
        }
    }
    stroke(style, matrices, paint);
    drawGlyphs(drawn, matrix, paint); // which have nothing for a pen
}

void PagePainter::clipText(const fz_text& text, const fz_matrix& matrix) {
    current.clear();
    readOutlines(outlines, text, layers.place(matrix), current);
    layers.pushClip(current, /*isEvenOdd=*/false);
}

void PagePainter::clipStrokeText(const fz_text& text, const fz_stroke_state& style,
                                 const fz_matrix& matrix) {
    const StrokeMatrices matrices = startStroke(matrix);
    readOutlines(outlines, text, matrices.points, current);
    layers.pushStrokeClip({current, matrices, toPen(style, matrices.penScale)});
}

// Shadings and images.

void PagePainter::fillShade(fz_shade* shade, const fz_matrix& matrix, float alpha) {
    const fz_matrix placed = layers.place(matrix);
    const fz_rect area = intersect(fz_bound_shade(ctx, shade, placed), layers.getVisible());
    if (isEmpty(area)) {
        return;
    }
    fillBackground(*shade, area, alpha);
    const bool hasGradients = canvas.hasDefinitions();
    if (!hasGradients && shade->use_function && shade->type <= FZ_RADIAL) {
        report.note(APPROXIMATION_GRADIENT);
        layers.fillClip(area, {findMiddleColor(ctx, *shade, colors)});
        return;
    }
    const UnicodeString id = hasGradients ? shadings.define(shade, placed) : UnicodeString();
    if (!id.isEmpty()) {
        layers.fillClip(area, {MoxColor(0, 0, 0, toByte(alpha)), id});
        return;
    }
    if (!layers.enter(area)) {
        return;
    }
    report.note(APPROXIMATION_SHADING);
    const PlacedPixels image = shadings.draw(shade, placed, area, options.shadeDpi);
    if (image.pixels) {
        images.drawPixels(*image.pixels, image.matrix, alpha, colors.use);
    }
}

void PagePainter::fillBackground(const fz_shade& shade, const fz_rect& area, float alpha) {
    const bool covers =
        shade.type == FZ_LINEAR && shade.u.l_or_r.extend[0] != 0 && shade.u.l_or_r.extend[1] != 0;
    if (shade.use_background != 0 && !covers) {
        layers.fillClip(area, {colors.convert(shade.colorspace, shade.background, alpha,
                                              fz_default_color_params)});
    }
}

void PagePainter::fillImage(fz_image* image, const fz_matrix& matrix, float alpha) {
    const fz_matrix placed = layers.place(matrix);
    fz_image* mask = layers.findMaskOf(placed);
    if (mask && canvas.hasDefinitions() && images.isPhotograph(image)) {
        mask = nullptr;
    }
    const fz_rect bounds = fz_transform_rect(fz_unit_rect, placed);
    const bool shows = mask ? layers.enterMasked(bounds) : layers.enter(bounds);
    if (shows) {
        images.draw(image, mask, placed, alpha * canvas.getEffects().opacity, colors.use);
    }
}

void PagePainter::fillImageMask(fz_image* image, const fz_matrix& matrix, const Paint& paint) {
    const fz_matrix placed = layers.place(matrix);
    if (!layers.enter(fz_transform_rect(fz_unit_rect, placed))) {
        return;
    }
    if (traceMask(image, placed)) {
        canvas.fill(current, /*isEvenOdd=*/false, paint);
    } else {
        images.drawStencil(image, placed, paint.color);
    }
}

// A small mask is smaller and sharper as a path.
bool PagePainter::traceMask(fz_image* image, const fz_matrix& matrix) {
    constexpr std::int64_t maxPixels = 16384;
    constexpr std::size_t maxCorners = 2000;
    current.clear();
    if (!image->imagemask || std::int64_t{image->w} * image->h > maxPixels) {
        return false;
    }
    const ImagePixels pixels(ctx, image);
    if (pixels.isEmpty()) {
        return false;
    }
    for (const BitmapLoop& loop : traceBitmap(pixels, maxCorners)) {
        for (const fz_point& corner : loop) {
            const fz_point point = fz_transform_point(corner, matrix);
            if (&corner == &loop.front()) {
                current.moveTo(point.x, point.y);
            } else {
                current.lineTo(point.x, point.y);
            }
        }
        current.close();
    }
    return !current.isEmpty();
}

void PagePainter::clipImageMask(fz_image* image, const fz_matrix& matrix) {
    const fz_matrix placed = layers.place(matrix);
    if (traceMask(image, placed)) {
        layers.pushTracedMask(current);
    } else {
        layers.pushImageMask(image, placed);
    }
}

// Groups.

void PagePainter::beginMask(const fz_rect& area, bool isLuminosity, const MoxColor* backdrop) {
    const bool hasBackdrop = isLuminosity && backdrop;
    layers.beginMask(layers.placeArea(area), isLuminosity,
                     hasBackdrop ? std::optional<MoxColor>(*backdrop) : std::nullopt);
}

void PagePainter::beginGroup(const fz_rect& area, bool isKnockout, int blendMode, float alpha) {
    const bool isBlended = blendMode != FZ_BLEND_NORMAL;
    const std::size_t number = blendedCount;
    blendedCount += isBlended ? 1 : 0;
    const fz_rect placed = layers.placeArea(area);
    if (isSkipping() || (isBlended && drawBlended(number, placed))) {
        ++skippedGroups;
        if (alpha < 1) {
            layers.skipFacts();
        }
        return;
    }
    layers.beginGroup(placed, alpha);
    canvas.setKnockout(isKnockout);
    groups.push_back({isKnockout, canvas.getElementCount()});
}

bool PagePainter::drawBlended(std::size_t number, const fz_rect& area) {
    constexpr std::size_t maxPictures = 32;
    constexpr std::int64_t maxWork = 200'000; // elements, as each picture draws the page anew
    PlacedPixels picture;
    BLENDING blending = BLENDING_UNKNOWN;
    if (layers.isOnPage() && pictureCount < maxPictures && pictureWork < maxWork) {
        ++pictureCount;
        pictureWork += canvas.getElementCount();
        blending = blended.draw(number, area, intersect(area, layers.getVisible()),
                                options.shadeDpi, picture);
    }
    if (blending != BLENDING_PICTURE) {
        if (blending == BLENDING_UNKNOWN) {
            report.note(APPROXIMATION_BLEND);
        }
        return false;
    }
    report.note(APPROXIMATION_MIXTURE);
    const Effects before = canvas.getEffects();
    canvas.setEffects({}); // which the picture has already
    if (picture.pixels && layers.enter(fz_transform_rect(fz_unit_rect, picture.matrix))) {
        images.drawPixels(*picture.pixels, picture.matrix, 1, colors.use);
    }
    canvas.setEffects(before);
    return true;
}

// A single element, be it filled and stroked, has nothing to hide but itself.
void PagePainter::endGroup() {
    if (isSkipping()) {
        --skippedGroups;
        return;
    }
    if (groups.empty()) {
        return;
    }
    const OpenGroup group = groups.back();
    groups.pop_back();
    canvas.setKnockout(!groups.empty() && groups.back().isKnockout);
    if (group.isKnockout && canvas.getElementCount() > group.firstElement + 1) {
        report.note(APPROXIMATION_KNOCKOUT);
    }
    layers.pop();
}

void PagePainter::beginTile(const fz_rect& area, const fz_rect& cell, float xStep, float yStep,
                            const fz_matrix& matrix) {
    layers.beginTile(area, cell, xStep, yStep, matrix);
}

} // namespace DrawmereConvert
