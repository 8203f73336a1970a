/// Output in the SVG Tiny profile.
#pragma once

#include "draw/SVGBasicImpl.h"
#include "foundation/common/MoxColor.h"

namespace DrawmereNS {

/// Tiny has no definitions: clips, views, masks and patterns are dropped with what is drawn into
/// them, and a gradient becomes the one colour half way between its two ends.
class DRAWMERE_API SVGTinyImpl : public SVGBasicImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit SVGTinyImpl(SVGConfig* config);
    ~SVGTinyImpl() override;

    /// Does nothing, so nothing stands under `id`.
    void setInternalView(UnicodeString id, float x, float y, float width, float height) override;

    /// Does nothing.
    void doClip() override;

    /// Ignores: an image inside a definition.
    void drawImage(TLGraphicImage* image, const MoxLength& width, const MoxLength& height,
                   const MoxLength& x, const MoxLength& y) override;

    /// Drops what is drawn until `endMask`. Returns: an empty id.
    UnicodeString startMask(MoxLength x, MoxLength y, MoxLength width, MoxLength height,
                            UNITSTYPE maskUnits, UNITSTYPE contentUnits) override;
    void endMask() override;

    /// Opens a gradient, which shows only in fills that are set to its id after it has ended.
    /// Returns: its id; an empty one, and nothing changes, while a gradient is open.
    UnicodeString startLinearGradient(MoxLength x1, MoxLength y1, MoxLength x2, MoxLength y2,
                                      SVGMatrix matrix, UNITSTYPE units,
                                      GRADSPERADMOD spread) override;
    /// The same.
    UnicodeString startRadialGradient(MoxLength cx, MoxLength cy, MoxLength r, MoxLength fx,
                                      MoxLength fy, SVGMatrix matrix, UNITSTYPE units,
                                      GRADSPERADMOD spread) override;
    /// Notes the colour half way between the two ends as that of the gradient.
    void endGradiant() override; // sic
    /// Keeps the colours of the lowest and of the highest offset; the later of two at one offset.
    /// Ignores: a call outside a gradient.
    void setStopColor(const MoxColor& color, float offset, float opacity) override;

    /// Drops what is drawn until `endPattern`. Returns: an empty id.
    UnicodeString startPattern(const MoxRectT<MoxLength>& area, const MoxRectT<MoxLength>& viewArea,
                               SVGMatrix matrix, UNITSTYPE patternUnits,
                               UNITSTYPE contentUnits) override;
    void endPattern() override;

    using DrawmereImpl::drawText;

    /// Draws a run of text from left to right, for who holds this class as such: the public class
    /// calls the forms with the direction. Ignores: a text inside a definition.
    virtual void drawText(const UnicodeString& text, const MoxLength& x, const MoxLength& y,
                          PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun);

    /// The same with a text of its own for each UTF-16 unit when there are as many positions of
    /// both kinds, and otherwise one text at the first position, 0 for an empty list.
    /// Ignores: `rotation`, an empty text.
    void drawText(const UnicodeString& text, const std::vector<MoxLength>& x,
                  const std::vector<MoxLength>& y, const std::vector<float>& rotation,
                  PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun);

    UnicodeString gradientId;    ///< of the gradient that is open
    MoxColor lowStopColor;       ///< of the stop with the lowest offset so far
    MoxColor highStopColor;      ///< of the stop with the highest offset so far
    bool noStopYet = true;       ///< until the gradient has a stop
    float highStopOffset = 0.0F; ///< the highest so far
    float lowStopOffset = 0.0F;  ///< the lowest so far

private:
    bool isInDefinition() const;
    UnicodeString startGradient();
};

} // namespace DrawmereNS
