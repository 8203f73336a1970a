/// The units of length as CSS and SVG write them.
#pragma once

#include "foundation/common/MoxUnitType.h"
#include "foundation/common/MoxWord.h"

namespace MoxCommonNS {

inline constexpr MoxWord<MoxUnitType> unitWords[] = {
    {MOXUNIT_CM, u"cm"},    {MOXUNIT_MM, u"mm"},   {MOXUNIT_INCH, u"in"},
    {MOXUNIT_POINT, u"pt"}, {MOXUNIT_PICA, u"pc"},
};

} // namespace MoxCommonNS
