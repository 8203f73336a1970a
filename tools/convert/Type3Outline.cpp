#include "tools/convert/Type3Outline.h"

#include "tools/convert/BitmapTracer.h"
#include "tools/convert/FitzCall.h"

#include <initializer_list>

namespace DrawmereConvert {
namespace {

constexpr std::size_t maxCorners = 2000;
constexpr int lastGlyph = 255;

/// What a device collects. Nothing throws, as MuPDF calls.
struct Collection {
    fz_context* ctx;
    LooseOutline& outline;
    fz_matrix matrix = fz_identity; // of the path in hand
    bool isGood = true;

    void add(PATHSTEP step, std::initializer_list<fz_point> points) {
        outline.steps.push_back(step);
        for (const fz_point& point : points) {
            outline.points.push_back(fz_transform_point(point, matrix));
        }
    }
};

template <class Call> void collect(Collection& collection, const Call& call) noexcept {
    try {
        if (collection.isGood) {
            call(collection);
        }
    } catch (...) {
        collection.isGood = false;
    }
}

struct CollectingDevice {
    fz_device base;
    Collection* collection; // borrowed
};

Collection& collectionOf(fz_device* device) {
    return *reinterpret_cast<CollectingDevice*>(device)->collection;
}

Collection& collectionOf(void* arg) { return *static_cast<Collection*>(arg); }

void moveTo(fz_context* /*ctx*/, void* arg, float x, float y) {
    collect(collectionOf(arg), [&](Collection& to) { to.add(PATHSTEP_MOVE, {{x, y}}); });
}

void lineTo(fz_context* /*ctx*/, void* arg, float x, float y) {
    collect(collectionOf(arg), [&](Collection& to) { to.add(PATHSTEP_LINE, {{x, y}}); });
}

void curveTo(fz_context* /*ctx*/, void* arg, float x1, float y1, float x2, float y2, float x3,
             float y3) {
    collect(collectionOf(arg), [&](Collection& to) {
        to.add(PATHSTEP_CURVE, {{x1, y1}, {x2, y2}, {x3, y3}});
    });
}

void closePath(fz_context* /*ctx*/, void* arg) {
    collect(collectionOf(arg), [](Collection& to) { to.add(PATHSTEP_CLOSE, {}); });
}

constexpr fz_path_walker walker = {&moveTo, &lineTo, &curveTo, &closePath,
                                   nullptr, nullptr, nullptr,  nullptr};

void fillPath(fz_context* ctx, fz_device* device, const fz_path* path, int isEvenOdd,
              fz_matrix matrix, fz_colorspace* /*space*/, const float* /*color*/, float /*alpha*/,
              fz_color_params /*params*/) {
    Collection& collection = collectionOf(device);
    collection.matrix = matrix;
    collection.isGood = collection.isGood && isEvenOdd == 0;
    fz_walk_path(ctx, path, &walker, &collection);
}

void trace(Collection& collection, fz_image* image) {
    const ImagePixels pixels(collection.ctx, image);
    if (pixels.isEmpty()) {
        collection.isGood = false;
        return;
    }
    const std::vector<BitmapLoop> loops = traceBitmap(pixels, maxCorners);
    for (const BitmapLoop& loop : loops) {
        collection.add(PATHSTEP_MOVE, {loop.front()});
        for (std::size_t i = 1; i < loop.size(); ++i) {
            collection.add(PATHSTEP_LINE, {loop[i]});
        }
        collection.add(PATHSTEP_CLOSE, {});
    }
}

void fillStencil(fz_context* /*ctx*/, fz_device* device, fz_image* image, fz_matrix matrix,
                 fz_colorspace* /*space*/, const float* /*color*/, float /*alpha*/,
                 fz_color_params /*params*/) {
    collect(collectionOf(device), [&](Collection& to) {
        to.matrix = matrix;
        trace(to, image);
    });
}

void refuse(fz_device* device) { collectionOf(device).isGood = false; }

void strokePath(fz_context* /*ctx*/, fz_device* device, const fz_path* /*path*/,
                const fz_stroke_state* /*stroke*/, fz_matrix /*matrix*/, fz_colorspace* /*space*/,
                const float* /*color*/, float /*alpha*/, fz_color_params /*params*/) {
    refuse(device);
}

void fillText(fz_context* /*ctx*/, fz_device* device, const fz_text* /*text*/, fz_matrix /*matrix*/,
              fz_colorspace* /*space*/, const float* /*color*/, float /*alpha*/,
              fz_color_params /*params*/) {
    refuse(device);
}

void fillShade(fz_context* /*ctx*/, fz_device* device, fz_shade* /*shade*/, fz_matrix /*matrix*/,
               float /*alpha*/, fz_color_params /*params*/) {
    refuse(device);
}

void fillImage(fz_context* /*ctx*/, fz_device* device, fz_image* /*image*/, fz_matrix /*matrix*/,
               float /*alpha*/, fz_color_params /*params*/) {
    refuse(device);
}

void clipPath(fz_context* /*ctx*/, fz_device* device, const fz_path* /*path*/, int /*isEvenOdd*/,
              fz_matrix /*matrix*/, fz_rect /*scissor*/) {
    refuse(device);
}

void clipImage(fz_context* /*ctx*/, fz_device* device, fz_image* /*image*/, fz_matrix /*matrix*/,
               fz_rect /*scissor*/) {
    refuse(device);
}

fz_device* makeCollectingDevice(fz_context* ctx, Collection* collection) {
    CollectingDevice* device = fz_new_derived_device(ctx, CollectingDevice);
    device->collection = collection;
    fz_device& base = device->base;
    base.fill_path = &fillPath;
    base.fill_image_mask = &fillStencil;
    base.stroke_path = &strokePath;
    base.fill_text = &fillText;
    base.fill_shade = &fillShade;
    base.fill_image = &fillImage;
    base.clip_path = &clipPath;
    base.clip_image_mask = &clipImage;
    return &base;
}

void runGlyph(fz_context* ctx, fz_font* font, int glyph, Collection& collection) {
    fz_device* device = nullptr;
    fz_var(device);
    fz_try(ctx) {
        device = makeCollectingDevice(ctx, &collection);
        fz_run_t3_glyph(ctx, font, glyph, fz_identity, device);
        fz_close_device(ctx, device);
    }
    fz_always(ctx) { fz_drop_device(ctx, device); }
    fz_catch(ctx) { collection.isGood = false; }
}

} // namespace

bool readType3Outline(fz_context* ctx, fz_font* font, int glyph, LooseOutline& outline) {
    const bool isColorless =
        glyph <= lastGlyph && font->t3flags && (font->t3flags[glyph] & FZ_DEVFLAG_MASK) != 0;
    if (!isColorless) {
        return false;
    }
    const std::size_t steps = outline.steps.size();
    const std::size_t points = outline.points.size();
    Collection collection{ctx, outline};
    runGlyph(ctx, font, glyph, collection);
    if (!collection.isGood) {
        outline.steps.resize(steps);
        outline.points.resize(points);
    }
    return collection.isGood;
}

} // namespace DrawmereConvert
