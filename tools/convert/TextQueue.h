/// Text that waits to be filled.
#pragma once

#include "tools/convert/GlyphRun.h"
#include "tools/convert/PaintState.h"

#include <optional>
#include <vector>

namespace DrawmereConvert {

/// Text that is filled with one path.
struct FilledText {
    GlyphRun run;
    Paint paint;
    bool joins = false; ///< more text with the same paint may be filled with it
};

/// Collects text until something is drawn over it, so that all of one colour becomes one path. What
/// waits touches nothing else that waits, and so may be drawn in any order.
class TextQueue {
public:
    using Texts = std::vector<FilledText>;

    /// Takes text in. Returns: what has to be drawn before it.
    Texts add(const GlyphRun& run, const Paint& paint, bool joins);

    /// Takes out what has to be drawn before anything that covers `area`, in points.
    Texts takeTouching(const fz_rect& area);

    /// Takes out the text, added at once, that becomes `path`.
    std::optional<FilledText> takeEqual(const PathData& path);

    Texts takeAll();

    bool isEmpty() const { return texts.empty(); }

private:
    template <class Test> Texts takeIf(const Test& test);

    Texts texts;
};

} // namespace DrawmereConvert
