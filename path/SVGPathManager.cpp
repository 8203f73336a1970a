#include "path/SVGPathManager.h"

#include <algorithm>
#include <new>

namespace DrawmereNS {
namespace {

/// Long paths grow into this without reallocation.
constexpr std::int32_t initialCapacity = 32000;
/// As far as one string goes; a few characters less than it can count.
constexpr std::int32_t largestCapacity = INT32_MAX - 64;
/// What the manager of a path answers as its type.
constexpr int pathManagerType = 4;

/// Path data in the making, written straight into the string's own buffer.
class PathText {
public:
    explicit PathText(UnicodeString& target) : text(target) { open(initialCapacity); }

    void append(const SVGDrawElement& segment) {
        if (end - cursor < static_cast<std::ptrdiff_t>(SVGDrawElement::maxText)) {
            grow();
        }
        cursor = segment.writeText(cursor);
    }

    void close() { text.releaseBuffer(static_cast<std::int32_t>(cursor - begin)); }

private:
    void open(std::int32_t capacity) {
        const std::int32_t length = text.length();
        begin = text.getBuffer(capacity);
        if (!begin) {
            throw std::bad_alloc();
        }
        cursor = begin + length;
        end = begin + text.getCapacity();
    }

    void grow() {
        const std::int64_t wanted = 2 * static_cast<std::int64_t>(end - begin);
        close();
        if (end - begin >= largestCapacity) {
            throw std::bad_alloc();
        }
        open(static_cast<std::int32_t>(std::min<std::int64_t>(wanted, largestCapacity)));
    }

    UnicodeString& text;
    char16_t* begin = nullptr;
    char16_t* cursor = nullptr;
    char16_t* end = nullptr;
};

} // namespace

SVGPathManager::SVGPathManager(SVGConfig* svgConfig)
    : SVGGroupManager(svgConfig), pathData(initialCapacity, 0, 0) {}

SVGPathManager::~SVGPathManager() = default;

int SVGPathManager::getType() const { return pathManagerType; }

void SVGPathManager::appendPathCommand(SVGDrawElement* command) {
    if (command) {
        segments.emplace_back(command);
    }
}

void SVGPathManager::addPathSeg(const UnicodeString& text, bool /*absolute*/) {
    pathData.append(text);
}

const UnicodeString& SVGPathManager::getPathSeg() {
    if (segments.empty()) {
        return pathData;
    }
    makePathDataRealtive();
    // On purpose: raw text goes when there are segments. Keeping it would put arcs, which are raw
    // text, in front of the moves and lines they were drawn between.
    pathData.remove();
    PathText data(pathData);
    for (const MoxPtr<SVGDrawElement>& segment : segments) {
        data.append(*segment);
    }
    data.close();
    segments.clear();
    return pathData;
}

void SVGPathManager::deletePathSeg() {
    segments.clear();
    pathData.remove();
}

void SVGPathManager::addPathLock(bool lock) {
    // On purpose: false turns the lock over, so on an unlocked manager it locks.
    pathLock = lock || !pathLock;
}

void SVGPathManager::setElemMode(PAINTMODE mode, ELEMENTTYPE kind) {
    changeKind(kind);
    paintMode = paintMode | mode;
}

void SVGPathManager::makePathDataRealtive() {
    if (segments.empty() || segments.front()->drawName != DRAWELEMENT_MOVE) {
        return;
    }
    MoxPointT<MoxLength> subpathStart = segments.front()->getPoint();
    MoxPointT<MoxLength> current = subpathStart;
    for (std::size_t i = 1; i < segments.size(); ++i) {
        SVGDrawElement& segment = *segments[i];
        if (!segment.isAbsolute()) {
            continue;
        }
        // Read before the segment is made relative, which overwrites its points.
        MoxPointT<MoxLength> target = segment.getPoint();
        if (segment.drawName == DRAWELEMENT_MOVE) {
            subpathStart = target;
        } else if (segment.drawName == DRAWELEMENT_CLOSE) {
            target = subpathStart;
        }
        segment.makeRelative(current);
        current = target;
    }
}

} // namespace DrawmereNS
