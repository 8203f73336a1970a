/// Draws the paths of a page.
#pragma once

#include "tools/convert/PageTools.h"

namespace DrawmereConvert {

/// Matrices are in the document's coordinates.
class PathPainter {
public:
    explicit PathPainter(const PageTools& pageTools) : tools(pageTools) {}

    void fill(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix, const Paint& paint);
    void stroke(const fz_path* path, const fz_stroke_state& style, const fz_matrix& matrix,
                const Paint& paint);
    void clip(const fz_path* path, bool isEvenOdd, const fz_matrix& matrix);
    void clipStroke(const fz_path* path, const fz_stroke_state& style, const fz_matrix& matrix);

    /// Strokes what is read already.
    /// Shape: `path`, the points of which have gone through those of `matrices`.
    void strokeRead(const PathData& path, const fz_stroke_state& style,
                    const StrokeMatrices& matrices, const Paint& paint);

    /// Notes a path that is too long for some viewers.
    void noteLength(std::size_t points);

private:
    void read(const fz_path* path, const fz_matrix& matrix);

    PageTools tools;
    PathData current; // kept for its memory
};

} // namespace DrawmereConvert
