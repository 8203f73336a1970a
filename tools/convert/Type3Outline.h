/// The glyphs of Type 3 fonts, which are drawings, as outlines.
#pragma once

#include "tools/convert/GlyphOutline.h"

namespace DrawmereConvert {

/// Appends to `outline` what a glyph draws, in units of the em. Bitmaps are traced.
/// Returns: false, with nothing appended, for a glyph with colours of its own or with anything but
/// filled paths and bitmaps.
bool readType3Outline(fz_context* ctx, fz_font* font, int glyph, LooseOutline& outline);

} // namespace DrawmereConvert
