#include "path/SVGPathManager.h"

#include "foundation/common/MoxByteBlock.h"

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <new>
#include <string_view>
#include <utility>

namespace DrawmereNS {
namespace {

/// What the manager of a path answers as its type.
constexpr int pathManagerType = 4;

/// Room for the segments of a usual path.
constexpr std::size_t usualSegments = 64;

/// As far as one string can count.
constexpr std::size_t largestText = INT32_MAX;

using Segments = std::vector<MoxPtr<SVGDrawElement>>;

/// Follows a path and makes its segments relative, in their order.
class RelativePen {
public:
    explicit RelativePen(const SVGDrawElement& move)
        : subpathStart(move.getPoint()), current(subpathStart) {}

    void step(SVGDrawElement& segment) {
        if (!segment.isAbsolute()) {
            return;
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

private:
    MoxPointT<MoxLength> subpathStart;
    MoxPointT<MoxLength> current;
};

/// Returns: whether all bytes are ASCII, as they are unless a caller brings segments of its own.
bool isPlain(std::string_view text) {
    constexpr std::uint64_t highBits = 0x8080808080808080;
    std::uint64_t seen = 0;
    for (; text.size() >= sizeof(seen); text.remove_prefix(sizeof(seen))) {
        std::uint64_t eight = 0;
        std::memcpy(&eight, text.data(), sizeof(eight));
        seen |= eight;
    }
    for (const char byte : text) {
        seen |= static_cast<unsigned char>(byte);
    }
    return (seen & highBits) == 0;
}

} // namespace

/// Path data in the making. Usual paths fit into the object; a longer text moves to the heap, where
/// it grows without being copied as far as the system can do that.
class PathText {
public:
    PathText() = default;
    PathText(const PathText&) = delete;
    PathText& operator=(const PathText&) = delete;

    ~PathText() { std::free(heap); }

    void append(const SVGDrawElement& segment) {
        if (static_cast<std::size_t>(end - cursor) < SVGDrawElement::maxText) {
            grow();
        }
        cursor = segment.writeText(cursor);
    }

    std::string_view get() const { return {begin, static_cast<std::size_t>(cursor - begin)}; }

    /// Returns: the text as a value, null for none; what is long and plain is not copied. Ends the
    /// use of this.
    MoxValue take() {
        const std::string_view text = get();
        if (text.empty()) {
            return {};
        }
        if (!heap || !isPlain(text)) {
            return MoxValue::fromAscii(text);
        }
        void* const shrunk = std::realloc(heap, text.size());
        MoxCommonNS::MoxByteBlock block(shrunk ? static_cast<char*>(shrunk) : heap);
        heap = nullptr;
        return MoxValue::adoptAscii(std::move(block), 0, text.size());
    }

private:
    void grow() {
        const auto length = static_cast<std::size_t>(cursor - begin);
        const auto oldCapacity = static_cast<std::size_t>(end - begin);
        const std::size_t capacity = std::min(2 * oldCapacity, largestText);
        void* memory = capacity > oldCapacity ? std::realloc(heap, capacity) : nullptr;
        if (!memory) {
            throw std::bad_alloc();
        }
        if (!heap) {
            std::memcpy(memory, begin, length);
        }
        heap = static_cast<char*>(memory);
        begin = heap;
        cursor = begin + length;
        end = begin + capacity;
    }

    char near[16384];
    char* heap = nullptr; // owned
    char* begin = near;
    char* cursor = near;
    char* end = near + sizeof(near);
};

SVGPathManager::SVGPathManager(SVGConfig* svgConfig) : SVGGroupManager(svgConfig) {
    segments.reserve(usualSegments);
}

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
    if (!segments.empty()) {
        PathText text;
        writeSegments(text);
        // On purpose: raw text goes when there are segments. Keeping it would put arcs, which are
        // raw text, in front of the moves and lines they were drawn between.
        pathData = UnicodeString::fromUTF8(text.get());
    }
    return pathData;
}

MoxValue SVGPathManager::takePathData() {
    PathText text;
    if (!segments.empty()) {
        writeSegments(text);
        pathData.remove();
    }
    const UnicodeString raw = std::exchange(pathData, {});
    if (!raw.isEmpty()) {
        return raw;
    }
    return text.take();
}

void SVGPathManager::writeSegments(PathText& text) {
    // Taken out first: if memory runs short, the path is lost and not half relative.
    Segments taken = std::exchange(segments, {});
    const bool isRelative = taken.front()->drawName == DRAWELEMENT_MOVE;
    RelativePen pen(*taken.front());
    for (std::size_t i = 0; i < taken.size(); ++i) {
        if (isRelative && i > 0) {
            pen.step(*taken[i]);
        }
        text.append(*taken[i]);
        taken[i] = nullptr; // while it is at hand: a long path is larger than the processor's cache
    }
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
    RelativePen pen(*segments.front());
    for (std::size_t i = 1; i < segments.size(); ++i) {
        pen.step(*segments[i]);
    }
}

} // namespace DrawmereNS
