/// The clips in force, opened in the document only where they show.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/PageReport.h"

#include <memory>
#include <vector>

namespace DrawmereConvert {

/// One clip: a path, or the rectangle that a path and all clips around it come to.
struct Clip {
    PathData path; ///< empty when nothing but the rectangle clips
    bool isEvenOdd = false;
    fz_rect bounds{};         ///< nothing shows outside
    bool isRectangle = false; ///< all inside `bounds` shows, as far as this clip goes
};

/// Keeps the clips of one page, pattern or mask. A clip becomes a container of the document when
/// something is drawn that it would cut; it stays open as long as it is in force, and a clip that
/// comes again at once finds its container still open.
class ClipStack {
public:
    /// Shape: `area`, outside of which nothing shows; `roomForDepth`, how many containers may nest.
    ClipStack(Canvas& target, PageReport& pageReport, const fz_rect& area, int roomForDepth);

    void push(const PathData& path, bool isEvenOdd);

    /// For what clips by other means, a mask for instance: nothing shows outside `bounds`.
    void pushBounds(const fz_rect& bounds);

    void pop();

    /// Makes the document ready for something inside `bounds`. Returns: whether any of it shows.
    /// Shape: with `leavesOutTop`, the innermost clip doesn't count: what is drawn has its shape.
    bool enter(const fz_rect& bounds, bool leavesOutTop = false);

    /// Closes all containers.
    void leave();

    /// Returns: the innermost clip, null without one.
    const Clip* getTop() const { return active.empty() ? nullptr : active.back().get(); }

    /// Returns: the rectangle outside of which nothing shows, with or without the innermost clip.
    fz_rect getVisible(bool leavesOutTop = false) const;

    /// Returns: whether `rect` has to be cut by its own corners, as no clip can be written.
    bool isCutByHand() const;

    int countOpen() const { return static_cast<int>(open.size()); }

private:
    using ClipPtr = std::shared_ptr<const Clip>;

    void add(Clip clip);
    std::vector<ClipPtr> findCutting(const fz_rect& bounds, bool leavesOutTop) const;
    bool isActive(const ClipPtr& clip, bool leavesOutTop) const;
    void openAll(const std::vector<ClipPtr>& clips);
    void openOne(const ClipPtr& clip);

    Canvas& canvas;
    PageReport& report;
    int room;
    fz_rect page;
    std::vector<ClipPtr> active; // outermost first
    std::vector<ClipPtr> open;   // containers of the document, outermost first
};

} // namespace DrawmereConvert
