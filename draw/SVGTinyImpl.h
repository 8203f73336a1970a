/// Output in the SVG Tiny profile.
#pragma once

#include "draw/SVGBasicImpl.h"

namespace DrawmereNS {

class DRAWMERE_API SVGTinyImpl : public SVGBasicImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit SVGTinyImpl(SVGConfig* config);
    ~SVGTinyImpl() override;
};

} // namespace DrawmereNS
