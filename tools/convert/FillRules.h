/// Whether it matters by which rule an outline is filled.
#pragma once

#include <ft2build.h>
#include FT_OUTLINE_H

namespace DrawmereConvert {

/// Returns: whether the even-odd rule fills what the nonzero rule does. False also for an outline
/// that touches itself or takes too long to look at.
bool isFilledAlike(FT_Outline& outline);

} // namespace DrawmereConvert
