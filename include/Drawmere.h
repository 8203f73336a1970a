/// The public class of the library: drawing calls in, SVG documents out.
#pragma once

#include "DrawmereErrHandler.h"
#include "DrawmereExport.h"
#include "DrawmereTypes.h"
#include "SVGConfig.h"
#include "SVGFont.h"
#include "SVGMatrix.h"
#include "SVGPageUri.h"
#include "foundation/common/MoxColor.h"
#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxPointT.h"
#include "foundation/common/MoxPtr.h"
#include "foundation/common/MoxRectT.h"
#include "foundation/fontservice/FS_ExtraFonts.h"
#include "foundation/records/TLGraphicType.h"

#include <iosfwd>
#include <map>
#include <set>
#include <vector>

namespace TalFont {
class TLStringWithGlyphInfo;
}

namespace TalGraphic {
class TLGraphicImage;
}

namespace DrawmereNS {

class DrawmereImpl;
class SVGReferenceId;

using MoxCommonNS::MoxColor;
using MoxCommonNS::MoxDocument;
using MoxCommonNS::MoxError;
using MoxCommonNS::MoxLength;
using MoxCommonNS::MoxName;
using MoxCommonNS::MoxPointT;
using MoxCommonNS::MoxPtr;
using MoxCommonNS::MoxRectT;
using MoxCommonNS::MoxUnitType;
using MoxCommonNS::MoxValue;
using MoxFontService_NS::FS_ExtraFonts;
using TalFont::TLStringWithGlyphInfo;
using TalGraphic::TLGraphicImage;
using TalGraphic::TLGraphicType;

/// Turns a page formatter's calls into SVG documents.
///
/// One object serves one run: for each document `initRootSvg`, then for each page `startPage`,
/// `setCanvasSize`, drawing calls and `endPage`, then `finishRootSvg`; after the last document
/// `finish`. With `SVGConfig::streamOutput` or `SVGConfig::singleFile` the run is one document,
/// which `finish` writes. Otherwise each `finishRootSvg` makes a file, named by the stem of the
/// page URI, the page number in the URI's number format, and the extension; a page whose links
/// point at later pages waits for `finish`, and a run of one page ends under the plain name unless
/// `SVGConfig::keepPageNumber` is set.
///
/// Coordinates are lengths; the output has points, y downwards. Setters only store; what they set
/// shows with the next element, and common attributes are gathered in groups. Without an open
/// document every drawing call, `startPage` and `finishRootSvg` do nothing, and ids are empty.
///
/// Failures: drawing calls throw `MoxError`; `finishRootSvg` and `finish` hand theirs to the error
/// handler; what a document survives goes to the queue of the configuration.
/// Memory: without memory a call throws `std::bad_alloc`, and `finishRootSvg` and `finish` tell the
/// handler, whose default throws it on. What the call should have drawn or written may be missing
/// or half done; the object is fit to go on with or to destroy. An image that there is no memory
/// for is queued or thrown with one of the codes of images, and a stream that has none for its
/// buffer is one that can't be written.
/// Threads: one object stays on one thread; two objects with their own configurations may run on
/// two threads at once.
class DRAWMERE_API Drawmere {
public:
    /// Borrows: both, for the life of the object, in which the caller may go on setting options;
    /// neither may be null.
    Drawmere(SVGConfig* config, SVGPageUri* uri);
    Drawmere(const Drawmere&) = delete;
    Drawmere& operator=(const Drawmere&) = delete;
    /// Drops an unfinished document and the documents that `finish` has not written.
    virtual ~Drawmere();

    /// Returns: a new implementation for the profile, owned by the caller. Every number that names
    /// no other profile, the Wisp one too, gives the Full one.
    DrawmereImpl* createImplInstance(SVGConfig::SVGTYPE type);

    /// Begins a document that goes to a file or files. An unfinished document is deleted.
    /// Throws: MoxError 16410 when paths are checked and the output directory is missing, 16411
    /// when images are to be copied and there is no URI for them, 16413 when paths are checked and
    /// that URI is missing. No document is open then that was not open before.
    void initRootSvg(const UnicodeString& path);

    /// Begins a document that goes to `stream`. An unfinished document is deleted.
    /// Borrows: `stream`, until `finish`.
    /// Throws: MoxError 16411 as above, 16412 when paths are checked and the URI of copied images
    /// is not absolute; the document is open all the same.
    void initRootSvg(std::ostream* stream);

    /// Begins a page in the open document and places its anchor at the first corner of `rect`.
    void startPage(int pageNo, const MoxRectT<MoxLength>& rect);

    /// Files the anchors of the page. The first page to define a name keeps it.
    void endPage();

    /// Finishes the open document, and writes it or keeps it for `finish`.
    /// Failures, 16414 among them for a file that can't be written, go to the error handler.
    void finishRootSvg();

    /// Ends the run: solves the links between kept documents and writes them.
    /// Failures go to the error handler and end the run; what was written stays. Called again, it
    /// writes what is not written yet and nothing twice. The caller's stream is neither flushed nor
    /// closed, so what it refuses only then is for the caller to see.
    void finish();

    /// Writes `document` to `stream`, compressed when the configuration says so. Failures stay in
    /// the state of `stream`. Ignores: nulls.
    void saveDocument(MoxDocument* document, std::ostream* stream);

    /// Returns: whether the configuration's queue holds an error.
    bool hasError();
    /// Takes the newest error off the configuration's queue. Returns: an empty one when it is
    /// empty.
    MoxError popError();

    /// Sets who gets the failures of `finishRootSvg` and `finish`.
    /// Borrows: `handler`, until another is set; null sets the default one, which throws.
    void setErrorHandler(DrawmereErrHandler* handler);

    // The graphic state.

    /// Closes the open group and saves the state.
    void pushState();
    /// Closes the open group and takes the state of the last `pushState` back.
    /// Throws: MoxError 16406 or 16407 when that is not what was saved last.
    void popState();
    /// Stores a number with the state; no coordinate depends on it.
    void setScale(float scale);
    /// Sets the size of the document, written in points.
    void setCanvasSize(MoxLength width, MoxLength height);
    /// The same, written in `unit`; a unit outside 6 to 10 writes plain numbers.
    void setCanvasSize(MoxLength width, MoxLength height, MoxUnitType unit);
    /// Multiplies the coordinate system by `matrix`; matrices set one after another accumulate.
    void setTransMatrix(SVGMatrix matrix);

    /// Sets the colour of later fills, and its alpha as their opacity.
    void setFillColor(const MoxColor& color);
    /// Fills with a gradient or pattern of this id.
    void setFillColorId(const UnicodeString& id);
    /// Fills with a paint that is written as it stands.
    void setFillColorName(const UnicodeString& name);
    /// Sets the colour of later strokes, and its alpha as their opacity.
    void setStrokeColor(const MoxColor& color);
    /// Strokes with a paint that is written as it stands.
    void setStrokeColorName(const UnicodeString& name);
    /// Strokes with a gradient or pattern of this id, under Tiny too, which has none.
    void setStrokeColorId(const UnicodeString& id);
    /// Sets the width of later strokes; one of 0 is written as "0.00001".
    void setStrokeWidth(MoxLength width);
    /// Sets what is inside a shape that crosses itself; even-odd at the start of a document.
    void setFillRule(FILLRULE rule);

    /// Sets the font of later text. Borrows: both, for the call. Ignores: a null font.
    void setFont(SVGFont* font, FS_ExtraFonts* extra);
    /// Sets an opacity, clamped to 0 to 1; a NaN is kept, and written as "0".
    void setOpacity(float value, OPACITYDEST dest);
    /// Masks later elements by the mask of this id; "none" ends that.
    void setMaskReference(UnicodeString id);
    /// Sets where later text stands against its position.
    void setTextAnchor(TEXTANCHOR anchor);
    /// Sets a line about later text.
    void setTextDecoration(TEXTDECORATION decoration);
    /// Sets the dash pattern of later strokes.
    /// Shape: `dashes[count]`, dash and gap in turn; a `count` below 1 empties the pattern.
    /// Borrows: `dashes`, for the call.
    void setDashLine(const MoxLength* dashes, int count, MoxLength offset);
    /// Stores the spacing between letters; it is not written.
    void setLetterSpacing(MoxLength spacing);
    /// Sets what is added to each blank of later text.
    void setWordSpacing(MoxLength spacing);
    /// Sets the ends of later strokes.
    void setLineCap(LINECAP cap);
    /// Sets the corners of later strokes.
    void setLineJoin(LINEJOIN join);
    /// Sets how long a mitre may be, as a multiple of the stroke's width; written as it stands.
    void setMiterLimit(float limit);
    /// Sets the writing mode of later text, by its name in SVG 1.1.
    void setWritingMode(MoxName mode);
    /// Sets the rule of later clip path content.
    void setClipRuleAttrVal(CLIPRULE rule);

    // Paths. Between the two calls nothing else may be drawn or set: it is lost.

    /// Opens a path; one that is open is drawn first.
    void startPathData();
    /// Draws the path. A path without segments draws nothing.
    void endPathData(PAINTMODE mode);
    /// Begins a subpath. The first segment of a path is one of these.
    void setPathMoveTo(const MoxPointT<MoxLength>& point);
    /// Adds a line.
    void setPathLineTo(const MoxPointT<MoxLength>& point);
    /// Adds a curve with the control points `p1` and `p2`, which ends in `p3`.
    void setPathCubicBezierCurveTo(const MoxPointT<MoxLength>& p1, const MoxPointT<MoxLength>& p2,
                                   const MoxPointT<MoxLength>& p3);
    /// Adds a curve with the control point `p1`, which ends in `p2`. A segment behind it goes
    /// astray, so use cubic curves when more segments follow.
    void setPathQuadraticBezierCurveTo(const MoxPointT<MoxLength>& p1,
                                       const MoxPointT<MoxLength>& p2);
    /// Closes the subpath.
    void setPathClosepath();

    // Clips.

    /// Opens a clip path; what is drawn until `endClipDef` becomes its content. Give it one shape
    /// in final coordinates: a second path or a text loses its transform, and a text is drawn in
    /// the font of the root and the size of the viewer. Set the font again after the end. Queues:
    /// MoxError 16940 under Tiny.
    void startClipDef(UNITSTYPE units);
    /// The same for a rectangle; it queues nothing.
    void startClipRect(UNITSTYPE units);
    /// Throws: MoxError 16406 or 16407 when no clip path was opened last; so do the other ends of
    /// definitions.
    void endClipDef();
    /// Clips what follows by the last clip path, until a state saved before is taken back. Call it
    /// straight after `endClipDef`: with a group open nothing is clipped.
    void doClip();

    // Shapes.

    /// Draws a line; only its stroke shows.
    void drawLine(MoxLength x1, MoxLength y1, MoxLength x2, MoxLength y2, PAINTMODE mode);
    /// Draws a rectangle; `rx` and `ry` round its corners unless both are 0.
    void drawRect(MoxLength x, MoxLength y, MoxLength width, MoxLength height, MoxLength rx,
                  MoxLength ry, PAINTMODE mode);
    /// Draws a circle.
    void drawCircle(MoxLength cx, MoxLength cy, MoxLength r, PAINTMODE mode);
    /// Draws an ellipse along the axes.
    void drawEllipse(MoxLength cx, MoxLength cy, MoxLength rx, MoxLength ry, PAINTMODE mode);
    /// Shape: `points[count]`, x and y in turn; the last of an odd count is dropped.
    /// Units: points. Borrows: `points`, for the call; the Basic and Tiny profiles clamp them
    /// there.
    void drawPolyline(float* points, int count, PAINTMODE mode);
    /// As `drawPolyline`, closed.
    void drawPolygon(float* points, int count, PAINTMODE mode);

    // Text and images.

    /// Draws a run of text at one position for the run or one for each character.
    /// `rotate` has no effect. `glyphs` may be null. `leftToRight` false writes the direction.
    void drawText(const UnicodeString& text, const std::vector<MoxLength>& x,
                  const std::vector<MoxLength>& y, const std::vector<float>& rotate, PAINTMODE mode,
                  TLStringWithGlyphInfo* glyphs, bool wholeRun, bool leftToRight);
    /// Draws a run of text at one position.
    void drawText(const UnicodeString& text, MoxLength x, MoxLength y, PAINTMODE mode,
                  TLStringWithGlyphInfo* glyphs, bool wholeRun, bool leftToRight);
    /// Places an image. `type` has no effect. Borrows: `image`, for the call.
    void drawImage(TLGraphicImage* image, TLGraphicType type, const MoxLength& width,
                   const MoxLength& height, const MoxLength& x, const MoxLength& y);

    // Patterns, masks and gradients. Each start call returns the id under which the definition can
    // be used as a paint or mask. Set the font again after the end call.

    /// Opens a pattern; what is drawn until `endPattern` becomes its content. `area` is a tile, by
    /// any two opposite corners, `viewArea` the part of the content that fills it, from its first
    /// corner to the second.
    UnicodeString startPattern(const MoxRectT<MoxLength>& area, const MoxRectT<MoxLength>& viewArea,
                               SVGMatrix matrix, UNITSTYPE patternUnits, UNITSTYPE contentUnits);
    /// Opens a mask; what is drawn until `endMask` becomes its content.
    UnicodeString startMask(MoxLength x, MoxLength y, MoxLength width, MoxLength height,
                            UNITSTYPE maskUnits, UNITSTYPE contentUnits);
    /// Opens a gradient, for stops alone: whatever else is drawn until `endGradiant` is lost.
    UnicodeString startLinearGradient(MoxLength x1, MoxLength y1, MoxLength x2, MoxLength y2,
                                      SVGMatrix matrix, UNITSTYPE units, GRADSPERADMOD spread);
    /// The same with the ends as points.
    UnicodeString startLinearGradient(const MoxPointT<MoxLength>& from,
                                      const MoxPointT<MoxLength>& to, const SVGMatrix& matrix,
                                      UNITSTYPE units, GRADSPERADMOD spread);
    /// Opens a gradient from the point `fx`, `fy` to a circle.
    UnicodeString startRadialGradient(MoxLength cx, MoxLength cy, MoxLength r, MoxLength fx,
                                      MoxLength fy, SVGMatrix matrix, UNITSTYPE units,
                                      GRADSPERADMOD spread);
    /// Adds a stop at `offset`, 0 to 1, with an opacity of its own; nothing is clamped or sorted.
    /// Ignores: a call outside a gradient.
    void setStopColor(const MoxColor& color, float offset, float opacity);
    /// Closes the gradient.
    void endGradiant(); // sic
    /// Closes the mask.
    void endMask();
    /// Closes the pattern.
    void endPattern();

    // Links.

    /// Opens a link to a URI or, with a leading "#", to a destination of the run.
    void startLink(const UnicodeString& uri, const MoxName& show);
    /// Opens the link that a map describes: under "internal" a map with a page number or a name,
    /// otherwise under "external" a URI, and under "show" how it opens.
    void startLink(const MoxValue& link);
    /// Closes the link.
    void endLink();
    /// Makes a rectangle of the page a destination. Units: points.
    void setInternalView(UnicodeString name, float x, float y, float width, float height);
    /// Makes a point of the page a destination. Units: points.
    void setInternalLinkAnchor(UnicodeString name, float x, float y);

    SVGConfig* config;                                 ///< borrowed
    SVGPageUri* pageUri;                               ///< borrowed
    UnicodeString outputPath;                          ///< empty in the stream form
    std::ostream* outputStream = nullptr;              ///< borrowed; null in the path form
    DrawmereImpl* impl = nullptr;                      ///< owned; null between documents
    DrawmereErrHandler* errorHandler;                  ///< borrowed
    std::int32_t currentPage = 0;                      ///< number of the last `startPage`
    std::int32_t firstPage = 0;                        ///< number of the first `startPage`
    std::int32_t pageCount = 0;                        ///< how many pages were started
    std::set<UnicodeString> pageAnchors;               ///< of the page in progress
    std::set<UnicodeString> allAnchors;                ///< of every ended page
    std::map<UnicodeString, std::int32_t> anchorPages; ///< the first page to define each
    std::map<std::int32_t, UnicodeString> pageFiles;   ///< names without directory
    /// Kept for `finish`. One in which the library made no link is taken to have none.
    std::map<std::int32_t, MoxPtr<MoxDocument>> documents;

private:
    void openImpl();
    void closeImpl();
    void checkCopyUri(const UnicodeString& base) const;
    bool copiesImages() const;
    UnicodeString makePageFileName(std::int32_t page, const UnicodeString& format) const;
    UnicodeString makePagePath(std::int32_t page) const;
    void writeFile(MoxDocument* document, const UnicodeString& path);
    void finishOpenDocument();
    bool isSolved(MoxCommonNS::MoxElement* root) const;
    void keepDocument(const MoxPtr<MoxDocument>& document);
    void finishRun();
    void solveReferences();
    void solveDocument(SVGReferenceId& references, std::int32_t page, MoxDocument& document);
    void writeFirstDocument();
    void writeKeptDocuments();
    void writeStream(MoxDocument* document);
    void renameOnlyPage() const;

    /// What is known of a document that waits for `finish`.
    struct KeptPage {
        bool isSolved = false;
        bool isWritten = false;
        bool isLinkless = false;
        /// The page anchors of a document without links, which need not be searched for.
        std::vector<MoxPtr<MoxCommonNS::MoxElement>> anchors = {};
    };

    // The lists of a text with one position, kept from one to the next.
    std::vector<MoxLength> oneX;
    std::vector<MoxLength> oneY;
    std::vector<float> noRotation;

    bool hasWrittenFile = false; ///< under the number of its page
    std::map<std::int32_t, KeptPage> keptPages;
};

} // namespace DrawmereNS
