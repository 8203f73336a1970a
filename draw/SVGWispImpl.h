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
    UnicodeString gradientId;    ///< as in `SVGTinyImpl`
    MoxColor lowStopColor;       ///< as in `SVGTinyImpl`
    MoxColor highStopColor;      ///< as in `SVGTinyImpl`
    bool noStopYet = true;       ///< as in `SVGTinyImpl`
    float highStopOffset = 0.0F; ///< as in `SVGTinyImpl`
    float lowStopOffset = 0.0F;  ///< as in `SVGTinyImpl`
};

} // namespace DrawmereNS
