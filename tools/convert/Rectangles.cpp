#include "tools/convert/Rectangles.h"

#include <algorithm>

namespace DrawmereConvert {

fz_rect intersect(const fz_rect& one, const fz_rect& other) {
    return {std::max(one.x0, other.x0), std::max(one.y0, other.y0), std::min(one.x1, other.x1),
            std::min(one.y1, other.y1)};
}

bool isEmpty(const fz_rect& rect) { return !(rect.x1 > rect.x0 && rect.y1 > rect.y0); }

PathData toPath(const fz_rect& rect) {
    PathData path;
    path.moveTo(rect.x0, rect.y0);
    path.lineTo(rect.x1, rect.y0);
    path.lineTo(rect.x1, rect.y1);
    path.lineTo(rect.x0, rect.y1);
    path.close();
    return path;
}

} // namespace DrawmereConvert
