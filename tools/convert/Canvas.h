/// The open document, with what is set in it known, so that nothing is set twice.
#pragma once

#include "Drawmere.h"
#include "tools/convert/PathData.h"

#include <array>
#include <vector>

namespace DrawmereConvert {

using namespace DrawmereNS; // NOLINT(google-build-using-namespace): the library this tool drives

inline MoxLength pt(float points) { return MoxLength::fromRaw(points); }

/// The pen of a stroke; a new one is the library's default.
struct Pen {
    bool operator==(const Pen&) const = default;

    float width = 1;
    LINECAP cap = LINECAP_BUTT;
    LINEJOIN join = LINEJOIN_MITER;
    float miterLimit = 4;
    std::array<float, 32> dashes{};
    int dashCount = 0;
    float dashOffset = 0;
};

/// A colour, or a gradient or pattern by its id.
struct Paint {
    bool operator==(const Paint&) const = default;

    MoxColor color;     ///< with an id only its alpha counts
    UnicodeString id{}; ///< empty for a plain colour
};

/// Draws shapes with what they need set, and keeps the states of the document.
/// Throws: MoxError from the library, in every drawing call.
class Canvas {
public:
    explicit Canvas(Drawmere& drawmere) : out(drawmere) {}

    void fill(const PathData& path, bool isEvenOdd, const Paint& paint);
    void stroke(const PathData& path, const Paint& paint, const Pen& pen);
    void fillAndStroke(const PathData& path, bool isEvenOdd, const Paint& inside,
                       const Paint& outline, const Pen& pen);
    void fillRectangle(const fz_rect& rect, const Paint& paint);

    /// Saves the state and closes the open group.
    void push();
    void pop();

    /// To be called when a definition opens, in which everything has its default, and when it
    /// ends, which gives back what was set before.
    void enterDefinition();
    void leaveDefinition();

    /// Multiplies the coordinate system, in the state saved last.
    void transform(const fz_matrix& matrix);

    void setFill(const Paint& paint);
    void setStroke(const Paint& paint, const Pen& pen);
    void setNoFill();
    void setNoStroke();
    void setOpacity(float opacity);
    void setMask(const UnicodeString& id);

    /// Writes `path` as a path element; what paints it is set.
    void drawPath(const PathData& path, bool isEvenOdd, PAINTMODE mode);

    Drawmere& out;

private:
    struct State {
        Paint fill{MoxColor(), u"none"};
        Paint stroke{MoxColor(), u"none"};
        Pen pen;
        int fillRule = FILLRULE_EVENODD;
        float opacity = 1;
        UnicodeString mask = u"none";
    };

    void drawShape(const PathData& path, bool isEvenOdd, PAINTMODE mode);
    void drawRectangle(const fz_rect& rect, PAINTMODE mode);
    void setPen(const Pen& pen);
    void setFillRule(int rule);

    State state;
    std::vector<State> saved;
};

/// Returns: `matrix` as the library takes it. One that moves nothing and comes close to a rotation
/// would be written as one, so such a matrix gets a shift that can't be seen.
SVGMatrix toMatrix(const fz_matrix& matrix);

} // namespace DrawmereConvert
