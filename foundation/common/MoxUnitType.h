/// The units of lengths.
#pragma once

#include <cstdint>

namespace MoxCommonNS {

/// A unit of length. Callers may pass any number; one that is not listed stands for no unit.
enum MoxUnitType : std::int32_t {
    MOXUNIT_NONE = 0,
    MOXUNIT_CM = 6,
    MOXUNIT_MM = 7,
    MOXUNIT_INCH = 8,
    MOXUNIT_POINT = 9, ///< 1/72 inch, the unit in which lengths are kept and written
    MOXUNIT_PICA = 10, ///< 12 points
};

} // namespace MoxCommonNS
