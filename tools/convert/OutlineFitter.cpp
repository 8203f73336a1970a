#include "tools/convert/OutlineFitter.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>

namespace DrawmereConvert {
namespace {

constexpr int maxJoined = 8; // curves that become one
constexpr int samplesPerCurve = 4;
constexpr int maxRounds = 4;
constexpr float smallestTurn = 1e-3F;
constexpr float tiny = 1e-9F;
/// How far a curve goes out at most toward its handles.
constexpr float bulge = 0.75F;
/// Where two curves meet at a greater angle there is a corner to keep.
constexpr float cosineOfCorner = 0.9F;
/// One curve that turns back on itself is not worth trying.
constexpr float cosineOfHairpin = -0.9F;

using Vector = fz_point;

Vector operator+(const Vector& a, const Vector& b) { return {a.x + b.x, a.y + b.y}; }

Vector operator-(const Vector& a, const Vector& b) { return {a.x - b.x, a.y - b.y}; }

Vector operator*(float factor, const Vector& a) { return {factor * a.x, factor * a.y}; }

float dot(const Vector& one, const Vector& other) { return one.x * other.x + one.y * other.y; }

float cross(const Vector& one, const Vector& other) { return one.x * other.y - one.y * other.x; }

float length(const Vector& vector) { return std::sqrt(dot(vector, vector)); }

/// A line or a curve; a quadratic one has its control point twice.
struct Segment {
    PATHSTEP step;
    std::array<Vector, 4> points;

    const Vector& begin() const { return points[0]; }

    const Vector& end() const { return points[3]; }
};

Vector at(const Segment& segment, float t) {
    const float u = 1 - t;
    const auto& p = segment.points;
    if (segment.step == PATHSTEP_QUADRATIC) {
        return u * u * p[0] + 2 * u * t * p[1] + t * t * p[3];
    }
    return u * u * u * p[0] + 3 * u * u * t * p[1] + 3 * u * t * t * p[2] + t * t * t * p[3];
}

Vector velocity(const Segment& segment, float t) {
    const float u = 1 - t;
    const auto& p = segment.points;
    if (segment.step == PATHSTEP_QUADRATIC) {
        return 2 * u * (p[1] - p[0]) + 2 * t * (p[3] - p[1]);
    }
    return 3 * u * u * (p[1] - p[0]) + 6 * u * t * (p[2] - p[1]) + 3 * t * t * (p[3] - p[2]);
}

/// Returns: the direction from the first of four points to the next that is somewhere else.
Vector direction(const Vector& a, const Vector& b, const Vector& c, const Vector& d) {
    for (const Vector* to : {&b, &c, &d}) {
        const Vector way = *to - a;
        const float distance = length(way);
        if (distance > tiny) {
            return 1 / distance * way;
        }
    }
    return {0, 0};
}

Vector startDirection(const Segment& segment) {
    const auto& p = segment.points;
    return direction(p[0], p[1], p[2], p[3]);
}

Vector endDirection(const Segment& segment) {
    const auto& p = segment.points;
    return -1 * direction(p[3], p[2], p[1], p[0]);
}

/// Points along curves that may become one, and how far along it they are from 0 to 1: first as if
/// the curves had been cut out of one, which goes through their joints without changing its speed.
struct Samples {
    Samples(const Segment* first, const Segment* last) {
        float weight = 1;
        float total = 0;
        for (const Segment* segment = first; segment <= last; ++segment) {
            if (segment != first) {
                weight *= getRatio(segment[-1], *segment);
            }
            take(*segment, total, weight);
            total += weight;
        }
        --count; // the end is no question
        for (std::size_t i = 0; i < count; ++i) {
            places[i] /= total;
        }
    }

    /// Goes along at the same speed everywhere.
    void level() {
        for (std::size_t i = 0; i < count; ++i) {
            places[i] = lengths[i] / arcLength;
        }
    }

    /// Finds where `curve` comes closest to each. Returns: the largest distance.
    float measure(const Segment& curve) {
        float largest = 0;
        for (std::size_t i = 0; i < count; ++i) {
            largest = std::max(largest, approach(curve, points[i], places[i]));
        }
        return largest;
    }

    std::array<Vector, std::size_t{maxJoined} * samplesPerCurve> points;
    std::array<float, std::size_t{maxJoined} * samplesPerCurve> places;
    std::array<float, std::size_t{maxJoined} * samplesPerCurve> lengths; // of the way there
    std::size_t count = 0;
    float arcLength = 0;

private:
    /// Returns: how much more of the parameter the second of two curves has.
    static float getRatio(const Segment& one, const Segment& next) {
        constexpr float most = 10;
        const float arriving = length(one.points[3] - one.points[2]);
        const float leaving = length(next.points[1] - next.points[0]);
        // A NaN becomes 1.
        const float ratio = leaving / arriving;
        return ratio >= 0 ? std::clamp(ratio, 1 / most, most) : 1;
    }

    void take(const Segment& segment, float start, float weight) {
        Vector before = segment.begin();
        for (int i = 1; i <= samplesPerCurve; ++i) {
            const float part = static_cast<float>(i) / samplesPerCurve;
            const Vector point = at(segment, part);
            arcLength += length(point - before);
            before = point;
            points[count] = point;
            lengths[count] = arcLength;
            places[count++] = start + part * weight;
        }
    }

    static float approach(const Segment& curve, const Vector& point, float& place) {
        for (int round = 0; round < 2; ++round) {
            const Vector speed = velocity(curve, place);
            const float square = dot(speed, speed);
            if (square < tiny) {
                break;
            }
            const float step = dot(point - at(curve, place), speed) / square;
            place = std::clamp(place + step, 0.0F, 1.0F);
        }
        return length(point - at(curve, place));
    }
};

/// The curves from `first` to `last` as one.
class Joint {
public:
    Joint(const Segment* first, const Segment* last, float largestError)
        : samples(first, last), from(first->begin()), to(last->end()),
          departure(startDirection(*first)), arrival(endDirection(*last)), tolerance(largestError) {
    }

    /// Returns: whether `result` became a curve that is close enough.
    bool find(Segment& result) {
        const bool isSound = samples.arcLength > tiny && std::isfinite(samples.arcLength);
        if (!isSound) {
            return false;
        }
        if (findQuadratic(result) || findCubic(result)) {
            return true;
        }
        samples.level();
        return findCubic(result);
    }

private:
    /// The control point is where the ends point to.
    bool findQuadratic(Segment& result) {
        const float turn = cross(departure, arrival);
        if (std::abs(turn) < smallestTurn) {
            return false;
        }
        const Vector way = to - from;
        const float ahead = cross(way, arrival) / turn;
        const float back = cross(departure, way) / turn;
        if (!(ahead > 0 && back > 0)) {
            return false;
        }
        const Vector control = from + ahead * departure;
        result = {PATHSTEP_QUADRATIC, {from, control, control, to}};
        Samples copy = samples;
        return copy.measure(result) <= tolerance;
    }

    /// The directions at the ends are kept, the lengths of the handles are those of least squares.
    bool findCubic(Segment& result) {
        for (int round = 0; round < maxRounds; ++round) {
            float ahead = 0;
            float back = 0;
            if (!solve(ahead, back)) {
                return false;
            }
            result = {PATHSTEP_CURVE, {from, from + ahead * departure, to - back * arrival, to}};
            const float error = samples.measure(result);
            if (error <= tolerance) {
                return true;
            }
            if (round > 0 && error > 4 * tolerance) {
                return false;
            }
        }
        return false;
    }

    bool solve(float& ahead, float& back) const {
        double aa = 0;
        double ab = 0;
        double bb = 0;
        double ra = 0;
        double rb = 0;
        for (std::size_t i = 0; i < samples.count; ++i) {
            const float t = samples.places[i];
            const float u = 1 - t;
            const Vector a = 3 * u * u * t * departure;
            const Vector b = -3 * u * t * t * arrival;
            const Vector rest =
                samples.points[i] - u * u * (u + 3 * t) * from - t * t * (t + 3 * u) * to;
            aa += static_cast<double>(dot(a, a));
            ab += static_cast<double>(dot(a, b));
            bb += static_cast<double>(dot(b, b));
            ra += static_cast<double>(dot(rest, a));
            rb += static_cast<double>(dot(rest, b));
        }
        const double determinant = aa * bb - ab * ab;
        ahead = static_cast<float>((ra * bb - rb * ab) / determinant);
        back = static_cast<float>((aa * rb - ab * ra) / determinant);
        // A NaN fails too.
        return ahead > 0 && back > 0 && ahead <= samples.arcLength && back <= samples.arcLength;
    }

    Samples samples;
    Vector from;
    Vector to;
    Vector departure;
    Vector arrival;
    float tolerance;
};

bool isFlat(const Segment& segment, float tolerance) {
    const Vector way = segment.end() - segment.begin();
    const float distance = length(way);
    const Vector along = distance > tiny ? 1 / distance * way : Vector{0, 0};
    for (const std::size_t i : {1, 2}) {
        const Vector handle = segment.points[i] - segment.begin();
        const float place = dot(handle, along);
        const float aside = distance > tiny ? std::abs(cross(along, handle)) : length(handle);
        if (!(bulge * aside <= tolerance && place >= 0 && place <= distance)) {
            return false;
        }
    }
    return true;
}

bool isSmooth(const Segment& one, const Segment& next) {
    return dot(endDirection(one), startDirection(next)) > cosineOfCorner;
}

class SubpathFitter {
public:
    SubpathFitter(float largestError, LooseOutline& target)
        : tolerance(largestError), fitted(target) {}

    void start(const Vector& point) {
        finish();
        beginning = pen = point;
    }

    void add(PATHSTEP step, const Vector& control1, const Vector& control2, const Vector& point) {
        segments.push_back({step, {pen, control1, control2, point}});
        pen = point;
    }

    void finish() {
        if (segments.empty()) {
            return;
        }
        dropReturn();
        write(PATHSTEP_MOVE, {beginning});
        std::size_t next = 0;
        while (next < segments.size()) {
            next = fitFrom(next);
        }
        segments.clear();
    }

    void close() {
        finish();
        pen = beginning;
    }

private:
    void dropReturn() {
        const Segment& back = segments.back();
        if (segments.size() > 1 && back.step == PATHSTEP_LINE && back.end().x == beginning.x &&
            back.end().y == beginning.y) {
            segments.pop_back();
        }
    }

    /// Writes one segment in place of as many as possible. Returns: which is the next.
    std::size_t fitFrom(std::size_t first) {
        Segment best = segments[first];
        std::size_t next = first + 1;
        if (best.step == PATHSTEP_LINE || isFlat(best, tolerance)) {
            best.step = PATHSTEP_LINE;
        } else {
            replace(first, first, best);
        }
        while (canJoin(first, next) && replace(first, next, best)) {
            ++next;
        }
        write(best);
        return next;
    }

    bool replace(std::size_t first, std::size_t last, Segment& best) const {
        Segment joined;
        const bool isFound = Joint(&segments[first], &segments[last], tolerance).find(joined);
        if (isFound) {
            best = joined;
        }
        return isFound;
    }

    bool canJoin(std::size_t first, std::size_t next) const {
        return next < segments.size() && next - first < maxJoined &&
               segments[first].step == PATHSTEP_CURVE && segments[next].step == PATHSTEP_CURVE &&
               isSmooth(segments[next - 1], segments[next]) &&
               (next == first + 1 || dot(startDirection(segments[first]),
                                         endDirection(segments[next])) > cosineOfHairpin);
    }

    void write(const Segment& segment) {
        const auto& p = segment.points;
        if (segment.step == PATHSTEP_CURVE) {
            write(PATHSTEP_CURVE, {p[1], p[2], p[3]});
        } else if (segment.step == PATHSTEP_QUADRATIC) {
            write(PATHSTEP_QUADRATIC, {p[1], p[3]});
        } else {
            write(PATHSTEP_LINE, {p[3]});
        }
    }

    void write(PATHSTEP step, std::initializer_list<fz_point> points) {
        fitted.steps.push_back(step);
        fitted.points.insert(fitted.points.end(), points);
    }

    float tolerance;
    LooseOutline& fitted;
    std::vector<Segment> segments;
    Vector beginning{};
    Vector pen{};
};

} // namespace

void fitOutline(const GlyphOutline& outline, float tolerance, LooseOutline& fitted) {
    SubpathFitter fitter(tolerance, fitted);
    const fz_point* point = outline.points;
    for (const PATHSTEP* step = outline.steps; step != outline.steps + outline.stepCount; ++step) {
        if (*step == PATHSTEP_MOVE) {
            fitter.start(*point++);
        } else if (*step == PATHSTEP_LINE) {
            fitter.add(PATHSTEP_LINE, *point, *point, *point);
            ++point;
        } else if (*step == PATHSTEP_CURVE) {
            fitter.add(PATHSTEP_CURVE, point[0], point[1], point[2]);
            point += 3;
        } else {
            fitter.close();
        }
    }
    fitter.finish();
}

} // namespace DrawmereConvert
