// Clip paths, masks, patterns and gradients. None is defined so far: ids are empty, and what is
// drawn between a start and its end stands in the page.
#include "draw/DrawmereImpl.h"

namespace DrawmereNS {

void DrawmereImpl::startClipDef(UNITSTYPE /*units*/) {}

void DrawmereImpl::startClipRect(UNITSTYPE /*units*/) {}

void DrawmereImpl::endClipDef() {}

void DrawmereImpl::doClip() {}

UnicodeString DrawmereImpl::startMask(MoxLength /*x*/, MoxLength /*y*/, MoxLength /*width*/,
                                      MoxLength /*height*/, UNITSTYPE /*maskUnits*/,
                                      UNITSTYPE /*contentUnits*/) {
    return {};
}

void DrawmereImpl::endMask() {}

UnicodeString DrawmereImpl::startLinearGradient(MoxLength /*x1*/, MoxLength /*y1*/,
                                                MoxLength /*x2*/, MoxLength /*y2*/,
                                                SVGMatrix /*matrix*/, UNITSTYPE /*units*/,
                                                GRADSPERADMOD /*spread*/) {
    return {};
}

UnicodeString DrawmereImpl::startRadialGradient(MoxLength /*cx*/, MoxLength /*cy*/, MoxLength /*r*/,
                                                MoxLength /*fx*/, MoxLength /*fy*/,
                                                SVGMatrix /*matrix*/, UNITSTYPE /*units*/,
                                                GRADSPERADMOD /*spread*/) {
    return {};
}

void DrawmereImpl::endGradiant() {}

void DrawmereImpl::setStopColor(const MoxColor& /*color*/, float /*offset*/, float /*opacity*/) {}

UnicodeString DrawmereImpl::startPattern(const MoxRectT<MoxLength>& /*area*/,
                                         const MoxRectT<MoxLength>& /*viewArea*/,
                                         SVGMatrix /*matrix*/, UNITSTYPE /*patternUnits*/,
                                         UNITSTYPE /*contentUnits*/) {
    return {};
}

void DrawmereImpl::endPattern() {}

} // namespace DrawmereNS
