#include "tools/convert/ClipStack.h"

#include "tools/convert/Rectangles.h"

#include <algorithm>
#include <utility>

namespace DrawmereConvert {
namespace {

constexpr float closeEnough = 0.02F; // no viewer shows less

bool holds(const fz_rect& outer, const fz_rect& inner) {
    return inner.x0 >= outer.x0 - closeEnough && inner.y0 >= outer.y0 - closeEnough &&
           inner.x1 <= outer.x1 + closeEnough && inner.y1 <= outer.y1 + closeEnough;
}

bool meets(const fz_rect& one, const fz_rect& other) {
    return one.x0 <= other.x1 && other.x0 <= one.x1 && one.y0 <= other.y1 && other.y0 <= one.y1;
}

bool isSame(const fz_rect& one, const fz_rect& other) {
    return one.x0 == other.x0 && one.y0 == other.y0 && one.x1 == other.x1 && one.y1 == other.y1;
}

bool isSame(const Clip& one, const Clip& other) {
    return one.isRectangle == other.isRectangle && isSame(one.bounds, other.bounds) &&
           one.isEvenOdd == other.isEvenOdd && one.path == other.path;
}

} // namespace

ClipStack::ClipStack(Canvas& target, PageReport& pageReport, const fz_rect& area, int roomForDepth)
    : canvas(target), report(pageReport), room(roomForDepth), page(area) {}

void ClipStack::push(const PathData& path, bool isEvenOdd) {
    Clip clip;
    clip.isEvenOdd = isEvenOdd;
    clip.isRectangle = path.isRectangle(clip.bounds);
    if (!clip.isRectangle) {
        clip.path = path;
        clip.bounds = path.isEmpty() ? fz_rect{0, 0, -1, -1} : path.getBounds();
    }
    clip.bounds = intersect(clip.bounds, getVisible());
    add(std::move(clip));
}

void ClipStack::pushBounds(const fz_rect& bounds) {
    Clip clip;
    clip.bounds = intersect(bounds, getVisible());
    add(std::move(clip));
}

// The container of the same clip that was left last is taken up again.
void ClipStack::add(Clip clip) {
    for (const ClipPtr& other : open) {
        if (!isActive(other, /*leavesOutTop=*/false) && isSame(*other, clip)) {
            active.push_back(other);
            return;
        }
    }
    active.push_back(std::make_shared<const Clip>(std::move(clip)));
}

void ClipStack::pop() {
    if (!active.empty()) {
        active.pop_back();
    }
}

fz_rect ClipStack::getVisible(bool leavesOutTop) const {
    const std::size_t count = active.size() - (leavesOutTop && !active.empty() ? 1 : 0);
    return count == 0 ? page : active[count - 1]->bounds;
}

bool ClipStack::isActive(const ClipPtr& clip, bool leavesOutTop) const {
    const auto end = active.end() - (leavesOutTop && !active.empty() ? 1 : 0);
    return std::find(active.begin(), end, clip) != end;
}

// The bounds of a rectangle are those of all clips around it, so only the innermost counts.
std::vector<ClipStack::ClipPtr> ClipStack::findCutting(const fz_rect& bounds,
                                                       bool leavesOutTop) const {
    std::vector<ClipPtr> cutting;
    bool isInside = false;
    const auto first = active.rbegin() + (leavesOutTop && !active.empty() ? 1 : 0);
    for (auto clip = first; clip != active.rend(); ++clip) {
        const bool cuts = (*clip)->isRectangle ? !isInside && !holds((*clip)->bounds, bounds)
                                               : !(*clip)->path.isEmpty();
        isInside = isInside || (*clip)->isRectangle;
        if (cuts) {
            cutting.insert(cutting.begin(), *clip);
        }
    }
    return cutting;
}

bool ClipStack::enter(const fz_rect& bounds, bool leavesOutTop) {
    if (!meets(bounds, getVisible(leavesOutTop))) {
        return false;
    }
    const std::vector<ClipPtr> cutting = findCutting(bounds, leavesOutTop);
    const auto stays = [&](const ClipPtr& clip) { return isActive(clip, leavesOutTop); };
    const auto firstStale = std::find_if_not(open.begin(), open.end(), stays);
    for (auto count = open.end() - firstStale; count > 0; --count) {
        canvas.pop();
        open.pop_back();
    }
    openAll(cutting);
    return true;
}

void ClipStack::openAll(const std::vector<ClipPtr>& clips) {
    for (const ClipPtr& clip : clips) {
        if (std::find(open.begin(), open.end(), clip) != open.end()) {
            continue;
        }
        if (countOpen() >= room) {
            report.note(APPROXIMATION_DEPTH);
            return;
        }
        if (canvas.getClipping() == CLIPPING_NONE) {
            report.note(APPROXIMATION_CLIP);
            continue;
        }
        openOne(clip);
    }
}

// A profile that clips by rectangles alone would show nothing through another clip.
void ClipStack::openOne(const ClipPtr& clip) {
    const bool isWidened = !clip->isRectangle && canvas.getClipping() == CLIPPING_RECTANGLES;
    if (isWidened) {
        report.note(APPROXIMATION_CLIP);
    }
    const bool isBox = clip->isRectangle || isWidened;
    canvas.beginClip(isBox ? toPath(clip->bounds) : clip->path, clip->isEvenOdd);
    open.push_back(clip);
}

bool ClipStack::isCutByHand() const { return canvas.getClipping() == CLIPPING_NONE; }

void ClipStack::leave() {
    for (; !open.empty(); open.pop_back()) {
        canvas.pop();
    }
}

} // namespace DrawmereConvert
