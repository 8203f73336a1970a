#include "tools/convert/BlendedGroups.h"

#include "tools/convert/FitzCall.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>

namespace DrawmereConvert {
namespace {

constexpr float pointsPerInch = 72;
constexpr float maxSide = 4000; // pixels
constexpr int colorCount = 3;
constexpr int roundingError = 1; // between two ways to the same colour

const unsigned char* findPixel(const fz_pixmap* pixels, int x, int y) {
    return pixels->samples + std::ptrdiff_t{y - pixels->y} * pixels->stride +
           std::ptrdiff_t{x - pixels->x} * pixels->n;
}

bool isSamePixel(const fz_pixmap* one, const fz_pixmap* other, int x, int y) {
    const unsigned char* first = findPixel(one, x, y);
    const unsigned char* second = findPixel(other, x, y);
    return std::equal(first, first + colorCount, second,
                      [](int a, int b) { return std::abs(a - b) <= roundingError; });
}

/// Returns: the smallest box around the pixels that differ, empty when none does.
fz_irect findChange(const fz_pixmap* one, const fz_pixmap* other) {
    fz_irect change = {one->x + one->w, one->y + one->h, one->x, one->y};
    for (int y = one->y; y < one->y + one->h; ++y) {
        for (int x = one->x; x < one->x + one->w; ++x) {
            if (!isSamePixel(one, other, x, y)) {
                change = {std::min(change.x0, x), std::min(change.y0, y),
                          std::max(change.x1, x + 1), std::max(change.y1, y + 1)};
            }
        }
    }
    return change;
}

/// Fills `target` with the pixels of `after` that `before` hasn't; the others are clear.
void copyChange(const fz_pixmap* before, const fz_pixmap* after, fz_pixmap* target) {
    unsigned char* row = target->samples;
    for (int y = target->y; y < target->y + target->h; ++y, row += target->stride) {
        unsigned char* pixel = row;
        for (int x = target->x; x < target->x + target->w; ++x, pixel += colorCount + 1) {
            if (!isSamePixel(before, after, x, y)) {
                std::memcpy(pixel, findPixel(after, x, y), colorCount);
                pixel[colorCount] = 255;
            }
        }
    }
}

bool isSame(const fz_rect& one, const fz_rect& other) {
    return one.x0 == other.x0 && one.y0 == other.y0 && one.x1 == other.x1 && one.y1 == other.y1;
}

/// Has the device take part in what opens and closes, but draw nothing more.
void stopDrawing(fz_device* device) {
    device->fill_path = nullptr;
    device->stroke_path = nullptr;
    device->fill_text = nullptr;
    device->stroke_text = nullptr;
    device->fill_shade = nullptr;
    device->fill_image = nullptr;
    device->fill_image_mask = nullptr;
    device->begin_tile = nullptr; // which would be kept, empty as it is, for the next time
    device->end_tile = nullptr;
}

} // namespace

/// What the device that draws is to do otherwise.
struct BlendedGroups::Cut {
    std::size_t number;
    fz_rect area;
    CUT kind;
    decltype(fz_device::begin_group) beginGroup = nullptr; // of the renderer
    decltype(fz_device::end_group) endGroup = nullptr;
    std::size_t seen = 0; // groups with a blend mode
    int depth = 0;        // of groups
    int cutDepth = -1;    // of the group with the number, while it is open
    bool isDone = false;
};

thread_local BlendedGroups::Cut* BlendedGroups::active = nullptr;

void BlendedGroups::beginGroup(fz_context* ctx, fz_device* device, fz_rect area,
                               fz_colorspace* space, int isolated, int knockout, int blendMode,
                               float alpha) {
    Cut& cut = *active;
    const bool isBlended = blendMode != FZ_BLEND_NORMAL;
    const bool isWanted = isBlended && cut.seen == cut.number && isSame(area, cut.area);
    cut.seen += isBlended ? 1 : 0;
    if (isWanted) {
        cut.cutDepth = cut.depth;
        cut.isDone = true;
    }
    ++cut.depth;
    if (isWanted && cut.kind == CUT_BEFORE) {
        stopDrawing(device);
        isolated = 1; // a copy of what lies under it would be mixed with that
    }
    const bool isPlain = isWanted && cut.kind != CUT_BEHIND;
    cut.beginGroup(ctx, device, area, space, isolated, knockout,
                   isPlain ? FZ_BLEND_NORMAL : blendMode, alpha);
}

void BlendedGroups::endGroup(fz_context* ctx, fz_device* device) {
    Cut& cut = *active;
    --cut.depth;
    if (cut.depth == cut.cutDepth) {
        cut.cutDepth = -1;
        stopDrawing(device);
    }
    cut.endGroup(ctx, device);
}

fz_pixmap* BlendedGroups::drawPage(CUT kind) const {
    Cut cut{wanted, wantedArea, kind};
    active = &cut;
    fz_pixmap* pixels = nullptr;
    fz_device* device = nullptr;
    fz_var(pixels);
    fz_var(device);
    fz_try(ctx) {
        pixels = fz_new_pixmap_with_bbox(ctx, fz_device_rgb(ctx), box, nullptr, 0);
        fz_clear_pixmap_with_value(ctx, pixels, 255);
        device = fz_new_draw_device(ctx, fz_scale(scale, scale), pixels);
        cut.beginGroup = device->begin_group;
        cut.endGroup = device->end_group;
        device->begin_group = &BlendedGroups::beginGroup;
        device->end_group = &BlendedGroups::endGroup;
        fz_run_page(ctx, run.page, device, run.matrix, run.cookie);
        fz_close_device(ctx, device);
    }
    fz_always(ctx) { fz_drop_device(ctx, device); }
    fz_catch(ctx) { cut.isDone = false; }
    active = nullptr;
    if (!cut.isDone) {
        fz_drop_pixmap(ctx, pixels);
        return nullptr;
    }
    return pixels;
}

BLENDING BlendedGroups::draw(std::size_t number, const fz_rect& area, const fz_rect& visible,
                             int dpi, PlacedPixels& picture) {
    wanted = number;
    wantedArea = area;
    const float side = std::max({visible.x1 - visible.x0, visible.y1 - visible.y0, 1.0F});
    scale = std::min(static_cast<float>(dpi) / pointsPerInch, maxSide / side);
    box = fz_round_rect(fz_transform_rect(visible, fz_scale(scale, scale)));
    if (!run.page || fz_is_empty_irect(box)) {
        return run.page ? BLENDING_NONE : BLENDING_UNKNOWN;
    }
    fz_pixmap* behind = drawPage(CUT_BEHIND);
    fz_pixmap* plain = behind ? drawPage(CUT_BEHIND_PLAIN) : nullptr;
    BLENDING result = BLENDING_UNKNOWN;
    if (plain && fz_is_empty_irect(findChange(behind, plain))) {
        result = BLENDING_NONE;
    } else if (plain) {
        fz_pixmap* before = drawPage(CUT_BEFORE);
        result = before ? compare(before, behind, picture) : BLENDING_UNKNOWN;
        fz_drop_pixmap(ctx, before);
    }
    fz_drop_pixmap(ctx, plain);
    fz_drop_pixmap(ctx, behind);
    return result;
}

BLENDING BlendedGroups::compare(fz_pixmap* before, fz_pixmap* behind, PlacedPixels& picture) const {
    const fz_irect change = findChange(before, behind);
    if (fz_is_empty_irect(change)) {
        return BLENDING_PICTURE; // of nothing
    }
    fz_pixmap* pixels = nullptr;
    const bool done = callFitz(ctx, [&] {
        pixels = fz_new_pixmap_with_bbox(ctx, fz_device_rgb(ctx), change, nullptr, 1);
        fz_clear_pixmap(ctx, pixels);
    });
    if (!done) {
        return BLENDING_UNKNOWN;
    }
    copyChange(before, behind, pixels);
    picture = PlacedPixels(ctx, pixels, scale);
    return BLENDING_PICTURE;
}

} // namespace DrawmereConvert
