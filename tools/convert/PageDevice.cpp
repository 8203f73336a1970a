#include "tools/convert/PageDevice.h"

#include <utility>

namespace DrawmereConvert {
namespace {

struct PageDevice {
    fz_device base;
    PagePainter* painter; // borrowed
};

PagePainter& getPainter(fz_device* device) {
    return *reinterpret_cast<PageDevice*>(device)->painter;
}

/// Returns: whether `call` went well. Nothing of C++ is left on the stack when it returns.
template <class Call> bool tryPainter(PagePainter& painter, const Call& call) noexcept {
    if (painter.failure) {
        return false;
    }
    try {
        call(painter);
        return true;
    } catch (...) {
        painter.failure = std::current_exception();
        return false;
    }
}

/// Runs `call` with the painter; a failure becomes one of MuPDF, which ends the page.
template <class Call> void handOn(fz_context* ctx, fz_device* device, const Call& call) {
    if (!tryPainter(getPainter(device), call)) {
        fz_throw(ctx, FZ_ERROR_ABORT, "the page can't be drawn");
    }
}

/// The same, for what is left out where a picture shows it.
template <class Call> void paint(fz_context* ctx, fz_device* device, const Call& call) {
    if (!getPainter(device).isSkipping()) {
        handOn(ctx, device, call);
    }
}

/// The same, for an opening that was counted when looking ahead.
template <class Call> void paintCounted(fz_context* ctx, fz_device* device, const Call& call) {
    if (getPainter(device).isSkipping()) {
        getPainter(device).skipOpening();
        return;
    }
    handOn(ctx, device, call);
}

void fillPath(fz_context* ctx, fz_device* device, const fz_path* path, int isEvenOdd,
              fz_matrix matrix, fz_colorspace* space, const float* color, float alpha,
              fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        painter.paths.fill(path, isEvenOdd != 0, matrix,
                           {painter.colors.convert(space, color, alpha, params)});
    });
}

void strokePath(fz_context* ctx, fz_device* device, const fz_path* path,
                const fz_stroke_state* stroke, fz_matrix matrix, fz_colorspace* space,
                const float* color, float alpha, fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        painter.paths.stroke(path, *stroke, matrix,
                             {painter.colors.convert(space, color, alpha, params)});
    });
}

void clipPath(fz_context* ctx, fz_device* device, const fz_path* path, int isEvenOdd,
              fz_matrix matrix, fz_rect /*scissor*/) {
    paint(ctx, device,
          [&](PagePainter& painter) { painter.paths.clip(path, isEvenOdd != 0, matrix); });
}

// Text in a picture can be searched for, too.
void fillText(fz_context* ctx, fz_device* device, const fz_text* text, fz_matrix matrix,
              fz_colorspace* space, const float* color, float alpha, fz_color_params params) {
    handOn(ctx, device, [&](PagePainter& painter) {
        if (painter.isSkipping()) {
            painter.texts.ignore(*text, matrix);
        } else {
            painter.texts.fill(*text, matrix,
                               {painter.colors.convert(space, color, alpha, params)});
        }
    });
}

void strokeText(fz_context* ctx, fz_device* device, const fz_text* text,
                const fz_stroke_state* stroke, fz_matrix matrix, fz_colorspace* space,
                const float* color, float alpha, fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        painter.texts.stroke(*text, *stroke, matrix,
                             {painter.colors.convert(space, color, alpha, params)});
    });
}

void ignoreText(fz_context* ctx, fz_device* device, const fz_text* text, fz_matrix matrix) {
    paint(ctx, device, [&](PagePainter& painter) { painter.texts.ignore(*text, matrix); });
}

void clipText(fz_context* ctx, fz_device* device, const fz_text* text, fz_matrix matrix,
              fz_rect /*scissor*/) {
    paint(ctx, device, [&](PagePainter& painter) { painter.texts.clip(*text, matrix); });
}

void clipStrokePath(fz_context* ctx, fz_device* device, const fz_path* path,
                    const fz_stroke_state* stroke, fz_matrix matrix, fz_rect /*scissor*/) {
    paintCounted(ctx, device,
                 [&](PagePainter& painter) { painter.paths.clipStroke(path, *stroke, matrix); });
}

void clipStrokeText(fz_context* ctx, fz_device* device, const fz_text* text,
                    const fz_stroke_state* stroke, fz_matrix matrix, fz_rect /*scissor*/) {
    paintCounted(ctx, device,
                 [&](PagePainter& painter) { painter.texts.clipStroke(*text, *stroke, matrix); });
}

void fillShade(fz_context* ctx, fz_device* device, fz_shade* shade, fz_matrix matrix, float alpha,
               fz_color_params /*params*/) {
    paint(ctx, device, [&](PagePainter& painter) { painter.fillShade(shade, matrix, alpha); });
}

void fillImage(fz_context* ctx, fz_device* device, fz_image* image, fz_matrix matrix, float alpha,
               fz_color_params /*params*/) {
    paint(ctx, device, [&](PagePainter& painter) { painter.fillImage(image, matrix, alpha); });
}

void fillImageMask(fz_context* ctx, fz_device* device, fz_image* image, fz_matrix matrix,
                   fz_colorspace* space, const float* color, float alpha, fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        painter.fillImageMask(image, matrix, {painter.colors.convert(space, color, alpha, params)});
    });
}

void clipImageMask(fz_context* ctx, fz_device* device, fz_image* image, fz_matrix matrix,
                   fz_rect /*scissor*/) {
    paintCounted(ctx, device, [&](PagePainter& painter) { painter.clipImageMask(image, matrix); });
}

void popClip(fz_context* ctx, fz_device* device) {
    paint(ctx, device, [](PagePainter& painter) { painter.popClip(); });
}

void beginMask(fz_context* ctx, fz_device* device, fz_rect area, int luminosity,
               fz_colorspace* space, const float* backdrop, fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        const COLORUSE use = std::exchange(painter.colors.use, COLORUSE_LUMINOSITY);
        const MoxColor color =
            backdrop && space ? painter.colors.convert(space, backdrop, 1, params) : MoxColor();
        painter.colors.use = use;
        painter.beginMask(area, luminosity != 0, color == MoxColor() ? nullptr : &color);
    });
}

void endMask(fz_context* ctx, fz_device* device) {
    paintCounted(ctx, device, [](PagePainter& painter) { painter.endMask(); });
}

void beginGroup(fz_context* ctx, fz_device* device, fz_rect area, fz_colorspace* /*space*/,
                int /*isolated*/, int knockout, int blendMode, float alpha) {
    handOn(ctx, device, [&](PagePainter& painter) {
        painter.beginGroup(area, knockout != 0, blendMode, alpha);
    });
}

void endGroup(fz_context* ctx, fz_device* device) {
    handOn(ctx, device, [](PagePainter& painter) { painter.endGroup(); });
}

int beginTile(fz_context* ctx, fz_device* device, fz_rect area, fz_rect view, float xStep,
              float yStep, fz_matrix matrix, int /*id*/) {
    paint(ctx, device,
          [&](PagePainter& painter) { painter.beginTile(area, view, xStep, yStep, matrix); });
    return 0; // the content is wanted each time, as its colours may differ
}

void endTile(fz_context* ctx, fz_device* device) {
    paint(ctx, device, [](PagePainter& painter) { painter.endTile(); });
}

} // namespace

fz_device* makePageDevice(fz_context* ctx, PagePainter* painter) {
    PageDevice* device = fz_new_derived_device(ctx, PageDevice);
    device->painter = painter;
    painter->texts.device = &device->base;
    fz_device& base = device->base;
    base.fill_path = &fillPath;
    base.stroke_path = &strokePath;
    base.clip_path = &clipPath;
    base.clip_stroke_path = &clipStrokePath;
    base.fill_text = &fillText;
    base.stroke_text = &strokeText;
    base.clip_text = &clipText;
    base.ignore_text = &ignoreText;
    base.clip_stroke_text = &clipStrokeText;
    base.fill_shade = &fillShade;
    base.fill_image = &fillImage;
    base.fill_image_mask = &fillImageMask;
    base.clip_image_mask = &clipImageMask;
    base.pop_clip = &popClip;
    base.begin_mask = &beginMask;
    base.end_mask = &endMask;
    base.begin_group = &beginGroup;
    base.end_group = &endGroup;
    base.begin_tile = &beginTile;
    base.end_tile = &endTile;
    return &base;
}

} // namespace DrawmereConvert
