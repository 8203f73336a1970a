/// The outlines of glyphs, read once a font.
#pragma once

namespace DrawmereConvert {

class GlyphOutlines {};

} // namespace DrawmereConvert
