/// The graphic state: what the caller sets, what the open group stands for, and the matrix above.
#pragma once

#include "SVGConfig.h"
#include "foundation/common/MoxValue.h"
#include "state/GraphicContext.h"

#include <map>

namespace MoxCommonNS {
class MoxColor;
}

namespace DrawmereNS {

using MoxCommonNS::MoxColor;

class SVGElement;

/// The attribute that `setStrokeAttribute` or `setTextAttribute` writes.
enum ATTRIBUTEFLAG : std::int32_t {
    ATTRIBUTEFLAG_STROKEWIDTH = 1,
    ATTRIBUTEFLAG_LINECAP = 2,
    ATTRIBUTEFLAG_LINEJOIN = 4,
    ATTRIBUTEFLAG_MITERLIMIT = 8,
    ATTRIBUTEFLAG_DASHARRAY = 16,
    ATTRIBUTEFLAG_DASHOFFSET = 32,
    ATTRIBUTEFLAG_WRITINGMODE = 64,
    ATTRIBUTEFLAG_TEXTANCHOR = 128,
    ATTRIBUTEFLAG_TEXTDECORATION = 256,
};

/// The matrix that `setTransformAttr` writes, and what becomes of it.
enum TRANSFORMMODE : std::int32_t {
    TRANSFORMMODE_ROOT = 1,       ///< the root matrix
    TRANSFORMMODE_GROUP = 2,      ///< the group's matrix
    TRANSFORMMODE_CURRENT = 3,    ///< the current matrix
    TRANSFORMMODE_NESTEDCLIP = 4, ///< the current matrix, which then moves to the group
    TRANSFORMMODE_CLIP = 5,       ///< all matrices, which then move to the root
    TRANSFORMMODE_GRADIENT = 6,   ///< the current matrix, as gradientTransform
};

/// Two full sets of attributes, the current one that setters change and that of the open group, and
/// the matrix that stands at root level. Setters only store; nothing touches the tree before one of
/// the writing operations is asked to.
class DRAWMERE_API SVGGraphicContext {
public:
    /// Borrows: `svgConfig`, which says how colours are written; by name where that is shorter when
    /// it is null.
    explicit SVGGraphicContext(SVGConfig* svgConfig);

    /// A copy of everything; the configuration is shared.
    SVGGraphicContext(const SVGGraphicContext&) = default;
    SVGGraphicContext& operator=(const SVGGraphicContext&) = delete;
    virtual ~SVGGraphicContext();

    /// Sets the stroke's colour and its opacity, which is 1 for a colour without an alpha part.
    void setStrokeColor(const MoxColor& color);
    /// Sets the stroke to a paint that is written as it stands.
    void setStrokeColorName(const UnicodeString& name);
    /// Sets the stroke to the paint defined under `id`, in every dialect.
    void setStrokeColorId(const UnicodeString& id);

    /// Sets the fill's colour and its opacity, which is 1 for a colour without an alpha part.
    void setFillColor(const MoxColor& color);
    /// Sets the fill to a paint that is written as it stands.
    void setFillColorName(const UnicodeString& name);
    /// Sets the fill to the paint defined under `id`. Tiny has no references: there it is the solid
    /// colour noted for `id`, and "none" when there is none.
    void setFillColorId(const UnicodeString& id);

    /// Sets one opacity as it stands, in range or not. Ignores: an unlisted destination.
    void setOpacity(float value, OPACITYDEST dest);
    /// Sets the fill rule; every number but 1 means nonzero.
    void setFillRule(FILLRULE rule);

    /// Sets the width of strokes.
    void setStrokeWidth(MoxLength width) { currentGC.strokeWidth = width; }

    /// Sets how long a mitre may be.
    void setMiterLimit(float limit) { currentGC.miterLimit = limit; }

    /// Stores the spacing between letters, which is not written.
    void setLetterSpacing(MoxLength spacing) { currentGC.letterSpacing = spacing; }

    /// Sets what is added to each blank of text.
    void setWordSpacing(MoxLength spacing) { currentGC.wordSpacing = spacing; }

    /// Sets the writing mode of text.
    void setWritingMode(MoxName mode) { currentGC.writingMode = mode; }

    /// Sets where text stands against its position.
    void setTextAnchor(TEXTANCHOR anchor) { currentGC.textAnchor = anchor; }

    /// Sets a line about text.
    void setTextDecoration(TEXTDECORATION decoration) { currentGC.textDecoration = decoration; }

    /// Sets the ends of strokes.
    void setLineCap(LINECAP cap) { currentGC.lineCap = cap; }

    /// Sets the corners of strokes.
    void setLineJoin(LINEJOIN join) { currentGC.lineJoin = join; }

    /// Sets the dash pattern and its offset.
    /// Shape: `lengths[count]`, dash and gap in turn; a `count` below 1, or null, empties the
    /// pattern. Borrows: `lengths`, for the call.
    void setDashLine(const MoxLength* lengths, int count, MoxLength offset);

    /// Sets the font of text.
    void setFont(const SVGFont& font) { assignFont(currentGC.font, font); }

    /// Sets the mask to the one defined under `id`; "none" takes it off.
    void setMaskReference(const UnicodeString& id);

    /// Sets the clip path to the one defined under `id`.
    void setClipPathID(const UnicodeString& id);

    /// Notes that something is clipped; nothing decides by it.
    void setClipState(bool state) { clipState = state; }

    /// Sets the rule of shapes in clip paths.
    void setClipRuleAttrVal(CLIPRULE rule) { currentGC.clipRule = rule; }

    /// Multiplies the current matrix by `m`, which applies first from now on.
    /// Ignores: a scaling by 0 both ways; in Basic and Tiny a number beyond 32768 either way.
    void setTransMatrix(SVGMatrix m);

    /// Sets which defined thing is being drawn, an `ELEMENT_TYPE`.
    void setType(int type) { elementType = type; }

    /// Returns: an `ELEMENT_TYPE`.
    int getType() const { return elementType; }

    /// Sets the dialect: full, basic or tiny. It needs not be the profile of the configuration.
    void setSVGType(SVGConfig::SVGTYPE type) { svgType = type; }

    /// Returns: the dialect.
    SVGConfig::SVGTYPE getSVGType() const { return svgType; }

    /// Returns: the current font, borrowed.
    SVGFont* getFont() { return &currentGC.font; }

    /// Returns: the current record, borrowed.
    GraphicContext* getCurrentGC() { return &currentGC; }

    /// Returns: the record of the open group, borrowed.
    GraphicContext* getGroupGC() { return &groupGC; }

    /// Replaces the record of the open group.
    void setGroupGC(const GraphicContext& record) { groupGC = record; }

    /// Makes the group's attributes the current ones. With `multiply` the current matrix moves into
    /// the group's, otherwise both matrices stay.
    void copyCur2Group(bool multiply);

    /// The same, and all of the matrix moves on to the root.
    void copyGroup2Root();

    /// Sets both records and the root matrix to the defaults; everything else stays.
    void setDefaultGC();

    /// Takes everything but the configuration over from `other`.
    void copyFrom(const SVGGraphicContext& other);

    /// Writes one attribute of the stroke without comparing, from the group's record or the current
    /// one. Ignores: a `flag` that is none of the stroke's, and a null element.
    void setStrokeAttribute(SVGElement* element, int flag, bool isGroup) const;

    /// The same for the attributes of texts.
    void setTextAttribute(SVGElement* element, int flag, bool isGroup) const;

    /// Writes an opacity where the group differs from the defaults, or the current value from the
    /// group; `asOpacity` writes the fill's opacity as that of the element. Ignores: Tiny, which
    /// has no opacity, an unlisted destination, and a null element.
    void setOpacityAttribute(SVGElement* element, OPACITYDEST dest, bool isGroup,
                             bool asOpacity) const;

    /// Writes the rule of a shape that clips. Ignores: Tiny, an unlisted rule, a null element.
    void setClipRule(CLIPRULE rule, SVGElement* element) const;

    /// Writes the reference to the clip path, when there is one. The flag is not used.
    /// Ignores: Tiny, and a null element.
    void setClipPathAttrVal(SVGElement* element, bool flag) const;

    /// Writes on `element` what differs: for a group its record from the defaults, for any other
    /// element the current record from the group's. The order of the attributes is that of the
    /// saved file. Ignores: a null element.
    void AttrValueCompare(SVGElement* element, bool isGroup, ELEMENTTYPE kind);

    /// Writes the attributes of a closing group.
    void setGroupAttrs(SVGElement* group, ELEMENTTYPE kind);

    /// Returns: whether `m` is the identity, exactly; its classification is not read.
    static bool IsUnitMatrix(const SVGMatrix& m);

    /// Returns: the shortest transform for `m` by its kind, empty when there is nothing to write.
    static UnicodeString convertMatrixToString(const SVGMatrix& m);

    /// Writes one of the matrices on `element` and moves it as `mode`, a `TRANSFORMMODE`, says; a
    /// matrix that says nothing writes nothing. Ignores: any other mode, and a null element.
    void setTransformAttr(SVGElement* element, int mode);

    GraphicContext currentGC;            ///< what the caller set last
    GraphicContext groupGC;              ///< what the open group stands for
    int elementType = ELEMENT_TYPE_NONE; ///< which defined thing is being drawn
    int changeCount = 0;                 ///< counts fill rules; nothing decides by it
    UnicodeString clipPathId;            ///< the ready-made value of clip-path
    bool clipState = false;              ///< nothing decides by it
    SVGConfig::SVGTYPE svgType = SVGConfig::SVGTYPE_FULL;  ///< the dialect
    SVGMatrix rootMatrix;                                  ///< what stands at root level
    std::map<UnicodeString, UnicodeString> tinyFillColors; ///< for Tiny: an id, its solid colour
    SVGConfig* config;                                     ///< borrowed

private:
    /// What is written, and what it is compared with.
    struct Levels {
        const GraphicContext& subject;
        const GraphicContext& reference;
    };

    Levels getLevels(bool isGroup) const;

    const GraphicContext& getRecord(bool isGroup) const { return isGroup ? groupGC : currentGC; }

    bool isTiny() const { return svgType == SVGConfig::SVGTYPE_TINY; }

    bool isBeyondProfile(const SVGMatrix& m) const;
    UnicodeString getColorText(const MoxColor& color) const;
    void writeStrokeDifferences(SVGElement* element, bool isGroup) const;
    void writeTextDifferences(SVGElement* element, bool isGroup);
    void writeFont(SVGElement* group, const SVGFont& font);
    const MoxCommonNS::MoxValue& getFamilyValue(const UnicodeString& family);
    void moveCurrentToGroup();
    void writeClip(SVGElement* element);

    MoxCommonNS::MoxValue lastFamily; ///< written; the groups of one family share its text
};

} // namespace DrawmereNS
