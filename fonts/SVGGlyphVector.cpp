#include "fonts/SVGGlyphVector.h"

#include <algorithm>

namespace DrawmereNS {

SVGGlyphVector::SVGGlyphVector(unsigned short index, const char16_t* text, int count)
    : glyIndex(index), uniCount(text ? count : std::min(count, 0)) {
    if (uniCount > 0) {
        unicode = new char16_t[uniCount];
        std::copy_n(text, uniCount, unicode);
    }
}

SVGGlyphVector::~SVGGlyphVector() { delete[] unicode; }

unsigned short SVGGlyphVector::getGlyIndex() const { return glyIndex; }

const char16_t* SVGGlyphVector::getUnicode(unsigned short /*index*/) const { return unicode; }

int SVGGlyphVector::getUniCount(unsigned short /*index*/) const { return uniCount; }

} // namespace DrawmereNS
