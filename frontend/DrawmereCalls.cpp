// The drawing calls, which only pass on what they are given.
#include "Drawmere.h"
#include "draw/DrawmereImpl.h"
#include "fonts/SVGFontManager.h"
#include "state/SVGGraphicContext.h"

namespace DrawmereNS {
namespace {

/// A NaN passes both tests and stays one.
float clampOpacity(float value) {
    if (value < 0.0F) {
        return 0.0F;
    }
    return value > 1.0F ? 1.0F : value;
}

} // namespace

void Drawmere::pushState() {
    if (impl) {
        impl->pushState(ELEMENT_TYPE_PLAIN);
    }
}

void Drawmere::popState() {
    if (impl) {
        impl->popState(ELEMENT_TYPE_PLAIN);
    }
}

void Drawmere::setScale(float scale) {
    if (impl) {
        impl->setScale(scale);
    }
}

void Drawmere::setCanvasSize(MoxLength width, MoxLength height) {
    if (impl) {
        impl->setCanvasSize(width, height);
    }
}

void Drawmere::setCanvasSize(MoxLength width, MoxLength height, MoxUnitType unit) {
    if (impl) {
        impl->setCanvasSize(width, height, unit);
    }
}

void Drawmere::setTransMatrix(SVGMatrix matrix) {
    if (impl) {
        impl->getGContext()->setTransMatrix(matrix);
    }
}

void Drawmere::setFillColor(const MoxColor& color) {
    if (impl) {
        impl->getGContext()->setFillColor(color);
    }
}

void Drawmere::setFillColorId(const UnicodeString& id) {
    if (impl) {
        impl->getGContext()->setFillColorId(id);
    }
}

void Drawmere::setFillColorName(const UnicodeString& name) {
    if (impl) {
        impl->getGContext()->setFillColorName(name);
    }
}

void Drawmere::setStrokeColor(const MoxColor& color) {
    if (impl) {
        impl->getGContext()->setStrokeColor(color);
    }
}

void Drawmere::setStrokeColorName(const UnicodeString& name) {
    if (impl) {
        impl->getGContext()->setStrokeColorName(name);
    }
}

void Drawmere::setStrokeColorId(const UnicodeString& id) {
    if (impl) {
        impl->getGContext()->setStrokeColorId(id);
    }
}

void Drawmere::setStrokeWidth(MoxLength width) {
    if (impl) {
        impl->getGContext()->setStrokeWidth(width);
    }
}

void Drawmere::setFillRule(FILLRULE rule) {
    if (impl) {
        impl->getGContext()->setFillRule(rule);
    }
}

void Drawmere::setFont(SVGFont* font, FS_ExtraFonts* extra) {
    if (!impl || !font) {
        return;
    }
    impl->fontManager->setCurrentFont(font, extra);
    impl->getGContext()->setFont(*font);
}

void Drawmere::setOpacity(float value, OPACITYDEST dest) {
    if (impl) {
        impl->getGContext()->setOpacity(clampOpacity(value), dest);
    }
}

void Drawmere::setMaskReference(UnicodeString id) {
    if (impl) {
        impl->getGContext()->setMaskReference(id);
    }
}

void Drawmere::setTextAnchor(TEXTANCHOR anchor) {
    if (impl) {
        impl->getGContext()->setTextAnchor(anchor);
    }
}

void Drawmere::setTextDecoration(TEXTDECORATION decoration) {
    if (impl) {
        impl->getGContext()->setTextDecoration(decoration);
    }
}

void Drawmere::setDashLine(const MoxLength* dashes, int count, MoxLength offset) {
    if (impl) {
        impl->getGContext()->setDashLine(dashes, count, offset);
    }
}

void Drawmere::setLetterSpacing(MoxLength spacing) {
    if (impl) {
        impl->getGContext()->setLetterSpacing(spacing);
    }
}

void Drawmere::setWordSpacing(MoxLength spacing) {
    if (impl) {
        impl->getGContext()->setWordSpacing(spacing);
    }
}

void Drawmere::setLineCap(LINECAP cap) {
    if (impl) {
        impl->getGContext()->setLineCap(cap);
    }
}

void Drawmere::setLineJoin(LINEJOIN join) {
    if (impl) {
        impl->getGContext()->setLineJoin(join);
    }
}

void Drawmere::setMiterLimit(float limit) {
    if (impl) {
        impl->getGContext()->setMiterLimit(limit);
    }
}

void Drawmere::setWritingMode(MoxName mode) {
    if (impl) {
        impl->getGContext()->setWritingMode(mode);
    }
}

void Drawmere::setClipRuleAttrVal(CLIPRULE rule) {
    if (impl) {
        impl->getGContext()->setClipRuleAttrVal(rule);
    }
}

void Drawmere::startPathData() {
    if (impl) {
        impl->startPathData();
    }
}

void Drawmere::endPathData(PAINTMODE mode) {
    if (impl) {
        impl->endPathData(mode);
    }
}

void Drawmere::setPathMoveTo(const MoxPointT<MoxLength>& point) {
    if (impl) {
        impl->setPathMoveTo(point);
    }
}

void Drawmere::setPathLineTo(const MoxPointT<MoxLength>& point) {
    if (impl) {
        impl->setPathLineTo(point);
    }
}

void Drawmere::setPathCubicBezierCurveTo(const MoxPointT<MoxLength>& p1,
                                         const MoxPointT<MoxLength>& p2,
                                         const MoxPointT<MoxLength>& p3) {
    if (impl) {
        impl->setPathCubicBezierCurveTo(p1, p2, p3);
    }
}

void Drawmere::setPathQuadraticBezierCurveTo(const MoxPointT<MoxLength>& p1,
                                             const MoxPointT<MoxLength>& p2) {
    if (impl) {
        impl->setPathQuadraticBezierCurveTo(p1, p2);
    }
}

void Drawmere::setPathClosepath() {
    if (impl) {
        impl->setPathClosepath();
    }
}

void Drawmere::startClipDef(UNITSTYPE units) {
    if (impl) {
        impl->startClipDef(units);
    }
}

void Drawmere::startClipRect(UNITSTYPE units) {
    if (impl) {
        impl->startClipRect(units);
    }
}

void Drawmere::endClipDef() {
    if (impl) {
        impl->endClipDef();
    }
}

void Drawmere::doClip() {
    if (impl) {
        impl->doClip();
    }
}

void Drawmere::drawLine(MoxLength x1, MoxLength y1, MoxLength x2, MoxLength y2, PAINTMODE mode) {
    if (impl) {
        impl->drawLine(x1, y1, x2, y2, mode);
    }
}

void Drawmere::drawRect(MoxLength x, MoxLength y, MoxLength width, MoxLength height, MoxLength rx,
                        MoxLength ry, PAINTMODE mode) {
    if (impl) {
        impl->drawRect(x, y, width, height, rx, ry, mode);
    }
}

void Drawmere::drawCircle(MoxLength cx, MoxLength cy, MoxLength r, PAINTMODE mode) {
    if (impl) {
        impl->drawCircle(cx, cy, r, mode);
    }
}

void Drawmere::drawEllipse(MoxLength cx, MoxLength cy, MoxLength rx, MoxLength ry, PAINTMODE mode) {
    if (impl) {
        impl->drawEllipse(cx, cy, rx, ry, mode);
    }
}

void Drawmere::drawPolyline(float* points, int count, PAINTMODE mode) {
    if (impl) {
        impl->drawPoly(points, count, /*open=*/true, mode);
    }
}

void Drawmere::drawPolygon(float* points, int count, PAINTMODE mode) {
    if (impl) {
        impl->drawPoly(points, count, /*open=*/false, mode);
    }
}

void Drawmere::drawText(const UnicodeString& text, const std::vector<MoxLength>& x,
                        const std::vector<MoxLength>& y, const std::vector<float>& rotate,
                        PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun,
                        bool leftToRight) {
    if (impl) {
        impl->drawText(text, x, y, rotate, mode, glyphs, wholeRun, leftToRight);
    }
}

void Drawmere::drawText(const UnicodeString& text, MoxLength x, MoxLength y, PAINTMODE mode,
                        TLStringWithGlyphInfo* glyphs, bool wholeRun, bool leftToRight) {
    oneX.assign(1, x);
    oneY.assign(1, y);
    noRotation.assign(1, 0.0F);
    drawText(text, oneX, oneY, noRotation, mode, glyphs, wholeRun, leftToRight);
}

void Drawmere::drawImage(TLGraphicImage* image, TLGraphicType /*type*/, const MoxLength& width,
                         const MoxLength& height, const MoxLength& x, const MoxLength& y) {
    // On purpose: the type is dropped; the image knows its own.
    if (impl) {
        impl->drawImage(image, width, height, x, y);
    }
}

UnicodeString Drawmere::startPattern(const MoxRectT<MoxLength>& area,
                                     const MoxRectT<MoxLength>& viewArea, SVGMatrix matrix,
                                     UNITSTYPE patternUnits, UNITSTYPE contentUnits) {
    return impl ? impl->startPattern(area, viewArea, matrix, patternUnits, contentUnits)
                : UnicodeString();
}

UnicodeString Drawmere::startMask(MoxLength x, MoxLength y, MoxLength width, MoxLength height,
                                  UNITSTYPE maskUnits, UNITSTYPE contentUnits) {
    return impl ? impl->startMask(x, y, width, height, maskUnits, contentUnits) : UnicodeString();
}

UnicodeString Drawmere::startLinearGradient(MoxLength x1, MoxLength y1, MoxLength x2, MoxLength y2,
                                            SVGMatrix matrix, UNITSTYPE units,
                                            GRADSPERADMOD spread) {
    return impl ? impl->startLinearGradient(x1, y1, x2, y2, matrix, units, spread)
                : UnicodeString();
}

UnicodeString Drawmere::startLinearGradient(const MoxPointT<MoxLength>& from,
                                            const MoxPointT<MoxLength>& to, const SVGMatrix& matrix,
                                            UNITSTYPE units, GRADSPERADMOD spread) {
    return impl ? impl->startLinearGradient(from.x, from.y, to.x, to.y, matrix, units, spread)
                : UnicodeString();
}

UnicodeString Drawmere::startRadialGradient(MoxLength cx, MoxLength cy, MoxLength r, MoxLength fx,
                                            MoxLength fy, SVGMatrix matrix, UNITSTYPE units,
                                            GRADSPERADMOD spread) {
    return impl ? impl->startRadialGradient(cx, cy, r, fx, fy, matrix, units, spread)
                : UnicodeString();
}

void Drawmere::setStopColor(const MoxColor& color, float offset, float opacity) {
    if (impl) {
        impl->setStopColor(color, offset, opacity);
    }
}

void Drawmere::endGradiant() {
    if (impl) {
        impl->endGradiant();
    }
}

void Drawmere::endMask() {
    if (impl) {
        impl->endMask();
    }
}

void Drawmere::endPattern() {
    if (impl) {
        impl->endPattern();
    }
}

void Drawmere::startLink(const UnicodeString& uri, const MoxName& show) {
    if (impl) {
        impl->startLink(uri, show);
    }
}

void Drawmere::endLink() {
    if (impl) {
        impl->endLink();
    }
}

void Drawmere::setInternalView(UnicodeString name, float x, float y, float width, float height) {
    if (impl) {
        impl->setInternalView(name, x, y, width, height);
        pageAnchors.insert(name);
    }
}

void Drawmere::setInternalLinkAnchor(UnicodeString name, float x, float y) {
    if (impl) {
        impl->setInternalLinkAnchor(name, x, y);
        pageAnchors.insert(name);
    }
}

} // namespace DrawmereNS
