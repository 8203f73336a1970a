/// What is set in the open document, so that nothing is set twice.
#pragma once

#include "Drawmere.h"

#include <array>
#include <vector>

namespace DrawmereConvert {

using namespace DrawmereNS; // NOLINT(google-build-using-namespace): the library this tool drives

inline MoxLength pt(float points) { return MoxLength::fromRaw(points); }

/// The pen of a stroke; a new one is the library's default.
struct Pen {
    static constexpr std::size_t maxDashes = 32;

    bool operator==(const Pen&) const = default;

    float width = 1;
    LINECAP cap = LINECAP_BUTT;
    LINEJOIN join = LINEJOIN_MITER;
    float miterLimit = 4;
    std::array<float, maxDashes> dashes{};
    int dashCount = 0;
    float dashOffset = 0;
};

/// A colour, or a gradient or pattern by its id.
struct Paint {
    bool operator==(const Paint&) const = default;

    MoxColor color{};   ///< with an id only its alpha counts
    UnicodeString id{}; ///< empty for a plain colour
};

/// The settings of a document, with those that it has by itself.
class PaintState {
public:
    explicit PaintState(Drawmere& drawmere) : out(drawmere) {}

    void setFill(const Paint& paint);
    void setStroke(const Paint& paint, const Pen& pen);
    /// For what is not filled or not stroked: sets back what would be written all the same.
    void setNoFill();
    void setNoStroke();
    void setFillRule(FILLRULE rule);
    void setOpacity(float opacity);
    void setMask(const UnicodeString& id);

    bool hasDashes() const { return now.pen.dashCount > 0; }

    /// To be called with each push of the document, plain or of a definition, which begins with the
    /// settings that a new document has; and with each pop.
    void save(bool isDefinition);
    void restore();

private:
    struct Settings {
        Paint fill{MoxColor(), u"none"};
        Paint stroke{MoxColor(), u"none"};
        Pen pen;
        FILLRULE fillRule = FILLRULE_EVENODD;
        float opacity = 1;
        UnicodeString mask = u"none";
    };

    void setPen(const Pen& pen);
    void setDashes(const Pen& pen);

    Drawmere& out;
    Settings now;
    std::vector<Settings> saved;
};

} // namespace DrawmereConvert
