#include "tools/convert/GroupScan.h"

#include "tools/convert/FitzCall.h"

#include <algorithm>

namespace DrawmereConvert {
namespace {

constexpr std::size_t maxCompared = 64; // more objects than this count as overlapping

struct ScanDevice {
    fz_device base;
    GroupScan* scan; // borrowed
};

GroupScan& scanOf(fz_device* device) { return *reinterpret_cast<ScanDevice*>(device)->scan; }

void fillPath(fz_context* ctx, fz_device* device, const fz_path* path, int /*isEvenOdd*/,
              fz_matrix matrix, fz_colorspace* /*space*/, const float* /*color*/, float /*alpha*/,
              fz_color_params /*params*/) {
    scanOf(device).add(fz_bound_path(ctx, path, nullptr, matrix), false);
}

void strokePath(fz_context* ctx, fz_device* device, const fz_path* path,
                const fz_stroke_state* stroke, fz_matrix matrix, fz_colorspace* /*space*/,
                const float* /*color*/, float /*alpha*/, fz_color_params /*params*/) {
    scanOf(device).add(fz_bound_path(ctx, path, stroke, matrix), false);
}

void fillText(fz_context* ctx, fz_device* device, const fz_text* text, fz_matrix matrix,
              fz_colorspace* /*space*/, const float* /*color*/, float /*alpha*/,
              fz_color_params /*params*/) {
    scanOf(device).add(fz_bound_text(ctx, text, nullptr, matrix), false);
}

void strokeText(fz_context* ctx, fz_device* device, const fz_text* text,
                const fz_stroke_state* stroke, fz_matrix matrix, fz_colorspace* /*space*/,
                const float* /*color*/, float /*alpha*/, fz_color_params /*params*/) {
    scanOf(device).add(fz_bound_text(ctx, text, stroke, matrix), false);
}

void fillShade(fz_context* ctx, fz_device* device, fz_shade* shade, fz_matrix matrix,
               float /*alpha*/, fz_color_params /*params*/) {
    scanOf(device).add(fz_bound_shade(ctx, shade, matrix), false);
}

void fillImage(fz_context* /*ctx*/, fz_device* device, fz_image* /*image*/, fz_matrix matrix,
               float /*alpha*/, fz_color_params /*params*/) {
    scanOf(device).add(fz_transform_rect(fz_unit_rect, matrix), true);
}

void fillStencil(fz_context* /*ctx*/, fz_device* device, fz_image* /*image*/, fz_matrix matrix,
                 fz_colorspace* /*space*/, const float* /*color*/, float /*alpha*/,
                 fz_color_params /*params*/) {
    scanOf(device).add(fz_transform_rect(fz_unit_rect, matrix), true);
}

void clipPath(fz_context* /*ctx*/, fz_device* device, const fz_path* /*path*/, int /*isEvenOdd*/,
              fz_matrix /*matrix*/, fz_rect /*scissor*/) {
    scanOf(device).beginPlain();
}

void clipText(fz_context* /*ctx*/, fz_device* device, const fz_text* /*text*/, fz_matrix /*matrix*/,
              fz_rect /*scissor*/) {
    scanOf(device).beginPlain();
}

void clipStrokePath(fz_context* /*ctx*/, fz_device* device, const fz_path* /*path*/,
                    const fz_stroke_state* /*stroke*/, fz_matrix /*matrix*/, fz_rect /*scissor*/) {
    scanOf(device).begin();
}

void clipStrokeText(fz_context* /*ctx*/, fz_device* device, const fz_text* /*text*/,
                    const fz_stroke_state* /*stroke*/, fz_matrix /*matrix*/, fz_rect /*scissor*/) {
    scanOf(device).begin();
}

void clipImage(fz_context* /*ctx*/, fz_device* device, fz_image* /*image*/, fz_matrix /*matrix*/,
               fz_rect /*scissor*/) {
    scanOf(device).begin();
}

void endAny(fz_context* /*ctx*/, fz_device* device) { scanOf(device).end(); }

void beginMask(fz_context* /*ctx*/, fz_device* device, fz_rect /*area*/, int /*luminosity*/,
               fz_colorspace* /*space*/, const float* /*backdrop*/, fz_color_params /*params*/) {
    scanOf(device).beginApart();
}

void endMask(fz_context* /*ctx*/, fz_device* device) {
    scanOf(device).end();
    scanOf(device).begin();
}

void beginGroup(fz_context* /*ctx*/, fz_device* device, fz_rect /*area*/, fz_colorspace* /*space*/,
                int /*isolated*/, int /*knockout*/, int /*blendMode*/, float alpha) {
    if (alpha < 1) {
        scanOf(device).begin();
    } else {
        scanOf(device).beginPlain();
    }
}

int beginTile(fz_context* /*ctx*/, fz_device* device, fz_rect area, fz_rect /*view*/,
              float /*xStep*/, float /*yStep*/, fz_matrix matrix, int /*id*/) {
    scanOf(device).add(fz_transform_rect(area, matrix), false);
    scanOf(device).beginApart();
    return 0;
}

fz_device* makeScanDevice(fz_context* ctx, GroupScan* scan) {
    ScanDevice* device = fz_new_derived_device(ctx, ScanDevice);
    device->scan = scan;
    fz_device& base = device->base;
    base.fill_path = &fillPath;
    base.stroke_path = &strokePath;
    base.fill_text = &fillText;
    base.stroke_text = &strokeText;
    base.fill_shade = &fillShade;
    base.fill_image = &fillImage;
    base.fill_image_mask = &fillStencil;
    base.clip_path = &clipPath;
    base.clip_text = &clipText;
    base.clip_stroke_path = &clipStrokePath;
    base.clip_stroke_text = &clipStrokeText;
    base.clip_image_mask = &clipImage;
    base.pop_clip = &endAny;
    base.begin_mask = &beginMask;
    base.end_mask = &endMask;
    base.begin_group = &beginGroup;
    base.end_group = &endAny;
    base.begin_tile = &beginTile;
    base.end_tile = &endAny;
    return &base;
}

bool meets(const fz_rect& one, const fz_rect& other) {
    return one.x0 < other.x1 && other.x0 < one.x1 && one.y0 < other.y1 && other.y0 < one.y1;
}

} // namespace

void GroupScan::run(fz_context* ctx, fz_page* page, const fz_matrix& matrix) {
    isDone = true;
    fz_device* device = nullptr;
    fz_var(device);
    fz_try(ctx) {
        device = makeScanDevice(ctx, this);
        fz_run_page(ctx, page, device, matrix, nullptr);
        fz_close_device(ctx, device);
    }
    fz_always(ctx) { fz_drop_device(ctx, device); }
    fz_catch(ctx) {
        // What is missing from the facts counts as not simple.
    }
    open.clear();
}

GroupFacts GroupScan::get(std::size_t number) const {
    if (isOutOfMemory || number >= facts.size()) {
        return {2, 1, true, true};
    }
    return facts[number];
}

template <class Change> void GroupScan::forGroups(const Change& change) {
    for (auto group = open.rbegin(); group != open.rend() && group->kind != KIND_APART; ++group) {
        if (group->kind == KIND_COUNTED) {
            change(*group);
        }
    }
}

void GroupScan::push(KIND kind) noexcept {
    try {
        if (kind == KIND_COUNTED) {
            forGroups([&](OpenGroup& group) { facts[group.number].hasGroups = true; });
            facts.emplace_back();
        }
        open.push_back({kind, facts.empty() ? 0 : facts.size() - 1});
    } catch (...) {
        isOutOfMemory = true;
    }
}

void GroupScan::begin() noexcept { push(KIND_COUNTED); }

void GroupScan::beginPlain() noexcept { push(KIND_PLAIN); }

void GroupScan::beginApart() noexcept { push(KIND_APART); }

void GroupScan::end() noexcept {
    if (!open.empty()) {
        open.pop_back();
    }
}

void GroupScan::add(const fz_rect& bounds, bool isImage) noexcept {
    try {
        forGroups([&](OpenGroup& group) { addTo(group, bounds, isImage); });
    } catch (...) {
        isOutOfMemory = true;
    }
}

void GroupScan::addTo(OpenGroup& group, const fz_rect& bounds, bool isImage) {
    GroupFacts& fact = facts[group.number];
    ++fact.objects;
    fact.images += isImage ? 1 : 0;
    if (fact.overlaps) {
        return;
    }
    fact.overlaps =
        group.seen.size() >= maxCompared ||
        std::ranges::any_of(group.seen, [&](const fz_rect& other) { return meets(bounds, other); });
    group.seen.push_back(bounds);
}

} // namespace DrawmereConvert
