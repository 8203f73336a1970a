#include "tools/convert/PathReader.h"

#include <new>

namespace DrawmereConvert {
namespace {

struct PathReading {
    PathData& data;
    fz_matrix matrix;
    bool isOutOfMemory = false;

    fz_point place(float x, float y) const { return fz_transform_point_xy(x, y, matrix); }
};

/// Runs `step`, from which no exception may pass into MuPDF.
template <class Step> void addStep(void* arg, const Step& step) {
    auto& reading = *static_cast<PathReading*>(arg);
    try {
        step(reading);
    } catch (...) {
        reading.isOutOfMemory = true;
    }
}

void moveTo(fz_context* /*ctx*/, void* arg, float x, float y) {
    addStep(arg, [&](PathReading& reading) {
        const fz_point point = reading.place(x, y);
        reading.data.moveTo(point.x, point.y);
    });
}

void lineTo(fz_context* /*ctx*/, void* arg, float x, float y) {
    addStep(arg, [&](PathReading& reading) {
        const fz_point point = reading.place(x, y);
        reading.data.lineTo(point.x, point.y);
    });
}

void curveTo(fz_context* /*ctx*/, void* arg, float x1, float y1, float x2, float y2, float x3,
             float y3) {
    addStep(arg, [&](PathReading& reading) {
        const fz_point first = reading.place(x1, y1);
        const fz_point second = reading.place(x2, y2);
        const fz_point end = reading.place(x3, y3);
        reading.data.curveTo(first.x, first.y, second.x, second.y, end.x, end.y);
    });
}

void closePath(fz_context* /*ctx*/, void* arg) {
    addStep(arg, [](PathReading& reading) { reading.data.close(); });
}

constexpr fz_path_walker walker = {&moveTo, &lineTo, &curveTo, &closePath,
                                   nullptr, nullptr, nullptr,  nullptr};

} // namespace

void readPath(fz_context* ctx, const fz_path* path, const fz_matrix& matrix, PathData& data) {
    PathReading reading{data, matrix};
    fz_walk_path(ctx, path, &walker, &reading); // fails only when a callback does
    if (reading.isOutOfMemory) {
        throw std::bad_alloc();
    }
    data.tidy();
}

} // namespace DrawmereConvert
