// Image calls. No image is placed so far.
#include "draw/DrawmereImpl.h"

namespace DrawmereNS {

void DrawmereImpl::drawImage(TLGraphicImage* /*image*/, const MoxLength& /*width*/,
                             const MoxLength& /*height*/, const MoxLength& /*x*/,
                             const MoxLength& /*y*/) {}

UnicodeString DrawmereImpl::copyImage(TLGraphicImage* /*image*/) { return {}; }

} // namespace DrawmereNS
