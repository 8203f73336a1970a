#include "tools/convert/ShadingWriter.h"

#include "tools/convert/FitzCall.h"
#include "tools/convert/Strokes.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace DrawmereConvert {
namespace {

constexpr float pointsPerInch = 72;
constexpr float maxSide = 4000; // pixels of a shading drawn as an image
constexpr std::size_t maxDefined = 64;

bool isSame(const fz_matrix& one, const fz_matrix& other) {
    return one.a == other.a && one.b == other.b && one.c == other.c && one.d == other.d &&
           one.e == other.e && one.f == other.f;
}

void turnBack(std::vector<ShadingStop>& stops) {
    std::ranges::reverse(stops);
    for (ShadingStop& stop : stops) {
        stop.offset = 1 - stop.offset;
    }
}

} // namespace

ShadingWriter::~ShadingWriter() {
    for (const Defined& known : defined) {
        fz_drop_shade(ctx, known.shade);
    }
}

UnicodeString ShadingWriter::define(fz_shade* shade, const fz_matrix& matrix) {
    for (const Defined& known : defined) {
        if (known.shade == shade && known.use == colors.use && isSame(known.matrix, matrix)) {
            return known.id;
        }
    }
    UnicodeString id = make(*shade, fz_concat(shade->matrix, matrix));
    if (!id.isEmpty() && defined.size() < maxDefined) {
        defined.push_back({fz_keep_shade(ctx, shade), matrix, colors.use, id});
    }
    return id;
}

UnicodeString ShadingWriter::make(const fz_shade& shade, const fz_matrix& matrix) {
    const bool isShown = shade.use_function && fz_matrix_expansion(matrix) > 0;
    if (isShown && shade.type == FZ_LINEAR) {
        return makeLinear(shade, matrix);
    }
    return isShown && shade.type == FZ_RADIAL ? makeRadial(shade, matrix) : UnicodeString();
}

UnicodeString ShadingWriter::makeLinear(const fz_shade& shade, const fz_matrix& matrix) {
    const auto& coords = shade.u.l_or_r.coords;
    const StrokeMatrices matrices = splitMatrix(matrix);
    const fz_point from = fz_transform_point_xy(coords[0][0], coords[0][1], matrices.points);
    const fz_point to = fz_transform_point_xy(coords[1][0], coords[1][1], matrices.points);
    if (from.x == to.x && from.y == to.y) {
        return {};
    }
    canvas.flush();
    UnicodeString id =
        canvas.out.startLinearGradient(pt(from.x), pt(from.y), pt(to.x), pt(to.y),
                                       toMatrix(matrices.document), USERSPACEONUSE, GRADPAD);
    const auto& extend = shade.u.l_or_r.extend;
    writeStops(findStops(ctx, shade, colors), !extend[0], !extend[1]);
    canvas.out.endGradiant();
    return id;
}

// Two circles are two of a row that begins at a point: there the colours of SVG begin too. The row
// has such a point inside the larger circle only if that holds the smaller one.
UnicodeString ShadingWriter::makeRadial(const fz_shade& shade, const fz_matrix& matrix) {
    const auto& coords = shade.u.l_or_r.coords;
    Circle inner{coords[0][0], coords[0][1], coords[0][2]};
    Circle outer{coords[1][0], coords[1][1], coords[1][2]};
    bool startsEmpty = !shade.u.l_or_r.extend[0];
    bool endsEmpty = !shade.u.l_or_r.extend[1];
    const bool isBack = inner.r > outer.r;
    if (isBack) {
        std::swap(inner, outer);
        std::swap(startsEmpty, endsEmpty);
    }
    const float distance = std::hypot(outer.x - inner.x, outer.y - inner.y);
    if (!(distance + inner.r < outer.r * 0.9999F)) {
        return {};
    }
    std::vector<ShadingStop> stops = findStops(ctx, shade, colors);
    if (isBack) {
        turnBack(stops);
    }
    const float before = inner.r / (outer.r - inner.r); // how far the point is before the row
    for (ShadingStop& stop : stops) {
        stop.offset = (stop.offset + before) / (1 + before);
    }
    const StrokeMatrices matrices = splitMatrix(matrix);
    const fz_point focus =
        fz_transform_point_xy(inner.x - before * (outer.x - inner.x),
                              inner.y - before * (outer.y - inner.y), matrices.points);
    const fz_point center = fz_transform_point_xy(outer.x, outer.y, matrices.points);
    canvas.flush();
    UnicodeString id = canvas.out.startRadialGradient(
        pt(center.x), pt(center.y), pt(outer.r * matrices.penScale), pt(focus.x), pt(focus.y),
        toMatrix(matrices.document), USERSPACEONUSE, GRADPAD);
    // Without a circle inside there is nothing before the start.
    writeStops(stops, startsEmpty && inner.r > 0, endsEmpty);
    canvas.out.endGradiant();
    return id;
}

void ShadingWriter::writeStops(const std::vector<ShadingStop>& stops, bool startsEmpty,
                               bool endsEmpty) {
    const auto write = [&](const ShadingStop& stop, bool isEmpty) {
        MoxColor color = stop.color;
        color.clearAlpha();
        const float opacity = static_cast<float>(stop.color.getAlpha()) / 255.0F;
        canvas.out.setStopColor(color, stop.offset, isEmpty ? 0 : opacity);
    };
    if (startsEmpty) {
        write(stops.front(), /*isEmpty=*/true);
    }
    for (const ShadingStop& stop : stops) {
        write(stop, /*isEmpty=*/false);
    }
    if (endsEmpty) {
        write(stops.back(), /*isEmpty=*/true);
    }
}

PlacedPixels ShadingWriter::draw(fz_shade* shade, const fz_matrix& matrix, const fz_rect& area,
                                 int dpi) {
    const float side = std::max({area.x1 - area.x0, area.y1 - area.y0, 1.0F});
    const float scale = std::min(static_cast<float>(dpi) / pointsPerInch, maxSide / side);
    const fz_irect box = fz_round_rect(fz_transform_rect(area, fz_scale(scale, scale)));
    const fz_matrix placed = fz_concat(matrix, fz_scale(scale, scale));
    fz_pixmap* pixels = nullptr;
    fz_var(pixels);
    if (fz_is_empty_irect(box)) {
        return {};
    }
    const bool done = callFitz(ctx, [&] {
        pixels = fz_new_pixmap_with_bbox(ctx, fz_device_rgb(ctx), box, nullptr, 1);
        fz_clear_pixmap(ctx, pixels);
        fz_paint_shade(ctx, shade, nullptr, placed, pixels, fz_default_color_params, box, nullptr,
                       nullptr);
    });
    if (!done) {
        fz_drop_pixmap(ctx, pixels);
        return {};
    }
    return {ctx, pixels, scale};
}

} // namespace DrawmereConvert
