#include "tests/examples/PaintTwin.h"

#include <iterator>
#include <string>

#include <unicode/unistr.h>

namespace DrawmereTest {
namespace {

using namespace DrawmereNS;

/// A clip path has no font size; this is what the renderer of the tests takes then.
constexpr double viewersFontSize = 12;

constexpr double wide(float number) { return static_cast<double>(number); }

double channel(unsigned int color, unsigned int shift) {
    return static_cast<double>(color >> shift & 0xFFU) / 255.0;
}

void setColor(cairo_t* context, unsigned int color) {
    cairo_set_source_rgb(context, channel(color, 16), channel(color, 8), channel(color, 0));
}

cairo_matrix_t toCairo(const Matrix& m) {
    return {wide(m[0]), wide(m[1]), wide(m[2]), wide(m[3]), wide(m[4]), wide(m[5])};
}

void addArea(cairo_t* context, const Area& area) {
    cairo_rectangle(context, wide(area.x), wide(area.y), wide(area.width), wide(area.height));
}

void addCircle(cairo_t* context, float x, float y, float radius) {
    constexpr double fullTurn = 6.283185307179586;
    cairo_new_sub_path(context);
    cairo_arc(context, wide(x), wide(y), wide(radius), 0, fullTurn);
    cairo_close_path(context);
}

void fillArea(cairo_t* context, const Area& area, unsigned int color) {
    setColor(context, color);
    addArea(context, area);
    cairo_fill(context);
}

void addText(cairo_t* context, const char16_t* text, double size, float x, float baseline) {
    std::string bytes;
    icu::UnicodeString(text).toUTF8String(bytes);
    cairo_select_font_face(context, "DejaVu Sans", CAIRO_FONT_SLANT_NORMAL,
                           CAIRO_FONT_WEIGHT_NORMAL);
    cairo_set_font_size(context, size);
    cairo_move_to(context, wide(x), wide(baseline));
    cairo_text_path(context, bytes.c_str());
}

// Gradients.

cairo_extend_t toExtend(GRADSPERADMOD spread) {
    constexpr cairo_extend_t extends[] = {CAIRO_EXTEND_PAD, CAIRO_EXTEND_REFLECT,
                                          CAIRO_EXTEND_REPEAT};
    return extends[spread];
}

cairo_pattern_t* makeAxis(const Gradient& gradient) {
    const auto& g = gradient.geometry;
    return gradient.isRadial
               ? cairo_pattern_create_radial(wide(g[3]), wide(g[4]), 0, wide(g[0]), wide(g[1]),
                                             wide(g[2]))
               : cairo_pattern_create_linear(wide(g[0]), wide(g[1]), wide(g[2]), wide(g[3]));
}

/// Sets `gradient` as the source for a shape with this box. With `asMask` the brightness of its
/// greys becomes opacity.
void setGradient(cairo_t* context, const Gradient& gradient, const Area& box, bool asMask = false) {
    cairo_pattern_t* pattern = makeAxis(gradient);
    for (const Stop& stop : gradient.stops) {
        const double opacity = wide(stop.opacity) * (asMask ? channel(stop.color, 0) : 1.0);
        cairo_pattern_add_color_stop_rgba(pattern, wide(stop.offset), channel(stop.color, 16),
                                          channel(stop.color, 8), channel(stop.color, 0), opacity);
    }
    cairo_pattern_set_extend(pattern, toExtend(gradient.spread));
    cairo_matrix_t matrix = toCairo(gradient.matrix);
    if (gradient.units == OBJECTBOUNDINGBOX) {
        const cairo_matrix_t toBox = toCairo({box.width, 0, 0, box.height, box.x, box.y});
        cairo_matrix_multiply(&matrix, &matrix, &toBox);
    }
    cairo_matrix_invert(&matrix);
    cairo_pattern_set_matrix(pattern, &matrix);
    cairo_set_source(context, pattern);
    cairo_pattern_destroy(pattern);
}

void drawCheckers(cairo_t* context) {
    constexpr float side = cellSize / 8;
    for (int row = 0; row < 8; ++row) {
        for (int column = row % 2; column < 8; column += 2) {
            fillArea(
                context,
                {static_cast<float>(column) * side, static_cast<float>(row) * side, side, side},
                grey);
        }
    }
}

void drawGradient(cairo_t* context, const GradientScene& scene) {
    if (scene.isCheckered) {
        drawCheckers(context);
    }
    setGradient(context, scene.gradient, scene.shape);
    addArea(context, scene.shape);
    if (scene.strokeWidth > 0) {
        cairo_set_line_width(context, wide(scene.strokeWidth));
        cairo_stroke(context);
    } else {
        cairo_fill(context);
    }
}

// Patterns: tile by tile.

void drawTile(cairo_t* context, bool hasGradient) {
    constexpr Gradient overTile = {
        {0, 0, tileContent, tileContent}, false, USERSPACEONUSE, GRADPAD, unit, dawn};
    setColor(context, green);
    if (hasGradient) {
        setGradient(context, overTile, wholeCell);
    }
    addArea(context, {0, 0, tileContent * 0.6F, tileContent * 0.6F});
    cairo_fill(context);
    setColor(context, orange);
    addCircle(context, tileContent * 0.7F, tileContent * 0.7F, tileContent * 0.25F);
    cairo_fill(context);
}

void drawPattern(cairo_t* context, const PatternScene& scene) {
    constexpr int enough = 20;
    const float unitSize = scene.units == OBJECTBOUNDINGBOX ? cellSize : 1.0F;
    const float side = scene.tile.width * unitSize;
    addArea(context, wholeCell);
    cairo_clip(context);
    const cairo_matrix_t matrix = toCairo(scene.matrix);
    cairo_transform(context, &matrix);
    for (int row = -enough; row < enough; ++row) {
        for (int column = -enough; column < enough; ++column) {
            cairo_save(context);
            cairo_translate(context,
                            wide(scene.tile.x * unitSize + static_cast<float>(column) * side),
                            wide(scene.tile.y * unitSize + static_cast<float>(row) * side));
            cairo_scale(context, wide(side / tileContent), wide(side / tileContent));
            drawTile(context, scene.hasGradient);
            cairo_restore(context);
        }
    }
}

// Masks: an alpha for each pixel.

/// Returns: what is masked, to be the source.
void setMasked(cairo_t* context) {
    cairo_push_group(context);
    fillArea(context, wholeCell, green);
    setColor(context, orange);
    addCircle(context, cellSize / 2, cellSize / 2, cellSize / 3);
    cairo_fill(context);
    cairo_pop_group_to_source(context);
}

template <typename Shape>
void drawMasked(cairo_t* context, const Gradient& gradient, Shape addShape) {
    cairo_push_group(context);
    setGradient(context, gradient, wholeCell, /*asMask=*/true);
    addShape();
    cairo_fill(context);
    cairo_pattern_t* mask = cairo_pop_group(context);
    setMasked(context);
    cairo_mask(context, mask);
    cairo_pattern_destroy(mask);
}

void drawFadeMask(cairo_t* context) {
    drawMasked(context, maskFade, [context] { addArea(context, wholeCell); });
}

void drawSpotMask(cairo_t* context) {
    drawMasked(context, maskSpot, [context] { addArea(context, wholeCell); });
}

void drawTextMask(cairo_t* context) {
    drawMasked(context, maskFade, [context] {
        addText(context, maskText, wide(maskTextSize), maskTextX, maskTextBaseline);
    });
}

// Clips.

void drawStripes(cairo_t* context) {
    for (int i = 0; static_cast<float>(i) * stripeWidth < cellSize; ++i) {
        fillArea(context, {static_cast<float>(i) * stripeWidth, 0, stripeWidth, cellSize},
                 stripeColors[static_cast<std::size_t>(i) % std::size(stripeColors)]);
    }
}

void clipAndDraw(cairo_t* context) {
    cairo_clip(context);
    drawStripes(context);
}

void addRoundedArea(cairo_t* context, const Area& area, double radius) {
    constexpr double quarter = 1.5707963267948966;
    const double left = wide(area.x) + radius;
    const double right = wide(area.x + area.width) - radius;
    const double top = wide(area.y) + radius;
    const double bottom = wide(area.y + area.height) - radius;
    cairo_arc(context, right, top, radius, -quarter, 0);
    cairo_arc(context, right, bottom, radius, 0, quarter);
    cairo_arc(context, left, bottom, radius, quarter, 2 * quarter);
    cairo_arc(context, left, top, radius, 2 * quarter, 3 * quarter);
    cairo_close_path(context);
}

void drawStarClip(cairo_t* context) {
    for (std::size_t i = 0; i < std::size(star); i += 2) {
        cairo_line_to(context, wide(star[i]), wide(star[i + 1]));
    }
    clipAndDraw(context);
}

void drawRectClip(cairo_t* context) {
    addRoundedArea(context, clipRect, wide(clipRectRadius));
    clipAndDraw(context);
}

void drawClipInClip(cairo_t* context) {
    addCircle(context, clipCenter, clipCenter, clipRadius);
    cairo_clip(context);
    addArea(context, innerClipRect);
    clipAndDraw(context);
}

void drawTextClip(cairo_t* context) {
    float baseline = clipLineStep;
    for (const char16_t* line : clipLines) {
        addText(context, line, viewersFontSize, clipTextX, baseline);
        baseline += clipLineStep;
    }
    clipAndDraw(context);
}

void drawClipAfterGroup(cairo_t* context) {
    fillArea(context, groupBefore, grey);
    addCircle(context, clipCenter, clipCenter, clipRadius);
    clipAndDraw(context);
}

void drawTurnedClip(cairo_t* context) {
    const cairo_matrix_t matrix = toCairo(clipTurn);
    cairo_transform(context, &matrix);
    addArea(context, clipRect);
    clipAndDraw(context);
}

void drawBoxClip(cairo_t* context) {
    addCircle(context, cellSize / 2, cellSize / 2, cellSize / 2);
    clipAndDraw(context);
}

// The page.

constexpr void (*maskScenes[])(cairo_t* context) = {drawFadeMask, drawSpotMask, drawTextMask};
constexpr void (*clipScenes[])(cairo_t* context) = {
    drawStarClip,       drawRectClip,   drawClipInClip, drawTextClip,
    drawClipAfterGroup, drawTurnedClip, drawBoxClip};

template <typename Scene>
void drawCell(cairo_t* context, int column, int row, const char16_t* caption, Scene scene) {
    cairo_save(context);
    cairo_translate(context, wide(leftMargin + columnStep * static_cast<float>(column)),
                    wide(topMargin + rowStep * static_cast<float>(row)));
    cairo_save(context);
    scene();
    cairo_restore(context);
    setColor(context, navy);
    addText(context, caption, wide(captionSize), 0, captionBaseline);
    cairo_fill(context);
    cairo_restore(context);
}

} // namespace

PaintTwin::PaintTwin(int scale)
    : surface(cairo_image_surface_create(CAIRO_FORMAT_ARGB32, static_cast<int>(pageWidth) * scale,
                                         static_cast<int>(pageHeight) * scale)),
      context(cairo_create(surface)) {
    cairo_scale(context, scale, scale);
    cairo_font_options_t* options = cairo_font_options_create();
    cairo_font_options_set_hint_style(options, CAIRO_HINT_STYLE_NONE);
    cairo_font_options_set_hint_metrics(options, CAIRO_HINT_METRICS_OFF);
    cairo_set_font_options(context, options);
    cairo_font_options_destroy(options);
}

PaintTwin::~PaintTwin() {
    cairo_destroy(context);
    cairo_surface_destroy(surface);
}

cairo_surface_t* PaintTwin::draw() {
    fillArea(context, {0, 0, pageWidth, pageHeight}, paper);
    for (int i = 0; i < columns; ++i) {
        drawCell(context, i, 0, linearScenes[i].caption,
                 [&] { drawGradient(context, linearScenes[i]); });
        drawCell(context, i, 1, radialScenes[i].caption,
                 [&] { drawGradient(context, radialScenes[i]); });
        drawCell(context, i, 3, clipCaptions[i], [&] { clipScenes[i](context); });
    }
    for (int i = 0; i < patternCount; ++i) {
        drawCell(context, i, 2, patternScenes[i].caption,
                 [&] { drawPattern(context, patternScenes[i]); });
    }
    for (int i = patternCount; i < columns; ++i) {
        drawCell(context, i, 2, maskCaptions[i - patternCount],
                 [&] { maskScenes[i - patternCount](context); });
    }
    cairo_surface_flush(surface);
    return surface;
}

} // namespace DrawmereTest
