/// A path in the making.
#pragma once

#include "SVGConfig.h"
#include "path/SVGPathManager.h"
#include "tests/path/Segments.h"
#include "tests/support/Utf8.h"

#include <string>

namespace DrawmereNS {

/// A manager that takes segments, and what it makes of them.
struct OpenPath {
    OpenPath() { manager.addPathLock(true); }

    OpenPath& add(const MoxPtr<SVGDrawElement>& segment) {
        manager.appendPathCommand(segment.get());
        return *this;
    }

    OpenPath& move(float x, float y) { return add(moveTo(x, y)); }

    OpenPath& line(float x, float y) { return add(lineTo(x, y)); }

    OpenPath& cubic(MoxPointT<MoxLength> control1, MoxPointT<MoxLength> control2,
                    MoxPointT<MoxLength> target) {
        return add(cubicTo(control1, control2, target));
    }

    OpenPath& quadratic(MoxPointT<MoxLength> control, MoxPointT<MoxLength> target) {
        return add(quadraticTo(control, target));
    }

    OpenPath& close() { return add(closeSubpath()); }

    std::string data() { return DrawmereTest::utf8(manager.getPathSeg()); }

    SVGConfig config;
    SVGPathManager manager{&config};
};

} // namespace DrawmereNS
