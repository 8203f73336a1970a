/// One full set of the attributes that callers set.
#pragma once

#include "DrawmereExport.h"
#include "DrawmereTypes.h"
#include "SVGFont.h"
#include "SVGMatrix.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxName.h"
#include "foundation/common/MoxString.h"

#include <vector>

namespace DrawmereNS {

using MoxCommonNS::MoxLength;
using MoxCommonNS::MoxName;

/// Makes `to` the font `from`, where they differ.
DRAWMERE_API void assignFont(SVGFont& to, const SVGFont& from);

/// A plain record, copied member by member; texts are ready to be written as they stand. The order
/// of the members is interface.
///
/// On purpose: its defaults are not those of SVG 1.1. The fill rule is "evenodd" and both paints
/// are "none"; taking SVG's would change what every comparison finds worth writing.
struct DRAWMERE_API GraphicContext {
    GraphicContext() = default;
    GraphicContext(const GraphicContext&) = default;
    ~GraphicContext() = default;

    /// Copies every member.
    GraphicContext& operator=(const GraphicContext& other);

    UnicodeString strokeColor{u"none"};
    MoxLength strokeWidth = MoxLength::fromRaw(1.0F);
    LINECAP lineCap = LINECAP_BUTT;
    LINEJOIN lineJoin = LINEJOIN_MITER;
    std::vector<MoxLength> dashArray; ///< dash and gap in turn
    MoxLength dashOffset;
    float miterLimit = 4.0F;
    float strokeOpacity = 1.0F;
    UnicodeString maskReference{u"none"};
    UnicodeString fillColor{u"none"};
    UnicodeString fillRule{u"evenodd"};
    float fillOpacity = 1.0F;
    SVGFont font;
    MoxLength letterSpacing; ///< kept, never written
    MoxLength wordSpacing;
    MoxName writingMode = MoxCommonNS::MOXNAME_LR_TB;
    TEXTANCHOR textAnchor = TEXTANCHOR_UNSTATED;
    TEXTDECORATION textDecoration = TEXTDECORATION_NONE;
    CLIPRULE clipRule = CLIPRULE_EVENODD;
    float opacity = 1.0F; ///< of the group or element as a whole
    SVGMatrix transMatrix;
};

/// Returns: the record of the defaults that everything is compared with; it lives until the process
/// ends.
DRAWMERE_API const GraphicContext& getDefaultGC();

/// The same record by its name.
/// It may be used before main: the reference is inline, so each source that includes this header
/// sets it up ahead of the source's own static objects, and the record itself is made at that first
/// use. This folder asks `getDefaultGC`, which needs no setting up: a static object elsewhere may
/// reach it through a source that never saw this header.
inline const GraphicContext& defaultGC = getDefaultGC();

} // namespace DrawmereNS
