/// Output for small devices; nothing in the library makes one, callers may.
#pragma once

#include "draw/DrawmereImpl.h"

namespace DrawmereNS {

class DRAWMERE_API SVGWispImpl : public DrawmereImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit SVGWispImpl(SVGConfig* config);
    ~SVGWispImpl() override;
};

} // namespace DrawmereNS
