#include "fonts/SVGGlyphPath.h"

#include "foundation/common/MoxDigits.h"
#include "foundation/common/MoxNumberText.h"

#include <algorithm>
#include <cstdlib>
#include <iterator>

namespace DrawmereNS {
namespace {

using MoxCommonNS::maxRealText;
using MoxFontService_NS::FS_GlyphDrawInfo;
using MoxFontService_NS::FS_GlyphPolygon;

constexpr std::size_t maxPointText = 2 * maxRealText + 1;

struct SegmentRule {
    char letter; // 0 for none
    std::size_t pointCount;
};

/// By the type of a segment.
constexpr SegmentRule segmentRules[] = {{'L', 1}, {'Q', 2}, {'C', 3}};

/// On purpose: a segment of a type that is none of the three has no letter and one point. A reader
/// of the path takes its numbers for what follows the number before.
constexpr SegmentRule otherRule = {0, 1};

const SegmentRule& getRule(int type) {
    const bool listed = type >= 0 && type < std::ssize(segmentRules);
    return listed ? segmentRules[type] : otherRule;
}

/// Nearly all coordinates are whole numbers of a few digits.
char* writeCoordinate(float value, char* out) {
    constexpr float limit = 1000.0F * 1000.0F;
    if (!(value > -limit && value < limit)) {
        return out + MoxCommonNS::writeReal(value, out);
    }
    const auto whole = static_cast<std::int32_t>(value);
    if (static_cast<float>(whole) != value) {
        return out + MoxCommonNS::writeReal(value, out);
    }
    if (whole < 0) {
        *out++ = '-';
    }
    return MoxCommonNS::writeWhole(static_cast<std::uint32_t>(std::abs(whole)), out);
}

} // namespace

void SVGGlyphPath::addGlyph(const FS_GlyphDrawInfo& info, int advance, bool vertical) {
    for (const FS_GlyphPolygon& polygon : info.polygons) {
        if (!polygon.points.empty()) {
            addPolygon(polygon, advance, vertical);
        }
    }
}

void SVGGlyphPath::addPolygon(const FS_GlyphPolygon& polygon, int advance, bool vertical) {
    addByte('M');
    addPoint(polygon.points.front(), advance, vertical);
    std::size_t next = 1;
    for (const int type : polygon.segmentTypes) {
        const SegmentRule& rule = getRule(type);
        if (polygon.points.size() - next < rule.pointCount) {
            break;
        }
        if (rule.letter != 0) {
            addByte(rule.letter);
        }
        for (std::size_t i = 0; i < rule.pointCount; ++i) {
            if (i > 0) {
                addByte(' ');
            }
            addPoint(polygon.points[next++], advance, vertical);
        }
    }
    addByte('Z');
}

void SVGGlyphPath::addPoint(const MoxPointT<float>& point, int advance, bool vertical) {
    makeRoom(maxPointText);
    const auto shift = static_cast<float>(advance);
    char* end = writeCoordinate(vertical ? point.x : point.x + shift, bytes + used);
    *end++ = ' ';
    end = writeCoordinate(vertical ? point.y + shift : point.y, end);
    used = static_cast<std::size_t>(end - bytes);
}

void SVGGlyphPath::addByte(char byte) {
    makeRoom(1);
    bytes[used++] = byte;
}

void SVGGlyphPath::makeRoom(std::size_t count) {
    if (room - used >= count) {
        return;
    }
    room = 2 * room + count;
    auto larger = std::make_unique_for_overwrite<char[]>(room);
    std::copy_n(bytes, used, larger.get());
    far = std::move(larger);
    bytes = far.get();
}

} // namespace DrawmereNS
