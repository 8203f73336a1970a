/// Output for a Plazmic player: Tiny calls, attributes as in Full.
#pragma once

#include "draw/SVGTinyImpl.h"

namespace DrawmereNS {

/// The fallbacks of Tiny, though the graphic state and the configuration don't say Tiny: a clip
/// path is written, what is drawn into a mask or a pattern stands in the page, and a fill refers to
/// its gradient, which is nowhere.
class DRAWMERE_API SVGPlazmicImpl : public SVGTinyImpl {
public:
    /// Borrows: `config`, for its own life.
    explicit SVGPlazmicImpl(SVGConfig* config);
    ~SVGPlazmicImpl() override;

    /// Fits the root into a screen of 240 by 160, in proportion, and writes `document` with the
    /// document type of the player. The public class writes files without this.
    /// On purpose: changes the tree as it writes, so a second writing finds the size of the screen
    /// and scales by 1.
    void outputStream(MoxDocument* document, const UnicodeString& encoding, std::ostream* stream,
                      const UnicodeString& saveOptions) override;
};

} // namespace DrawmereNS
