/// The enumerations that callers of the drawing interface pass.
///
/// All of them are signed 32-bit numbers, and a caller may pass any number: what an unlisted one
/// does is told where it is taken.
#pragma once

#include <cstdint>

namespace DrawmereNS {

/// How a shape is painted: a set of bits.
enum PAINTMODE : std::int32_t {
    PAINTMODE_NONE = 0,
    PAINTMODE_FILL = 1,
    PAINTMODE_STROKE = 2,
    PAINTMODE_FILLSTROKE = 3, ///< filled, then stroked
    PAINTMODE_TEXT = 4,       ///< a group that holds text; callers need not pass it
};

/// Returns: the bits of both.
constexpr PAINTMODE operator|(PAINTMODE one, PAINTMODE other) {
    return static_cast<PAINTMODE>(static_cast<std::int32_t>(one) |
                                  static_cast<std::int32_t>(other));
}

/// What is inside a path that crosses itself. Every number but 1 means nonzero.
enum FILLRULE : std::int32_t {
    FILLRULE_NONZERO = 0,
    FILLRULE_EVENODD = 1,
};

/// The same for a path that clips; an unlisted number writes no rule.
enum CLIPRULE : std::int32_t {
    CLIPRULE_NONZERO = 0,
    CLIPRULE_EVENODD = 1,
};

/// The ends of strokes; an unlisted number writes no attribute.
enum LINECAP : std::int32_t {
    LINECAP_UNSTATED = -1, ///< written as "butt"
    LINECAP_BUTT = 0,
    LINECAP_ROUND = 1,
    LINECAP_SQUARE = 2,
};

/// The corners of strokes; an unlisted number writes no attribute.
enum LINEJOIN : std::int32_t {
    LINEJOIN_UNSTATED = -1, ///< written as "miter"
    LINEJOIN_MITER = 0,
    LINEJOIN_ROUND = 1,
    LINEJOIN_BEVEL = 2,
};

/// Where a text stands against its position; an unlisted number writes no attribute.
enum TEXTANCHOR : std::int32_t {
    TEXTANCHOR_START = 0,
    TEXTANCHOR_MIDDLE = 1,
    TEXTANCHOR_END = 2,
    TEXTANCHOR_UNSTATED = 3, ///< writes no attribute; the default
};

/// Lines about a text; an unlisted number writes no attribute.
enum TEXTDECORATION : std::int32_t {
    TEXTDECORATION_NONE = 0,
    TEXTDECORATION_UNDERLINE = 1,
    TEXTDECORATION_OVERLINE = 2,
    TEXTDECORATION_LINETHROUGH = 3,
    TEXTDECORATION_BLINK = 4,
};

/// What an opacity belongs to; an unlisted number sets nothing.
enum OPACITYDEST : std::int32_t {
    OPACITYDEST_ELEMENT = 0, ///< the element or group as a whole
    OPACITYDEST_STROKE = 1,
    OPACITYDEST_FILL = 2,
};

/// What a saved state opens; an unlisted number is saved and restored like a defining one.
enum ELEMENT_TYPE : std::int32_t {
    ELEMENT_TYPE_NONE = -2,  ///< nothing: the value before any push and after any pop
    ELEMENT_TYPE_PLAIN = -1, ///< a plain save of the state
    ELEMENT_TYPE_PATTERN = 0,
    ELEMENT_TYPE_GRADIENT = 1,
    ELEMENT_TYPE_MASK = 2,
    ELEMENT_TYPE_CLIP = 3,
    ELEMENT_TYPE_UNUSED = 4, ///< no call opens one
    ELEMENT_TYPE_LINK = 5,   ///< closes the open group and saves nothing
};

/// What kind of element enters a group.
enum ELEMENTTYPE : std::int32_t {
    ELEMENTTYPE_SHAPE = 0, ///< a shape or path
    ELEMENTTYPE_IMAGE = 1,
    ELEMENTTYPE_TEXT = 2,
};

/// What the coordinates of a definition count in.
enum UNITSTYPE : std::int32_t {
    USERSPACEONUSE = 0,
    OBJECTBOUNDINGBOX = 1,
};

/// How a gradient goes on beyond its ends.
enum GRADSPERADMOD : std::int32_t { // sic
    GRADPAD = 0,
    GRADREFLECT = 1,
    GRADREPEAT = 2,
};

} // namespace DrawmereNS
