/// The well-known names that have fixed numbers.
#pragma once

#include <cstdint>

namespace MoxCommonNS {

/// Names whose numbers never change; `MoxName` takes them as they are. Callers may pass any number.
enum MoxNameEnum : std::uint32_t {

#define MOX_NAME(enumerator, number, text) enumerator = (number),
#include "foundation/common/MoxNameEnum.def"
#undef MOX_NAME
};

} // namespace MoxCommonNS
