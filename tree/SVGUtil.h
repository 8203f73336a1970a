/// A toolbox for walking and comparing elements.
#pragma once

#include "foundation/common/MoxColor.h"
#include "tree/SVGElement.h"

namespace DrawmereNS {

using MoxCommonNS::MoxColor;
using MoxCommonNS::MoxName;

/// Static operations on elements. A null element has no name, no text and no relatives; all
/// elements that come back are borrowed.
class DRAWMERE_API SVGUtil {
public:
    /// Returns: the SVG name of the element's local name, `SVGName::unknown` when it has none.
    static SVGName getSVGLocalName(const MoxElement* element);

    /// Replaces the text of the first text child. Ignores: an element that has none; none is made.
    static void setTextValue(MoxElement* element, const UnicodeString& text);

    /// Returns: the text of the first text child, or nothing.
    static UnicodeString getTextValue(const MoxElement* element);

    /// Returns: whether both have one local name and equal attributes, in whatever order.
    static bool hasEqualAttributes(const MoxElement* a, const MoxElement* b);

    /// Returns: the first child that is an element, past everything that is none, or null.
    static MoxElement* getFirstChildElement(const MoxElement* element);

    /// Returns: the next sibling when that is an element, otherwise null.
    static MoxElement* getNextSiblingElement(const MoxElement* element);

    /// Returns: the previous sibling when that is an element, otherwise null.
    static MoxElement* getPreviousSibligElement(const MoxElement* element); // sic

    /// Returns: `element` or the first by `getNextSiblingElement` with this local name, or null.
    static MoxElement* findFirstSiblingLocalName(MoxElement* element, const MoxName& name);

    /// Returns: the first by `findFirstSiblingLocalName` among the children, or null.
    static MoxElement* findFirstChildLocalName(const MoxElement* element, const MoxName& name);

    /// Returns: the first by `findFirstSiblingLocalName` behind `element`, or null.
    static MoxElement* findNextSiblingLocalName(const MoxElement* element, const MoxName& name);

    /// Returns: the text of `color` for an attribute: the shortest, with colour names among the
    /// choices when `flag` is set, and of numbers only otherwise.
    static UnicodeString getColorString(const MoxColor& color, bool flag);
};

} // namespace DrawmereNS
