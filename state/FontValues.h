/// The values of the attributes of a font.
#pragma once

#include "SVGFont.h"
#include "foundation/common/MoxValue.h"

namespace DrawmereNS {

using MoxCommonNS::MoxValue;

// All values are texts. They are made without a string in between: each group of texts has some.

/// Returns: the keyword that `size` stands for, otherwise its number in the output unit.
MoxValue makeFontSizeValue(MoxLength size);

/// Returns: `adjust` in the output unit, or "none".
MoxValue makeFontAdjustValue(MoxLength adjust);

/// Returns: the number of the weight, or "normal" for a number that is none.
MoxValue makeFontWeightValue(FONTWEIGHT weight);

/// Returns: the word of a style that is not normal, otherwise null.
const char16_t* findFontStyleWord(FSTYLE style);

/// Returns: the word of a width that is not normal, otherwise null.
const char16_t* findFontStretchWord(FONTSTRECH stretch);

// The words of a style, a variant and a width, "normal" for numbers that are not listed.

const char16_t* getFontStyleWord(FSTYLE style);
const char16_t* getFontVariantWord(FVARIANT variant);
const char16_t* getFontStretchWord(FONTSTRECH stretch);

} // namespace DrawmereNS
