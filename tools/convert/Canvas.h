/// The open document as a place to draw shapes on.
#pragma once

#include "tools/convert/PaintState.h"
#include "tools/convert/PathData.h"
#include "tools/convert/TextQueue.h"

namespace DrawmereConvert {

/// Returns: `matrix` as the library takes it. One that moves nothing and comes close to a rotation
/// would be written as one, so such a matrix gets a shift that can't be seen.
SVGMatrix toMatrix(const fz_matrix& matrix);

/// What the profile of the document can clip by.
enum CLIPPING : std::int8_t {
    CLIPPING_ALL,
    CLIPPING_RECTANGLES,
    CLIPPING_NONE,
};

/// What holds for a shape as a whole.
struct Effects {
    bool operator==(const Effects&) const = default;

    float opacity = 1;
    UnicodeString mask{}; ///< id of a mask, or nothing
};

/// Draws paths with what they need set, and opens and closes what contains others.
///
/// A fill waits for the next call, as a stroke of the same path makes one element with it. Text
/// waits longer, for more of its colour, until something is drawn over it. Every other operation
/// draws both first.
/// Throws: MoxError from the library.
class Canvas {
public:
    explicit Canvas(Drawmere& drawmere) : out(drawmere), settings(drawmere) {}

    void fill(const PathData& path, bool isEvenOdd, const Paint& paint);

    /// Fills the outlines of glyphs; those of several calls may become one path.
    void fillText(const GlyphRun& run, const Paint& paint);

    void stroke(const PathData& path, const Paint& paint, const Pen& pen);

    /// Says whether an outline hides the fill under it, as in a knockout group: then both of a
    /// shape share their opacity.
    void setKnockout(bool isKnockout);

    /// Sets the effects of later shapes.
    void setEffects(const Effects& newEffects);

    const Effects& getEffects() const { return effects; }

    CLIPPING getClipping() const;

    /// Returns: whether the profile of the document has masks and patterns.
    bool hasDefinitions() const { return getClipping() != CLIPPING_NONE; }

    void push();
    void pop();

    /// Multiplies the coordinate system until the next pop.
    void transform(const fz_matrix& matrix);

    /// Opens a container that shows only what is inside `path`, which is in the coordinates of the
    /// document; closed by `pop`.
    void beginClip(const PathData& path, bool isEvenOdd);

    /// Opens a pattern with one cell `cell`, repeated as far as its size says, or a mask; returns
    /// its id. Closed by `endPattern` and `endMask`.
    UnicodeString beginPattern(const fz_rect& cell, const fz_matrix& matrix);
    void endPattern();
    UnicodeString beginMask(const fz_rect& area);
    void endMask();

    /// Opens a link; what is drawn until `endLink` leads to `uri`.
    void beginLink(const UnicodeString& uri, bool isNewWindow);
    void endLink();

    /// Draws what waits.
    void flush();

    /// To be called around an element that is drawn through `out`.
    void beginElement();
    void endElement();

    /// Returns: how many elements were drawn, without what only contains others.
    std::int64_t getElementCount() const { return elements; }

    Drawmere& out;

    /// For calls to `out`: to be set through, after a flush.
    PaintState settings;

private:
    struct WaitingFill {
        PathData path; ///< empty when no fill waits
        bool isEvenOdd = false;
        Paint paint;
    };

    void flushFill();
    void fillNow(const TextQueue::Texts& filled);
    bool isWaiting(const PathData& path);
    void strokeWaiting(const Paint& paint, const Pen& pen);
    void strokeHiding(const Paint& paint, const Pen& pen);
    void drawShape(const PathData& path, bool isEvenOdd, PAINTMODE mode);
    void drawPath(const PathData& path, PAINTMODE mode);
    bool isWorthScaling(const FilledText& text) const;
    void drawScaled(const GlyphRun& run);
    void saveDefinition();
    void restoreDefinition();

    WaitingFill waiting;
    TextQueue texts;
    std::int64_t elements = 0;
    bool hidesFills = false;
    Effects effects;
    std::vector<Effects> savedEffects; // of the definitions around
};

} // namespace DrawmereConvert
