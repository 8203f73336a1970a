/// Output for viewers that know all of SVG 1.1.
#pragma once

#include "draw/DrawmereImpl.h"

namespace DrawmereNS {

/// Everything goes through, but what may not stand in a clip path.
class DRAWMERE_API SVGFullImpl : public DrawmereImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit SVGFullImpl(SVGConfig* config);
    ~SVGFullImpl() override;

    /// Drops what may not stand in a clip path while one is open: everything but shapes, text and
    /// a clip path that is not in another.
    void addElement(SVGElement* element, bool direct, bool makeCurrent) override;
};

} // namespace DrawmereNS
