/// Output for a Plazmic player: Tiny calls, attributes as in Full.
#pragma once

#include "draw/SVGTinyImpl.h"

namespace DrawmereNS {

class DRAWMERE_API SVGPlazmicImpl : public SVGTinyImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit SVGPlazmicImpl(SVGConfig* config);
    ~SVGPlazmicImpl() override;
};

} // namespace DrawmereNS
