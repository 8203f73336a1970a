/// Output for small devices; nothing in the library makes one, callers may.
#pragma once

#include "draw/DrawmereImpl.h"
#include "foundation/common/MoxColor.h"

namespace DrawmereNS {

/// The calls of the base with the graphic state of Tiny. What small devices get from the library is
/// Tiny with the flag `wispMode` of the configuration.
class DRAWMERE_API SVGWispImpl : public DrawmereImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit SVGWispImpl(SVGConfig* config);
    ~SVGWispImpl() override;

    // As in `SVGTinyImpl`, for classes derived from this one; nothing here changes them.
    UnicodeString gradientId;
    MoxColor lowStopColor;
    MoxColor highStopColor;
    bool noStopYet = true;
    float highStopOffset = 0.0F;
    float lowStopOffset = 0.0F;
};

} // namespace DrawmereNS
