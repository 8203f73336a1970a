/// A drawing implementation that notes what it is told.
#pragma once

#include "draw/DrawmereImpl.h"

#include <string>

namespace DrawmereTest {

/// Draws nothing: each virtual call becomes a line in `told`, its name and its arguments.
class RecordingImpl : public DrawmereNS::DrawmereImpl {
public:
    using DrawmereImpl::DrawmereImpl;
    ~RecordingImpl() override;

    using Length = DrawmereNS::MoxLength;
    using Lengths = std::vector<Length>;
    using Mode = DrawmereNS::PAINTMODE;
    using Text = DrawmereNS::UnicodeString;
    using Units = DrawmereNS::UNITSTYPE;

    void setInternalView(Text id, float x, float y, float width, float height) override;
    void setInternalLinkAnchor(Text id, float x, float y) override;
    void setErrorHandler(const DrawmereNS::DrawmereErrHandler* handler) override;
    void pushState(DrawmereNS::ELEMENT_TYPE type) override;
    void popState(DrawmereNS::ELEMENT_TYPE type) override;
    void setScale(float scale) override;
    void setCanvasSize(Length width, Length height) override;
    void setCanvasSize(Length width, Length height, DrawmereNS::MoxUnitType unit) override;
    void startClipDef(Units units) override;
    void startClipRect(Units units) override;
    void endClipDef() override;
    void doClip() override;
    void drawRect(Length x, Length y, Length width, Length height, Length rx, Length ry,
                  Mode mode) override;
    void drawCircle(Length cx, Length cy, Length r, Mode mode) override;
    void drawEllipse(Length cx, Length cy, Length rx, Length ry, Mode mode) override;
    void drawLine(Length x1, Length y1, Length x2, Length y2, Mode mode) override;
    void drawPoly(float* coordinates, int count, bool open, Mode mode) override;
    void drawText(const Text& text, const Length& x, const Length& y, Mode mode,
                  DrawmereNS::TLStringWithGlyphInfo* glyphs, bool wholeRun,
                  bool leftToRight) override;
    void drawText(const Text& text, const Lengths& x, const Lengths& y,
                  const std::vector<float>& rotation, Mode mode,
                  DrawmereNS::TLStringWithGlyphInfo* glyphs, bool wholeRun,
                  bool leftToRight) override;
    void drawImage(DrawmereNS::TLGraphicImage* image, const Length& width, const Length& height,
                   const Length& x, const Length& y) override;
    void startLink(const Text& href, const DrawmereNS::MoxName& show) override;
    void endLink() override;
    Text startMask(Length x, Length y, Length width, Length height, Units maskUnits,
                   Units contentUnits) override;
    void endMask() override;
    Text startLinearGradient(Length x1, Length y1, Length x2, Length y2,
                             DrawmereNS::SVGMatrix matrix, Units units,
                             DrawmereNS::GRADSPERADMOD spread) override;
    Text startRadialGradient(Length cx, Length cy, Length r, Length fx, Length fy,
                             DrawmereNS::SVGMatrix matrix, Units units,
                             DrawmereNS::GRADSPERADMOD spread) override;
    void endGradiant() override;
    void setStopColor(const DrawmereNS::MoxColor& color, float offset, float opacity) override;
    Text startPattern(const DrawmereNS::MoxRectT<Length>& area,
                      const DrawmereNS::MoxRectT<Length>& viewArea, DrawmereNS::SVGMatrix matrix,
                      Units patternUnits, Units contentUnits) override;
    void endPattern() override;

    std::string told;
};

} // namespace DrawmereTest
