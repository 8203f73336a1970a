// Text calls. No text is drawn so far: each call answers like one with an empty text.
#include "draw/DrawmereImpl.h"

namespace DrawmereNS {

void DrawmereImpl::drawText(const UnicodeString& text, const MoxLength& x, const MoxLength& y,
                            PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun,
                            bool leftToRight) {
    drawText(text, std::vector<MoxLength>{x}, std::vector<MoxLength>{y}, std::vector<float>(), mode,
             glyphs, wholeRun, leftToRight);
}

void DrawmereImpl::drawText(const UnicodeString& /*text*/, const std::vector<MoxLength>& /*x*/,
                            const std::vector<MoxLength>& /*y*/,
                            const std::vector<float>& /*rotation*/, PAINTMODE /*mode*/,
                            TLStringWithGlyphInfo* /*glyphs*/, bool /*wholeRun*/,
                            bool /*leftToRight*/) {}

} // namespace DrawmereNS
