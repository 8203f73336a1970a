#include "foundation/fontservice/FS_OutlineReader.h"

namespace MoxFontService_NS {

namespace {

using Point = MoxPointT<float>;

Point makeMiddle(const Point& a, const Point& b) {
    return {(a.x + b.x) * 0.5F, (a.y + b.y) * 0.5F};
}

// Walks the points `first` to `last` of an outline.
class ContourReader {
public:
    ContourReader(const FT_Outline& source, int firstPoint, int lastPoint, FS_GlyphPolygon& target)
        : outline(source), next(firstPoint), last(lastPoint), polygon(target) {}

    bool read() {
        reserve();
        if (!readStart()) {
            return false;
        }
        while (next <= last) {
            if (!readSegment()) {
                return false;
            }
        }
        dropClosingLine();
        return true;
    }

private:
    int tagAt(int index) const { return FT_CURVE_TAG(outline.tags[index]); }

    Point pointAt(int index) const {
        const FT_Vector& point = outline.points[index];
        return {static_cast<float>(point.x), static_cast<float>(point.y)};
    }

    void reserve() {
        const std::size_t count = last - next + 1;
        polygon.segmentTypes.clear();
        polygon.segmentTypes.reserve(count);
        polygon.points.clear();
        polygon.points.reserve(2 * count); // each control point may imply one more
    }

    // A contour that begins with a control point starts in its last point, or, when that is a
    // control point too, halfway between the two.
    bool readStart() {
        if (tagAt(next) == FT_CURVE_TAG_CUBIC) {
            return false;
        }
        if (tagAt(next) == FT_CURVE_TAG_ON) {
            polygon.points.push_back(pointAt(next++));
        } else if (tagAt(last) == FT_CURVE_TAG_ON) {
            polygon.points.push_back(pointAt(last--));
        } else {
            polygon.points.push_back(makeMiddle(pointAt(next), pointAt(last)));
        }
        return true;
    }

    bool readSegment() {
        switch (tagAt(next)) {
        case FT_CURVE_TAG_ON:
            polygon.segmentTypes.push_back(FSSEGMENT_LINE);
            polygon.points.push_back(pointAt(next++));
            return true;
        case FT_CURVE_TAG_CONIC:
            return readQuadratic();
        case FT_CURVE_TAG_CUBIC:
            return readCubic();
        default:
            return false;
        }
    }

    bool readQuadratic() {
        const Point control = pointAt(next++);
        Point end = polygon.points.front();
        if (next <= last) {
            const Point following = pointAt(next);
            if (tagAt(next) == FT_CURVE_TAG_CUBIC) {
                return false;
            }
            const bool implied = tagAt(next) == FT_CURVE_TAG_CONIC;
            end = implied ? makeMiddle(control, following) : following;
            next += implied ? 0 : 1;
        }
        polygon.segmentTypes.push_back(FSSEGMENT_QUADRATIC);
        polygon.points.insert(polygon.points.end(), {control, end});
        return true;
    }

    bool readCubic() {
        if (next + 1 > last || tagAt(next + 1) != FT_CURVE_TAG_CUBIC) {
            return false;
        }
        const bool closes = next + 2 > last;
        if (!closes && tagAt(next + 2) != FT_CURVE_TAG_ON) {
            return false;
        }
        const Point end = closes ? polygon.points.front() : pointAt(next + 2);
        polygon.segmentTypes.push_back(FSSEGMENT_CUBIC);
        polygon.points.insert(polygon.points.end(), {pointAt(next), pointAt(next + 1), end});
        next += 3;
        return true;
    }

    // Closing a contour draws this line anyway.
    void dropClosingLine() {
        const bool lineAtEnd =
            !polygon.segmentTypes.empty() && polygon.segmentTypes.back() == FSSEGMENT_LINE;
        if (lineAtEnd && polygon.points.back() == polygon.points.front()) {
            polygon.segmentTypes.pop_back();
            polygon.points.pop_back();
        }
    }

    const FT_Outline& outline;
    int next;
    int last;
    FS_GlyphPolygon& polygon;
};

} // namespace

bool FS_OutlineReader::read(const FT_Outline& outline, std::vector<FS_GlyphPolygon>& polygons) {
    if (outline.n_points > mostPoints) {
        return false;
    }
    std::size_t count = 0;
    int first = 0;
    for (int i = 0; i < outline.n_contours; ++i) {
        const int last = outline.contours[i];
        if (last < first || last >= outline.n_points) {
            return false;
        }
        if (count == polygons.size()) {
            polygons.emplace_back();
        }
        if (!ContourReader(outline, first, last, polygons[count]).read()) {
            return false;
        }
        count += polygons[count].segmentTypes.empty() ? 0 : 1;
        first = last + 1;
    }
    polygons.resize(count);
    return true;
}

} // namespace MoxFontService_NS
