#include "tools/convert/Layers.h"

#include "tools/convert/Rectangles.h"

#include <cmath>
#include <utility>

namespace DrawmereConvert {
namespace {

constexpr int ownDepth = 8; // of elements around and inside the containers of clips

// Viewers draw patterns as pixels. On these lines those of common screens fall together.
constexpr float pixelStep = 3;

constexpr MoxColor white(255, 255, 255);

fz_rect roundOut(const fz_rect& rect) {
    return {std::floor(rect.x0 / pixelStep) * pixelStep,
            std::floor(rect.y0 / pixelStep) * pixelStep, std::ceil(rect.x1 / pixelStep) * pixelStep,
            std::ceil(rect.y1 / pixelStep) * pixelStep};
}

bool isClose(const fz_matrix& one, const fz_matrix& other) {
    constexpr float limit = 0.01F;
    return std::abs(one.a - other.a) < limit && std::abs(one.b - other.b) < limit &&
           std::abs(one.c - other.c) < limit && std::abs(one.d - other.d) < limit &&
           std::abs(one.e - other.e) < limit && std::abs(one.f - other.f) < limit;
}

} // namespace

Layers::Layers(Canvas& target, PaintColors& paintColors, ImageWriter& imageWriter,
               PageReport& pageReport, const fz_rect& area, int maxDepth,
               std::function<void(GroupScan&)> look)
    : canvas(target), colors(paintColors), images(imageWriter), report(pageReport),
      depth(maxDepth - ownDepth), scanPage(std::move(look)) {
    scopes.push_back(std::make_unique<Scope>(canvas, report, area, depth));
}

Layers::Scope& Layers::enterScope(const fz_rect& area) {
    auto scope = std::make_unique<Scope>(canvas, report, area, depth);
    scope->matrix = scopes.back()->matrix;
    scope->firstOpening = openings.size();
    scope->isHidden = scopes.back()->isHidden;
    scopes.push_back(std::move(scope));
    return *scopes.back();
}

UnicodeString Layers::leaveScope() {
    clips().leave();
    UnicodeString id = std::move(scopes.back()->id);
    scopes.pop_back();
    return id;
}

Layers::Opening* Layers::getTop() {
    return openings.size() > scopes.back()->firstOpening ? &openings.back() : nullptr;
}

GroupFacts Layers::takeFacts() {
    if (isReplaying) {
        return {2, 1, true, true};
    }
    if (!scan.hasRun()) {
        scanPage(scan);
    }
    return scan.get(nextGroup++);
}

// Clips and what becomes masks.

void Layers::pushClip(const PathData& path, bool isEvenOdd) {
    realize();
    clips().push(path, isEvenOdd);
    openings.push_back({OPENING_CLIP});
}

void Layers::pushStrokeClip(StrokedPath stroked) {
    realize();
    Opening opening{OPENING_STROKE, takeFacts()};
    opening.area = stroked.getBounds();
    opening.stroke = std::make_shared<StrokedPath>(std::move(stroked));
    clips().pushBounds(opening.area);
    openings.push_back(std::move(opening));
}

void Layers::pushImageMask(fz_image* image, const fz_matrix& matrix) {
    realize();
    Opening opening{OPENING_IMAGEMASK, takeFacts()};
    opening.area = fz_transform_rect(fz_unit_rect, matrix);
    opening.image = image;
    opening.matrix = matrix;
    clips().pushBounds(opening.area);
    openings.push_back(std::move(opening));
}

void Layers::pushTracedMask(const PathData& path) {
    skipFacts(); // looking ahead counts it among the groups
    pushClip(path, /*isEvenOdd=*/false);
}

fz_image* Layers::findMaskOf(const fz_matrix& matrix) {
    const Opening* top = getTop();
    const bool isMask = top && top->kind == OPENING_IMAGEMASK && isClose(top->matrix, matrix);
    return isMask ? top->image : nullptr;
}

void Layers::realize() {
    Opening* top = getTop();
    if (top && top->kind == OPENING_STROKE) {
        realizeStroke(*top);
    } else if (top && top->kind == OPENING_IMAGEMASK) {
        realizeImage(*top);
    }
}

void Layers::realizeStroke(Opening& opening) {
    if (!canvas.hasDefinitions()) {
        skipMask(opening);
        return;
    }
    const fz_rect area = roundOut(intersect(opening.area, clips().getVisible()));
    const UnicodeString id = canvas.beginMask(area);
    const StrokedPath& stroked = *opening.stroke;
    if (!stroked.matrices.isPlain) {
        canvas.push();
        canvas.transform(stroked.matrices.document);
    }
    canvas.stroke(stroked.path, {white}, stroked.pen);
    if (!stroked.matrices.isPlain) {
        canvas.pop();
    }
    canvas.endMask();
    openEffect(opening, {1, id}, area);
}

void Layers::skipMask(Opening& opening) {
    report.note(APPROXIMATION_MASK);
    opening.kind = OPENING_EFFECT;
    opening.effects = canvas.getEffects();
}

void Layers::realizeImage(Opening& opening) {
    if (!canvas.hasDefinitions()) {
        skipMask(opening);
        return;
    }
    const fz_rect area = roundOut(intersect(opening.area, clips().getVisible()));
    const UnicodeString id = canvas.beginMask(area);
    if (opening.image->imagemask) {
        images.drawStencil(opening.image, opening.matrix, white);
    } else {
        images.draw(opening.image, nullptr, opening.matrix, 1, COLORUSE_PICTURE);
    }
    canvas.endMask();
    openEffect(opening, {1, id}, area);
}

// Effects.

/// Shape: the opening's bounds are pushed already.
void Layers::openEffect(Opening& opening, const Effects& effects, const fz_rect& area) {
    const bool isForImages = effects.mask.isEmpty() || opening.facts.images == 0;
    const bool isFree = effects.mask.isEmpty() || canvas.getEffects().mask.isEmpty();
    const bool shows = opening.facts.objects > 0 && !isEmpty(area);
    const bool isOneByOne =
        (opening.facts.isSimple() && isForImages && isFree) || !canvas.hasDefinitions();
    if (shows && !isOneByOne) {
        openContainer(opening, effects, area);
        return;
    }
    opening.kind = OPENING_EFFECT;
    opening.effects = canvas.getEffects();
    Effects joined = opening.effects;
    joined.opacity *= effects.opacity;
    if (!effects.mask.isEmpty()) {
        joined.mask = effects.mask;
    }
    canvas.setEffects(joined);
}

void Layers::openContainer(Opening& opening, const Effects& effects, const fz_rect& area) {
    opening.kind = OPENING_CONTAINER;
    opening.effects = effects;
    opening.area = area;
    if (!effects.mask.isEmpty() && !canvas.getEffects().mask.isEmpty()) {
        report.note(APPROXIMATION_MASK);
    }
    UnicodeString id = canvas.beginPattern(area, fz_identity);
    enterScope(area).id = std::move(id);
}

void Layers::closeContainer(const Opening& opening) {
    const UnicodeString id = leaveScope();
    canvas.endPattern();
    if (!clips().enter(opening.area)) {
        return;
    }
    const Effects before = canvas.getEffects();
    Effects joined = before;
    joined.opacity *= opening.effects.opacity;
    if (!opening.effects.mask.isEmpty()) {
        joined.mask = opening.effects.mask;
    }
    canvas.setEffects(joined);
    canvas.fill(toPath(opening.area), /*isEvenOdd=*/true, {MoxColor(), id});
    canvas.setEffects(before);
}

void Layers::beginMask(const fz_rect& area, bool isLuminosity,
                       const std::optional<MoxColor>& backdrop) {
    realize();
    const fz_rect visible = clips().getVisible();
    const fz_rect bounds = roundOut(backdrop ? visible : intersect(area, visible));
    const bool isKnown = canvas.hasDefinitions();
    UnicodeString id = isKnown ? canvas.beginMask(bounds) : UnicodeString();
    masks.push_back({bounds, colors.use});
    colors.use = isLuminosity ? COLORUSE_LUMINOSITY : COLORUSE_ALPHA;
    Scope& scope = enterScope(bounds);
    scope.id = std::move(id);
    scope.isHidden = scope.isHidden || !isKnown;
    if (backdrop && isKnown) {
        canvas.fill(toPath(bounds), /*isEvenOdd=*/true, {*backdrop});
    }
}

void Layers::endMask() {
    if (masks.empty()) {
        return;
    }
    realize();
    const UnicodeString id = leaveScope();
    const OpenMask mask = masks.back();
    masks.pop_back();
    colors.use = mask.useBefore;
    Opening opening{OPENING_EFFECT, takeFacts()};
    clips().pushBounds(mask.area);
    if (canvas.hasDefinitions()) {
        canvas.endMask();
        openEffect(opening, {1, id}, mask.area);
    } else {
        skipMask(opening);
    }
    openings.push_back(std::move(opening));
}

void Layers::beginGroup(const fz_rect& area, float alpha) {
    if (!(alpha < 1)) {
        openings.push_back({OPENING_NOTHING});
        return;
    }
    realize();
    Opening opening{OPENING_EFFECT, takeFacts()};
    const fz_rect bounds = roundOut(intersect(area, clips().getVisible()));
    clips().pushBounds(bounds);
    openEffect(opening, {alpha, {}}, bounds);
    openings.push_back(std::move(opening));
}

void Layers::pop() {
    if (openings.empty()) {
        return;
    }
    const Opening opening = std::move(openings.back());
    openings.pop_back();
    switch (opening.kind) {
    case OPENING_NOTHING:
        return;
    case OPENING_CONTAINER:
        closeContainer(opening);
        break;
    case OPENING_EFFECT:
        canvas.setEffects(opening.effects);
        break;
    case OPENING_STROKE:
    case OPENING_IMAGEMASK:
    case OPENING_CLIP:
        break;
    }
    clips().pop();
}

// Patterns.

void Layers::beginTile(const fz_rect& area, const fz_rect& cell, float xStep, float yStep,
                       const fz_matrix& matrix) {
    const fz_matrix placed = place(matrix);
    const bool isUpright = placed.b == 0 && placed.c == 0;
    const float scale = isUpright ? 1 : fz_matrix_expansion(placed);
    // The pattern's own matrix, which the document needs for what is not upright.
    const fz_matrix own = isUpright ? fz_identity : fz_pre_scale(placed, 1 / scale, 1 / scale);
    const fz_matrix inner = isUpright ? placed : fz_scale(scale, scale);
    const fz_rect view = fz_transform_rect(cell, inner);
    const float width = std::abs(xStep * inner.a);
    const float height = std::abs(yStep * inner.d);
    constexpr float allowed = 1.02F;
    if (view.x1 - view.x0 > width * allowed || view.y1 - view.y0 > height * allowed ||
        !canvas.hasDefinitions()) {
        report.note(APPROXIMATION_PATTERN);
    }
    const fz_rect repeated = {view.x0, view.y0, view.x0 + width, view.y0 + height};
    tiles.push_back({fz_transform_rect(area, matrix)});
    const bool isKnown = canvas.hasDefinitions();
    UnicodeString id = isKnown ? canvas.beginPattern(repeated, own) : UnicodeString();
    const fz_matrix outer = scopes.back()->matrix;
    Scope& scope = enterScope(view);
    scope.id = std::move(id);
    scope.isHidden = scope.isHidden || !isKnown;
    scope.matrix = fz_concat(outer, fz_invert_matrix(own));
    scope.clips.push(toPath(view), /*isEvenOdd=*/true);
}

void Layers::endTile() {
    if (tiles.empty()) {
        return;
    }
    realize();
    const UnicodeString id = leaveScope();
    const fz_rect area = tiles.back();
    tiles.pop_back();
    if (!canvas.hasDefinitions()) {
        return;
    }
    canvas.endPattern();
    fillClip(fz_transform_rect(area, scopes.back()->matrix), {MoxColor(), id});
}

// Drawing.

bool Layers::enter(const fz_rect& bounds) {
    realize();
    return !scopes.back()->isHidden && clips().enter(bounds);
}

// The matrix would move a mask, too, so the mask goes to a pattern that shows the object.
void Layers::drawMoved(const fz_rect& bounds, const std::function<void()>& draw) {
    if (canvas.getEffects().mask.isEmpty()) {
        draw();
        return;
    }
    const fz_rect area = roundOut(bounds);
    const UnicodeString id = canvas.beginPattern(area, fz_identity);
    draw();
    canvas.endPattern();
    canvas.fill(toPath(area), /*isEvenOdd=*/true, {MoxColor(), id});
}

void Layers::fillClip(const fz_rect& bounds, const Paint& paint) {
    if (scopes.back()->isHidden) {
        return;
    }
    const Opening* opening = getTop();
    if (opening && opening->kind == OPENING_STROKE && opening->stroke->matrices.isPlain) {
        const std::shared_ptr<StrokedPath> stroked = opening->stroke;
        if (clips().enter(stroked->getBounds())) {
            canvas.stroke(stroked->path, paint, stroked->pen);
        }
        return;
    }
    realize();
    opening = getTop();
    const bool isShape = opening && opening->kind == OPENING_CLIP;
    const Clip* top = isShape ? clips().getTop() : nullptr;
    if (top && !top->path.isEmpty()) {
        const PathData path = top->path;
        const bool isEvenOdd = top->isEvenOdd;
        if (clips().enter(path.getBounds(), /*leavesOutTop=*/true)) {
            canvas.fill(path, isEvenOdd, paint);
        }
        return;
    }
    const fz_rect visible = intersect(bounds, clips().getVisible());
    if (!isEmpty(visible) && clips().enter(visible)) {
        canvas.fill(toPath(visible), /*isEvenOdd=*/true, paint);
    }
}

void Layers::cutByHand(PathData& path) {
    fz_rect rect{};
    if (clips().isCutByHand() && path.isRectangle(rect)) {
        path = toPath(intersect(rect, clips().getVisible()));
    }
}

void Layers::clipToPage() { clips().push(toPath(clips().getVisible()), /*isEvenOdd=*/true); }

void Layers::finish() {
    while (!openings.empty()) {
        pop();
    }
    clips().leave();
    canvas.flush();
}

} // namespace DrawmereConvert
