#include "draw/SVGLinearGradientCell.h"

#include <cmath>
#include <utility>

namespace DrawmereNS {
namespace {

// Callers store these numbers.
constexpr int rightwards = 18;
constexpr int leftwards = 66;
constexpr int downwards = 33;
constexpr int upwards = 36;

} // namespace

int SVGLinearGradientCell::getDirection(const MoxPointT<MoxLength>& first,
                                        const MoxPointT<MoxLength>& second) const {
    const float dx = first.x.getRawValue() - second.x.getRawValue();
    const float dy = first.y.getRawValue() - second.y.getRawValue();
    if (std::abs(dx) >= std::abs(dy)) {
        return second.x.getRawValue() > first.x.getRawValue() ? rightwards : leftwards;
    }
    return second.y.getRawValue() > first.y.getRawValue() ? downwards : upwards;
}

void SVGLinearGradientCell::replaceStartEnd() {
    std::swap(startPoint, endPoint);
    std::swap(startColor, endColor);
    std::swap(startFlag, endFlag);
    std::swap(startValue, endValue);
}

} // namespace DrawmereNS
