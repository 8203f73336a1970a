#include "tools/convert/FillRules.h"

#include <algorithm>
#include <cmath>
#include <vector>

namespace DrawmereConvert {
namespace {

// Curves become lines: glyphs that are alike only to within a thousandth of their size are alike.
constexpr int curvePieces = 6;
constexpr std::size_t maxEdges = 2000;

struct Point {
    float x = 0;
    float y = 0;
};

struct Edge {
    Point from;
    Point to;
    int contour = 0;
    int place = 0; // in its contour
};

Point toPoint(const FT_Vector& vector) {
    return {static_cast<float>(vector.x), static_cast<float>(vector.y)};
}

Point mix(const Point& from, const Point& to, float part) {
    return {from.x + (to.x - from.x) * part, from.y + (to.y - from.y) * part};
}

/// The edges of an outline, contour by contour.
class EdgeList {
public:
    void moveTo(const Point& point) {
        close();
        start = now = point;
        place = 0;
    }

    void lineTo(const Point& point) {
        if (point.x != now.x || point.y != now.y) {
            edges.push_back({now, point, contourCount, place++});
            now = point;
        }
    }

    void curveTo(const Point& one, const Point& two, const Point& end) {
        const Point begin = now;
        for (int i = 1; i < curvePieces; ++i) {
            const float part = static_cast<float>(i) / curvePieces;
            const Point middle = mix(one, two, part);
            lineTo(mix(mix(mix(begin, one, part), middle, part),
                       mix(middle, mix(two, end, part), part), part));
        }
        lineTo(end);
    }

    void close() {
        lineTo(start);
        lengths.push_back(place);
        contourCount += place > 0 ? 1 : 0;
        lengths.resize(static_cast<std::size_t>(contourCount));
        place = 0;
    }

    const Point& getEnd() const { return now; }

    std::vector<Edge> edges;
    std::vector<int> lengths; // of the contours
    int contourCount = 0;

private:
    Point start;
    Point now;
    int place = 0;
};

EdgeList& listOf(void* target) { return *static_cast<EdgeList*>(target); }

EdgeList readEdges(FT_Outline& outline) {
    EdgeList list;
    FT_Outline_Funcs sinks = {};
    sinks.move_to = [](const FT_Vector* to, void* target) {
        listOf(target).moveTo(toPoint(*to));
        return 0;
    };
    sinks.line_to = [](const FT_Vector* to, void* target) {
        listOf(target).lineTo(toPoint(*to));
        return 0;
    };
    sinks.conic_to = [](const FT_Vector* control, const FT_Vector* to, void* target) {
        constexpr float part = 2.0F / 3.0F;
        EdgeList& edges = listOf(target);
        const Point middle = toPoint(*control);
        const Point end = toPoint(*to);
        edges.curveTo(mix(edges.getEnd(), middle, part), mix(end, middle, part), end);
        return 0;
    };
    sinks.cubic_to = [](const FT_Vector* one, const FT_Vector* two, const FT_Vector* to,
                        void* target) {
        listOf(target).curveTo(toPoint(*one), toPoint(*two), toPoint(*to));
        return 0;
    };
    FT_Outline_Decompose(&outline, &sinks, &list);
    list.close();
    return list;
}

/// Returns: on which side of the line the point is, 0 on it.
int findSide(const Edge& line, const Point& point) {
    const float side = (line.to.x - line.from.x) * (point.y - line.from.y) -
                       (line.to.y - line.from.y) * (point.x - line.from.x);
    return side > 0 ? 1 : side < 0 ? -1 : 0;
}

bool doMeet(const Edge& one, const Edge& other) {
    const bool isApart = std::max(one.from.x, one.to.x) < std::min(other.from.x, other.to.x) ||
                         std::max(other.from.x, other.to.x) < std::min(one.from.x, one.to.x);
    return !isApart && findSide(one, other.from) * findSide(one, other.to) <= 0 &&
           findSide(other, one.from) * findSide(other, one.to) <= 0;
}

bool areNeighbours(const Edge& one, const Edge& other, int length) {
    const int distance = std::abs(one.place - other.place);
    return one.contour == other.contour && (distance == 1 || distance == length - 1);
}

float getBottom(const Edge& edge) { return std::min(edge.from.y, edge.to.y); }

bool hasMeetings(std::vector<Edge>& edges, const std::vector<int>& lengths) {
    std::ranges::sort(edges, {}, getBottom);
    for (std::size_t i = 0; i < edges.size(); ++i) {
        const Edge& one = edges[i];
        const float top = std::max(one.from.y, one.to.y);
        const int length = lengths[static_cast<std::size_t>(one.contour)];
        for (std::size_t j = i + 1; j < edges.size() && getBottom(edges[j]) <= top; ++j) {
            if (!areNeighbours(one, edges[j], length) && doMeet(one, edges[j])) {
                return true;
            }
        }
    }
    return false;
}

/// Returns: how often the contours but one go around its point `point`.
int countTurns(const std::vector<Edge>& edges, const Point& point, int contour) {
    int turns = 0;
    for (const Edge& edge : edges) {
        const bool starts = edge.from.y <= point.y;
        if (edge.contour != contour && starts != (edge.to.y <= point.y)) {
            const int side = findSide(edge, point);
            turns += starts && side > 0 ? 1 : !starts && side < 0 ? -1 : 0;
        }
    }
    return turns;
}

bool isOnceAround(int turns) { return turns >= -1 && turns <= 1; }

} // namespace

// Contours that never meet lie in one another or apart, so the turns around a point can change only
// from one side of a contour to the other.
bool isFilledAlike(FT_Outline& outline) {
    EdgeList list = readEdges(outline);
    if (list.edges.size() > maxEdges || hasMeetings(list.edges, list.lengths)) {
        return false;
    }
    std::vector<float> areas(static_cast<std::size_t>(list.contourCount));
    std::vector<Point> points(areas.size());
    for (const Edge& edge : list.edges) {
        const auto contour = static_cast<std::size_t>(edge.contour);
        areas[contour] += edge.from.x * edge.to.y - edge.to.x * edge.from.y;
        points[contour] = edge.from;
    }
    for (int contour = 0; contour < list.contourCount; ++contour) {
        const auto index = static_cast<std::size_t>(contour);
        const int outside = countTurns(list.edges, points[index], contour);
        if (!isOnceAround(outside) || !isOnceAround(outside + (areas[index] > 0 ? 1 : -1))) {
            return false;
        }
    }
    return true;
}

} // namespace DrawmereConvert
