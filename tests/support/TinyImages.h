/// Image files made of nothing but code.
#pragma once

#include <string>

namespace DrawmereTest {

/// Returns: a PNG file of `width` by `height` pixels that go from dark to light; with `hasAlpha`
/// also from clear to opaque.
std::string makePng(int width, int height, bool hasAlpha = false);

/// Returns: a BMP file of `width` by `height` pixels in two even halves, as in a drawing.
std::string makeBmp(int width, int height);

} // namespace DrawmereTest
