#include "tools/convert/PageDevice.h"

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
template <class Call> void paint(fz_context* ctx, fz_device* device, const Call& call) {
    if (!tryPainter(getPainter(device), call)) {
        fz_throw(ctx, FZ_ERROR_ABORT, "the page can't be drawn");
    }
}

void fillPath(fz_context* ctx, fz_device* device, const fz_path* path, int isEvenOdd,
              fz_matrix matrix, fz_colorspace* space, const float* color, float alpha,
              fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        painter.fillPath(path, isEvenOdd != 0, matrix,
                         {painter.colors.convert(space, color, alpha, params)});
    });
}

void strokePath(fz_context* ctx, fz_device* device, const fz_path* path,
                const fz_stroke_state* stroke, fz_matrix matrix, fz_colorspace* space,
                const float* color, float alpha, fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        painter.strokePath(path, *stroke, matrix,
                           {painter.colors.convert(space, color, alpha, params)});
    });
}

void clipPath(fz_context* ctx, fz_device* device, const fz_path* path, int isEvenOdd,
              fz_matrix matrix, fz_rect /*scissor*/) {
    paint(ctx, device,
          [&](PagePainter& painter) { painter.clipPath(path, isEvenOdd != 0, matrix); });
}

void fillText(fz_context* ctx, fz_device* device, const fz_text* text, fz_matrix matrix,
              fz_colorspace* space, const float* color, float alpha, fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        painter.fillText(*text, matrix, {painter.colors.convert(space, color, alpha, params)});
    });
}

void strokeText(fz_context* ctx, fz_device* device, const fz_text* text,
                const fz_stroke_state* stroke, fz_matrix matrix, fz_colorspace* space,
                const float* color, float alpha, fz_color_params params) {
    paint(ctx, device, [&](PagePainter& painter) {
        painter.strokeText(*text, *stroke, matrix,
                           {painter.colors.convert(space, color, alpha, params)});
    });
}

void clipText(fz_context* ctx, fz_device* device, const fz_text* text, fz_matrix matrix,
              fz_rect /*scissor*/) {
    paint(ctx, device, [&](PagePainter& painter) { painter.clipText(*text, matrix); });
}

void popClip(fz_context* ctx, fz_device* device) {
    paint(ctx, device, [](PagePainter& painter) { painter.popClip(); });
}

} // namespace

fz_device* makePageDevice(fz_context* ctx, PagePainter* painter) {
    PageDevice* device = fz_new_derived_device(ctx, PageDevice);
    device->painter = painter;
    device->base.fill_path = &fillPath;
    device->base.stroke_path = &strokePath;
    device->base.clip_path = &clipPath;
    device->base.fill_text = &fillText;
    device->base.stroke_text = &strokeText;
    device->base.clip_text = &clipText;
    device->base.pop_clip = &popClip;
    return &device->base;
}

} // namespace DrawmereConvert
