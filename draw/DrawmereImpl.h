/// The drawing of one document: one element for each call.
#pragma once

#include "DrawmereErrHandler.h"
#include "DrawmereTypes.h"
#include "SVGMatrix.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxPointT.h"
#include "foundation/common/MoxRectT.h"
#include "images/SVGGraphicManager.h"
#include "tree/SVGDocument.h"

#include <iosfwd>
#include <vector>

namespace TalFont {
class TLStringWithGlyphInfo;
}

namespace TalGraphic {
class TLGraphicImage;
}

namespace DrawmereNS {

class SVGConfig;
class SVGFontManager;
class SVGGraphicContext;
class SVGGroupManager;
struct GraphicContext;
class SVGRefIDManager;
class SVGTreeManager;

using MoxCommonNS::MoxColor;
using MoxCommonNS::MoxLength;
using MoxCommonNS::MoxPointT;
using MoxCommonNS::MoxRectT;
using MoxCommonNS::MoxUnitType;
using TalFont::TLStringWithGlyphInfo;
using TalGraphic::TLGraphicImage;

/// What stands behind the public class: owns the managers of one document, makes an element for
/// each drawing call, and hands it to the open group or to the tree. The output profiles derive
/// from it and change its virtual operations alone. All coordinates are lengths, written in points.
class DRAWMERE_API DrawmereImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit DrawmereImpl(SVGConfig* config);
    DrawmereImpl(const DrawmereImpl&) = delete;
    DrawmereImpl& operator=(const DrawmereImpl&) = delete;
    virtual ~DrawmereImpl();

    /// Names a rectangle of the document as a link destination. Units: as they stand, no lengths.
    virtual void setInternalView(UnicodeString id, float x, float y, float width, float height);

    /// Names a point of the document as a link destination. Units: as they stand, no lengths.
    virtual void setInternalLinkAnchor(UnicodeString id, float x, float y);

    /// Does nothing: failures of drawing are thrown.
    virtual void setErrorHandler(const DrawmereErrHandler* handler);

    /// Writes `document` for a caller outside the library. `saveOptions`: as `MoxDocument::save`.
    virtual void outputStream(MoxDocument* document, const UnicodeString& encoding,
                              std::ostream* stream, const UnicodeString& saveOptions);

    /// Closes the open group and saves the state; a type other than the plain one starts from the
    /// defaults and moves the cursor of the tree.
    virtual void pushState(ELEMENT_TYPE type);

    /// Closes the open group and takes the saved state back.
    /// Throws: MoxError 16406 with nothing saved, 16407 when another type was pushed last.
    virtual void popState(ELEMENT_TYPE type);

    /// Stores a number with the state; no coordinate depends on it.
    virtual void setScale(float scale);

    /// Sets `width`, `height` and `viewBox` of the root, the first two with the unit "pt".
    virtual void setCanvasSize(MoxLength width, MoxLength height);

    /// The same with `width` and `height` in `unit`; a unit outside 6 to 10 writes plain numbers.
    virtual void setCanvasSize(MoxLength width, MoxLength height, MoxUnitType unit);

    /// Adds an elliptical arc to the open path. Units: points, `angle` in degrees.
    virtual void ellipticalArcTo(float rx, float ry, float angle, bool largeArc, bool sweep,
                                 float x, float y, bool absolute);

    /// Adds a closing command to the open path.
    virtual void closePath(bool absolute);

    /// Opens a clip path in `defs`; what is drawn until `endClipDef` becomes its content. The units
    /// are those of its coordinates; an unlisted number is `USERSPACEONUSE`.
    /// Queues: MoxError 16940 under Tiny, which knows no clip paths.
    virtual void startClipDef(UNITSTYPE units);
    /// The same for a rectangle, without the warning.
    virtual void startClipRect(UNITSTYPE units);
    /// Closes the clip path. The font is the default one then.
    /// Throws: MoxError 16406 and 16407, as `popState` does.
    virtual void endClipDef();
    /// Clips what follows by the last clip path, up to the next `popState` of a state saved before.
    /// With a group open nothing is clipped: the call belongs straight behind `endClipDef`.
    /// Ignores: a call in a clip path.
    virtual void doClip();

    /// Draws a rectangle; `rx` and `ry` round its corners unless both are 0.
    virtual void drawRect(MoxLength x, MoxLength y, MoxLength width, MoxLength height, MoxLength rx,
                          MoxLength ry, PAINTMODE mode);
    /// Draws a circle.
    virtual void drawCircle(MoxLength cx, MoxLength cy, MoxLength r, PAINTMODE mode);
    /// Draws an ellipse along the axes.
    virtual void drawEllipse(MoxLength cx, MoxLength cy, MoxLength rx, MoxLength ry,
                             PAINTMODE mode);
    /// Draws a line; only its stroke shows.
    virtual void drawLine(MoxLength x1, MoxLength y1, MoxLength x2, MoxLength y2, PAINTMODE mode);

    /// Draws a polyline when `open` is set, otherwise a polygon.
    /// Shape: `coordinates[count]`, x and y in turn; the last of an odd count is dropped.
    /// Units: points. Borrows: `coordinates`, for the call.
    virtual void drawPoly(float* coordinates, int count, bool open, PAINTMODE mode);

    /// Draws a run of text at one position.
    virtual void drawText(const UnicodeString& text, const MoxLength& x, const MoxLength& y,
                          PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun,
                          bool leftToRight);
    /// Draws a run of text at one position or at one for each character.
    virtual void drawText(const UnicodeString& text, const std::vector<MoxLength>& x,
                          const std::vector<MoxLength>& y, const std::vector<float>& rotation,
                          PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun,
                          bool leftToRight);

    /// Places an image. Borrows: `image`, for the call.
    virtual void drawImage(TLGraphicImage* image, const MoxLength& width, const MoxLength& height,
                           const MoxLength& x, const MoxLength& y);
    /// Copies an image to where the configuration says. Returns: the path of the copy.
    virtual UnicodeString copyImage(TLGraphicImage* image);

    /// Opens a link to `href`; what is drawn until `endLink` leads there. The name with the number
    /// 1073 as `show` asks for a new window.
    virtual void startLink(const UnicodeString& href, const MoxName& show);
    /// Closes the link that was opened last.
    virtual void endLink();

    /// Opens a mask in `defs`; what is drawn until `endMask` becomes its content. The units are
    /// those of the area and of the content.
    /// Queues: MoxError 16942 under Tiny. Returns: its id, for `setMaskReference`.
    virtual UnicodeString startMask(MoxLength x, MoxLength y, MoxLength width, MoxLength height,
                                    UNITSTYPE maskUnits, UNITSTYPE contentUnits);
    /// Closes the mask. The font is the default one then.
    /// Throws: MoxError 16406 and 16407, as `popState` does.
    virtual void endMask();

    /// Opens a gradient in `defs`, which holds nothing but the stops that follow: whatever else is
    /// drawn until `endGradiant` is lost. `matrix` applies to its coordinates, `spread` says how it
    /// goes on beyond its ends; an unlisted number pads. Returns: its id, for `setFillColorId` and
    /// `setStrokeColorId`.
    virtual UnicodeString startLinearGradient(MoxLength x1, MoxLength y1, MoxLength x2,
                                              MoxLength y2, SVGMatrix matrix, UNITSTYPE units,
                                              GRADSPERADMOD spread);
    /// The same from the point `fx`, `fy` to a circle.
    /// Queues: MoxError 16941 under Tiny.
    virtual UnicodeString startRadialGradient(MoxLength cx, MoxLength cy, MoxLength r, MoxLength fx,
                                              MoxLength fy, SVGMatrix matrix, UNITSTYPE units,
                                              GRADSPERADMOD spread);
    /// Closes the gradient. The font is the default one then.
    /// Throws: MoxError 16406 and 16407, as `popState` does.
    virtual void endGradiant(); // sic
    /// Adds a stop to the open gradient. Offsets and opacities are written as they are, in the
    /// order of the calls. Ignores: a call outside a gradient.
    virtual void setStopColor(const MoxColor& color, float offset, float opacity);

    /// Opens a pattern in `defs`; what is drawn until `endPattern` becomes its content. `area` is a
    /// tile, by any two opposite corners; `viewArea`, by its corner and the opposite one, is the
    /// part of the content that fills it. The units are those of the tile and of the content.
    /// Queues: MoxError 16943 under Tiny. Returns: its id, for `setFillColorId` and
    /// `setStrokeColorId`.
    virtual UnicodeString startPattern(const MoxRectT<MoxLength>& area,
                                       const MoxRectT<MoxLength>& viewArea, SVGMatrix matrix,
                                       UNITSTYPE patternUnits, UNITSTYPE contentUnits);
    /// Closes the pattern. The font is the default one then.
    /// Throws: MoxError 16406 and 16407, as `popState` does.
    virtual void endPattern();

    /// Sends an element where it belongs: page content to the open group, and with `direct`, as
    /// containers need it, to the cursor of the tree, which moves into it with `makeCurrent`.
    /// Owns: a reference. Who keeps a pointer to `element`, or wants its class to last, holds it in
    /// a `MoxPtr`: what nobody else holds may be packed when it is finished.
    virtual void addElement(SVGElement* element, bool direct, bool makeCurrent);

    /// Makes the root element.
    void initDOM(const UnicodeString& version);
    /// Begins the document.
    void initRootSvg();
    /// Completes the tree; the document can be saved afterwards.
    void finishRootSvg();

    /// Returns: the document, borrowed; it lives on in any `MoxPtr` that takes it. Who looks into
    /// its tree or changes it has asked for it here: what is finished in a document that nobody
    /// asked for is packed, and pointers to it end.
    SVGDocument* getDocument();

    /// Returns: whether the document may hold links; false is certain.
    bool mayHoldLinks() const { return hasLinks || wantsWalk; }

    /// Returns: the anchors that were made with the mark of a page, in the order they were made;
    /// some may have found no place in the tree.
    const std::vector<MoxPtr<MoxElement>>& getPageAnchors() const { return pageAnchors; }

    /// Returns: the state that setters change now, borrowed; while a path is open that is a state
    /// of the path's own, which is thrown away with it.
    SVGGraphicContext* getGContext() const;

    /// Writes `fill`, `stroke` and `fill-rule` as `mode` and the state ask for, and leaves out what
    /// the root says already.
    void setPaintAttr(SVGElement* element, PAINTMODE mode);

    /// Opens a path; one that is open is drawn first, as the path before it was.
    void startPathData();
    /// Draws the open path. Ignores: a call without one, and a path without segments.
    void endPathData(PAINTMODE mode);
    /// Begins a subpath. This and the other segments are ignored without an open path.
    void setPathMoveTo(const MoxPointT<MoxLength>& point);
    /// Closes the subpath.
    void setPathClosepath();
    /// Adds a line.
    void setPathLineTo(const MoxPointT<MoxLength>& point);
    /// Adds a curve with two control points, which ends in `point3`.
    void setPathCubicBezierCurveTo(const MoxPointT<MoxLength>& point1,
                                   const MoxPointT<MoxLength>& point2,
                                   const MoxPointT<MoxLength>& point3);
    /// Adds a curve with one control point, which ends in `point2`. The segment behind it is
    /// written relative to the origin: only a curve that ends its path comes out right.
    void setPathQuadraticBezierCurveTo(const MoxPointT<MoxLength>& point1,
                                       const MoxPointT<MoxLength>& point2);

    /// Returns: the value of a position attribute: one number when all positions are the same, all
    /// of them with blanks between otherwise; empty, for no attribute, when all are 0 or there is
    /// none.
    UnicodeString makePositionAttributeString(const std::vector<MoxLength>& positions) const;

    /// Places an empty `desc` in the root, behind the `defs` when there is one.
    void setComment();

    /// Returns: the attribute of the nearest element that has it, from `element` upwards, or the
    /// null value; with `stopAtRoot` no element above an `svg` is asked.
    MoxValue getInheritAttribute(const MoxElement* element, const MoxName& name,
                                 bool stopAtRoot) const;

    SVGGroupManager* groupManager = nullptr;      ///< owned
    SVGTreeManager* treeManager = nullptr;        ///< owned
    SVGGroupManager* savedGroupManager = nullptr; ///< owned, while a path is open
    SVGRefIDManager* refIdManager = nullptr;      ///< owned
    UnicodeString clipPathId;                     ///< of the clip path that was started last
    bool inClipDef = false;                       ///< while a clip path is open
    PAINTMODE lastPathPaintMode = PAINTMODE_FILL; ///< of the last path that reached the tree
    SVGGraphicManager graphicManager;             ///< what becomes of images
    SVGFontManager* fontManager = nullptr;        ///< owned
    SVGConfig* config;                            ///< borrowed

protected:
    /// Returns: a new element of the document that stands nowhere yet.
    MoxPtr<SVGElement> createElement(SVGName name) const;
    /// The same with room for `geometry` attributes, and for those of the paint and the matrix.
    MoxPtr<SVGElement> createDrawing(SVGName name, int geometry, PAINTMODE mode) const;

    /// Queues the text of `code`, one of 16428 to 16431, when the output is to be Tiny.
    void warnUnderTiny(unsigned short code) const;

private:
    void finishShape(SVGElement* element, PAINTMODE mode);
    void closePathManager();
    void handOverFont();
    void registerText(const UnicodeString& text, TLStringWithGlyphInfo* glyphs, bool wholeRun);
    void setViewBox(SVGElement* root, MoxLength width, MoxLength height) const;
    void setFillAttr(SVGElement& element, const GraphicContext& state, PAINTMODE mode) const;
    void openDefinition(SVGElement* element, ELEMENT_TYPE type);
    void openClipPath(UNITSTYPE units);
    void openGradient(SVGElement* gradient);
    UnicodeString setGradientAttrs(SVGElement& gradient, const SVGMatrix& matrix, UNITSTYPE units,
                                   GRADSPERADMOD spread);

    bool hasLinks = false;
    bool wantsWalk = false; ///< the tree may have been changed by others
    std::vector<MoxPtr<MoxElement>> pageAnchors;
};

} // namespace DrawmereNS
