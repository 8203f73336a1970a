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
    /// A copy.
    GraphicContext(const GraphicContext&) = default;
    ~GraphicContext() = default;

    /// Copies every member.
    GraphicContext& operator=(const GraphicContext& other);

    UnicodeString strokeColor{u"none"};                  ///< the ready-made value of stroke
    MoxLength strokeWidth = MoxLength::fromRaw(1.0F);    ///< of strokes
    LINECAP lineCap = LINECAP_BUTT;                      ///< the ends of strokes
    LINEJOIN lineJoin = LINEJOIN_MITER;                  ///< the corners of strokes
    std::vector<MoxLength> dashArray;                    ///< dash and gap in turn
    MoxLength dashOffset;                                ///< where the dash pattern starts
    float miterLimit = 4.0F;                             ///< a multiple of the width
    float strokeOpacity = 1.0F;                          ///< of strokes
    UnicodeString maskReference{u"none"};                ///< the ready-made value of mask
    UnicodeString fillColor{u"none"};                    ///< the ready-made value of fill
    UnicodeString fillRule{u"evenodd"};                  ///< the ready-made value of fill-rule
    float fillOpacity = 1.0F;                            ///< of fills
    SVGFont font;                                        ///< of text
    MoxLength letterSpacing;                             ///< kept, never written
    MoxLength wordSpacing;                               ///< of text
    MoxName writingMode = MoxCommonNS::MOXNAME_LR_TB;    ///< of text
    TEXTANCHOR textAnchor = TEXTANCHOR_UNSTATED;         ///< of text
    TEXTDECORATION textDecoration = TEXTDECORATION_NONE; ///< of text
    CLIPRULE clipRule = CLIPRULE_EVENODD;                ///< of shapes in clip paths
    float opacity = 1.0F;                                ///< of the group or element as a whole
    SVGMatrix transMatrix; ///< of the level that the record stands for
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
