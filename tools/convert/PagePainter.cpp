#include "tools/convert/PagePainter.h"

#include "tools/convert/BitmapTracer.h"
#include "tools/convert/Rectangles.h"

#include <algorithm>
#include <cmath>
#include <optional>

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
    : canvas(drawmere), colors(context),
      paths({context, chosen, pageReport, canvas, colors, layers}),
      texts({context, chosen, pageReport, canvas, colors, layers}, glyphOutlines, fontBook, paths),
      ctx(context), report(pageReport), options(chosen), images(context, chosen, canvas, report),
      shadings(context, canvas, colors),
      layers(canvas, colors, images, report, area, chosen.maxDepth, scanPage),
      blended(context, pageRun) {}

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
