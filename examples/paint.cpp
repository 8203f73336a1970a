// A page of paints, masks and clips: gradients of both kinds, tiling patterns, masks with gradients
// in them, and clip paths, one in the other too. Usage: paint [FILE.svg]

#include "Drawmere.h"
#include "PaintScenes.h"

#include <cstdio>
#include <iterator>

using namespace DrawmereNS;

namespace {

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

MoxPointT<MoxLength> point(float x, float y) { return {pt(x), pt(y)}; }

MoxRectT<MoxLength> corners(const Area& area) {
    return {pt(area.x), pt(area.y), pt(area.x + area.width), pt(area.y + area.height)};
}

SVGMatrix toMatrix(const Matrix& m) { return {m[0], m[1], m[2], m[3], m[4], m[5]}; }

void setFont(Drawmere& page, float size) {
    SVGFont font;
    font.setFontAttribute(captionFont, pt(size), FONTWEIGHT_NORMAL, FSTYLE_NORMAL, u"", false);
    page.setFont(&font, nullptr);
}

void drawText(Drawmere& page, const UnicodeString& text, float x, float y) {
    page.drawText(text, pt(x), pt(y), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

void drawArea(Drawmere& page, const Area& area, PAINTMODE mode = PAINTMODE_FILL, float radius = 0) {
    page.drawRect(pt(area.x), pt(area.y), pt(area.width), pt(area.height), pt(radius), pt(radius),
                  mode);
}

void drawDot(Drawmere& page, float x, float y, float radius) {
    page.drawCircle(pt(x), pt(y), pt(radius), PAINTMODE_FILL);
}

/// Draws `scene` with the corner of a cell as the origin, and the caption below it. The states keep
/// what the scene sets from the next; the pop also ends a clip.
template <typename Scene>
void drawCell(Drawmere& page, int column, int row, const char16_t* caption, Scene scene) {
    page.pushState();
    page.setTransMatrix(SVGMatrix(1, 0, 0, 1, leftMargin + columnStep * static_cast<float>(column),
                                  topMargin + rowStep * static_cast<float>(row)));
    page.pushState();
    scene();
    page.popState();
    setFont(page, captionSize); // once more in each cell, as definitions lose it
    page.setFillColor(navy);
    drawText(page, caption, 0, captionBaseline);
    page.popState();
}

// Gradients.

/// Returns: the id under which the gradient is a paint.
UnicodeString define(Drawmere& page, const Gradient& gradient) {
    const auto& g = gradient.geometry;
    const SVGMatrix matrix = toMatrix(gradient.matrix);
    UnicodeString id =
        gradient.isRadial
            ? page.startRadialGradient(pt(g[0]), pt(g[1]), pt(g[2]), pt(g[3]), pt(g[4]), matrix,
                                       gradient.units, gradient.spread)
            : page.startLinearGradient(point(g[0], g[1]), point(g[2], g[3]), matrix, gradient.units,
                                       gradient.spread);
    for (const Stop& stop : gradient.stops) {
        page.setStopColor(stop.color, stop.offset, stop.opacity);
    }
    page.endGradiant();
    return id;
}

void drawCheckers(Drawmere& page) {
    constexpr float side = cellSize / 8;
    page.setFillColor(grey);
    for (int row = 0; row < 8; ++row) {
        for (int column = row % 2; column < 8; column += 2) {
            drawArea(page, {static_cast<float>(column) * side, static_cast<float>(row) * side, side,
                            side});
        }
    }
}

void drawGradient(Drawmere& page, const GradientScene& scene) {
    if (scene.isCheckered) {
        drawCheckers(page);
    }
    const UnicodeString id = define(page, scene.gradient);
    if (scene.strokeWidth > 0) {
        page.setStrokeColorId(id);
        page.setStrokeWidth(pt(scene.strokeWidth));
        drawArea(page, scene.shape, PAINTMODE_STROKE);
    } else {
        page.setFillColorId(id);
        drawArea(page, scene.shape);
    }
}

// Patterns.

void drawTile(Drawmere& page, bool hasGradient) {
    constexpr Gradient overTile = {
        {0, 0, tileContent, tileContent}, false, USERSPACEONUSE, GRADPAD, unit, dawn};
    page.setFillColor(green);
    if (hasGradient) {
        page.setFillColorId(define(page, overTile)); // within the pattern, as good as before it
    }
    drawArea(page, {0, 0, tileContent * 0.6F, tileContent * 0.6F});
    page.setFillColor(orange);
    drawDot(page, tileContent * 0.7F, tileContent * 0.7F, tileContent * 0.25F);
}

void drawPattern(Drawmere& page, const PatternScene& scene) {
    const UnicodeString id =
        page.startPattern(corners(scene.tile), corners({0, 0, tileContent, tileContent}),
                          toMatrix(scene.matrix), scene.units, USERSPACEONUSE);
    drawTile(page, scene.hasGradient);
    page.endPattern();
    page.setFillColorId(id);
    drawArea(page, wholeCell);
}

// Masks.

UnicodeString startMask(Drawmere& page, const Area& area, UNITSTYPE units) {
    return page.startMask(pt(area.x), pt(area.y), pt(area.width), pt(area.height), units, units);
}

/// Draws what the masks lie over.
void drawMasked(Drawmere& page, const UnicodeString& mask) {
    page.setMaskReference(mask);
    page.setFillColor(green);
    drawArea(page, wholeCell);
    page.setFillColor(orange);
    drawDot(page, cellSize / 2, cellSize / 2, cellSize / 3);
}

void drawFadeMask(Drawmere& page) {
    const UnicodeString id = startMask(page, wholeCell, USERSPACEONUSE);
    page.setFillColorId(define(page, maskFade));
    drawArea(page, wholeCell);
    page.endMask();
    drawMasked(page, id);
}

void drawSpotMask(Drawmere& page) {
    const UnicodeString id = startMask(page, {0, 0, 1, 1}, OBJECTBOUNDINGBOX);
    page.setFillColorId(define(page, maskSpot));
    drawArea(page, {0, 0, 1, 1});
    page.endMask();
    drawMasked(page, id);
}

void drawTextMask(Drawmere& page) {
    const UnicodeString id = startMask(page, wholeCell, USERSPACEONUSE);
    page.setFillColorId(define(page, maskFade));
    setFont(page, maskTextSize);
    drawText(page, maskText, maskTextX, maskTextBaseline);
    page.endMask();
    drawMasked(page, id);
}

// Clips. A definition holds one shape in the coordinates of what it clips, and is put to use
// straight behind its end, while no group is open.

void drawStripes(Drawmere& page) {
    for (int i = 0; static_cast<float>(i) * stripeWidth < cellSize; ++i) {
        page.setFillColor(stripeColors[static_cast<std::size_t>(i) % std::size(stripeColors)]);
        drawArea(page, {static_cast<float>(i) * stripeWidth, 0, stripeWidth, cellSize});
    }
}

template <typename Shape> void clip(Drawmere& page, Shape shape, UNITSTYPE units = USERSPACEONUSE) {
    page.startClipDef(units);
    shape();
    page.endClipDef();
    page.doClip();
}

void addCircle(Drawmere& page) { drawDot(page, clipCenter, clipCenter, clipRadius); }

void drawStarClip(Drawmere& page) {
    clip(page, [&] {
        page.setClipRuleAttrVal(CLIPRULE_NONZERO);
        page.startPathData();
        page.setPathMoveTo(point(star[0], star[1]));
        for (std::size_t i = 2; i < std::size(star); i += 2) {
            page.setPathLineTo(point(star[i], star[i + 1]));
        }
        page.setPathClosepath();
        page.endPathData(PAINTMODE_FILL);
    });
    drawStripes(page);
}

void drawRectClip(Drawmere& page) {
    page.startClipRect(USERSPACEONUSE);
    drawArea(page, clipRect, PAINTMODE_FILL, clipRectRadius);
    page.endClipDef();
    page.doClip();
    drawStripes(page);
}

void drawClipInClip(Drawmere& page) {
    clip(page, [&] { addCircle(page); });
    clip(page, [&] { drawArea(page, innerClipRect); });
    drawStripes(page);
}

void drawTextClip(Drawmere& page) {
    clip(page, [&] {
        float baseline = clipLineStep;
        for (const char16_t* line : clipLines) {
            drawText(page, line, clipTextX, baseline);
            baseline += clipLineStep;
        }
    });
    drawStripes(page);
}

void drawClipAfterGroup(Drawmere& page) {
    page.setFillColor(grey);
    drawArea(page, groupBefore); // begins a group, which the definition closes
    clip(page, [&] { addCircle(page); });
    drawStripes(page);
}

void drawTurnedClip(Drawmere& page) {
    page.setTransMatrix(toMatrix(clipTurn));
    clip(page, [&] { drawArea(page, clipRect); });
    drawStripes(page);
}

void drawBoxClip(Drawmere& page) {
    clip(
        page, [&] { drawDot(page, 0.5F, 0.5F, 0.5F); }, OBJECTBOUNDINGBOX);
    drawStripes(page);
}

// The page.

constexpr void (*maskScenes[])(Drawmere& page) = {drawFadeMask, drawSpotMask, drawTextMask};
constexpr void (*clipScenes[])(Drawmere& page) = {drawStarClip, drawRectClip,       drawClipInClip,
                                                  drawTextClip, drawClipAfterGroup, drawTurnedClip,
                                                  drawBoxClip};

void drawPage(Drawmere& page) {
    page.setFillColor(paper);
    drawArea(page, {0, 0, pageWidth, pageHeight});
    for (int i = 0; i < columns; ++i) {
        drawCell(page, i, 0, linearScenes[i].caption, [&] { drawGradient(page, linearScenes[i]); });
        drawCell(page, i, 1, radialScenes[i].caption, [&] { drawGradient(page, radialScenes[i]); });
        drawCell(page, i, 3, clipCaptions[i], [&] { clipScenes[i](page); });
    }
    for (int i = 0; i < patternCount; ++i) {
        drawCell(page, i, 2, patternScenes[i].caption,
                 [&] { drawPattern(page, patternScenes[i]); });
    }
    for (int i = patternCount; i < columns; ++i) {
        drawCell(page, i, 2, maskCaptions[i - patternCount],
                 [&] { maskScenes[i - patternCount](page); });
    }
}

/// Writes the page to the file `path`.
void writePage(const UnicodeString& path) {
    SVGConfig config;
    config.streamOutput = false;       // pages go to files, not to a stream
    config.saveOption = u"decimals=3"; // boxes of size 1 need one more than a page does
    SVGPageUri uri(path);              // a run of one page ends under this plain name
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawmere.startPage(1, corners({0, 0, pageWidth, pageHeight}));
    drawmere.setCanvasSize(pt(pageWidth), pt(pageHeight));
    drawPage(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

} // namespace

int main(int argc, char** argv) {
    try {
        writePage(argc > 1 ? UnicodeString::fromUTF8(argv[1]) : UnicodeString(u"paint.svg"));
    } catch (const MoxError& error) {
        std::fprintf(stderr, "paint: %s\n", error.what());
        return 1;
    }
}
