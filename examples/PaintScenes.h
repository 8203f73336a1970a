/// The scenes of the example `paint` as numbers.
#pragma once

#include "DrawmereTypes.h"

#include <array>
#include <span>

// A4, landscape. All numbers are points, y grows downwards. Scenes stand in rows, each in a cell of
// its own coordinates, 0 to `cellSize`.

inline constexpr float pageWidth = 842;
inline constexpr float pageHeight = 595;
inline constexpr float cellSize = 96;
inline constexpr int columns = 7;
inline constexpr int rows = 4;
inline constexpr float columnStep = 112;
inline constexpr float rowStep = 140;
inline constexpr float leftMargin = 37;
inline constexpr float topMargin = 32;

inline constexpr char16_t captionFont[] = u"DejaVu Sans";
inline constexpr float captionSize = 8;
inline constexpr float captionBaseline = 110; ///< in the cell

// Colours are 0xRRGGBB.
inline constexpr unsigned int paper = 0xF3F5FA;
inline constexpr unsigned int white = 0xFFFFFF;
inline constexpr unsigned int navy = 0x1D2B4F;
inline constexpr unsigned int grey = 0xCDD4E2;
inline constexpr unsigned int green = 0x2A9D8F;
inline constexpr unsigned int orange = 0xF4A261;
inline constexpr unsigned int red = 0xE5566D;

struct Area {
    float x;
    float y;
    float width;
    float height;

    constexpr bool operator==(const Area&) const = default;
};

inline constexpr Area wholeCell = {0, 0, cellSize, cellSize};

/// The six numbers of a matrix as SVG 1.1 orders them.
using Matrix = std::array<float, 6>;

inline constexpr Matrix unit = {1, 0, 0, 1, 0, 0};

struct Stop {
    unsigned int color;
    float offset;
    float opacity;
};

inline constexpr Stop dawn[] = {{navy, 0, 1}, {red, 0.55F, 1}, {orange, 1, 1}};
inline constexpr Stop bands[] = {{green, 0, 1}, {green, 0.5F, 1}, {white, 0.5F, 1}, {navy, 1, 1}};
inline constexpr Stop fading[] = {{red, 0, 1}, {red, 0.4F, 0.8F}, {red, 1, 0}};
inline constexpr Stop toBlack[] = {{white, 0, 1}, {0x000000, 1, 1}};
inline constexpr Stop toNothing[] = {{white, 0.3F, 1}, {white, 1, 0}};

struct Gradient {
    std::array<float, 5> geometry; ///< of a linear one x1, y1, x2, y2; else cx, cy, r, fx, fy
    bool isRadial;
    DrawmereNS::UNITSTYPE units;
    DrawmereNS::GRADSPERADMOD spread;
    Matrix matrix;
    std::span<const Stop> stops;
};

struct GradientScene {
    const char16_t* caption;
    Gradient gradient;
    Area shape;        ///< a rectangle
    float strokeWidth; ///< 0 for a filled one
    bool isCheckered;  ///< whether squares behind it show where it can be seen through
};

// clang-format off
inline constexpr GradientScene linearScenes[] = {
    {u"pad", {{30, 0, 66, 0}, false, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADPAD, unit, dawn},
     wholeCell, 0, false},
    {u"reflect", {{36, 36, 60, 60}, false, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADREFLECT, unit, dawn},
     wholeCell, 0, false},
    {u"repeat", {{24, 0, 40, 8}, false, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADREPEAT, unit, bands},
     wholeCell, 0, false},
    {u"bounding box", {{0, 0, 1, 1}, false, DrawmereNS::OBJECTBOUNDINGBOX, DrawmereNS::GRADPAD, unit, dawn},
     {0, 24, 96, 48}, 0, false},
    {u"matrix", {{0, 0, 24, 0}, false, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADREFLECT,
      {0.8660254F, 0.5F, -0.5F, 0.8660254F, 10, 4}, dawn}, wholeCell, 0, false},
    {u"box, matrix, repeat", {{0, 0, 0.25F, 0}, false, DrawmereNS::OBJECTBOUNDINGBOX, DrawmereNS::GRADREPEAT,
      {1, 0, 0.5F, 1, 0, 0}, bands}, {0, 12, 96, 72}, 0, false},
    {u"on a stroke", {{12, 0, 84, 0}, false, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADPAD, unit, dawn},
     {12, 12, 72, 72}, 20, false},
};

inline constexpr GradientScene radialScenes[] = {
    {u"pad", {{48, 48, 40, 48, 48}, true, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADPAD, unit, dawn},
     wholeCell, 0, false},
    {u"reflect", {{48, 48, 16, 48, 48}, true, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADREFLECT, unit, dawn},
     wholeCell, 0, false},
    {u"repeat", {{48, 48, 16, 48, 48}, true, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADREPEAT, unit, bands},
     wholeCell, 0, false},
    {u"bounding box", {{0.5F, 0.5F, 0.5F, 0.5F, 0.5F}, true, DrawmereNS::OBJECTBOUNDINGBOX, DrawmereNS::GRADPAD,
      unit, dawn}, {0, 24, 96, 48}, 0, false},
    {u"matrix, focus", {{48, 48, 40, 30, 36}, true, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADPAD,
      {1, 0, 0.25F, 0.75F, -12, 12}, dawn}, wholeCell, 0, false},
    {u"box, matrix, reflect", {{0.5F, 0.5F, 0.2F, 0.5F, 0.5F}, true, DrawmereNS::OBJECTBOUNDINGBOX,
      DrawmereNS::GRADREFLECT, {1, 0, 0, 0.5F, 0, 0.25F}, bands}, {0, 12, 96, 72}, 0, false},
    {u"seen through", {{48, 48, 48, 48, 48}, true, DrawmereNS::USERSPACEONUSE, DrawmereNS::GRADPAD, unit, fading},
     wholeCell, 0, true},
};
// clang-format on

/// A tile holds a square and a dot, in coordinates from 0 to `tileContent`.
inline constexpr float tileContent = 20;

struct PatternScene {
    const char16_t* caption;
    Area tile;
    DrawmereNS::UNITSTYPE units;
    Matrix matrix;
    bool hasGradient; ///< whether the square is filled with a gradient over the tile
};

inline constexpr PatternScene patternScenes[] = {
    {u"tiles", {0, 0, 16, 16}, DrawmereNS::USERSPACEONUSE, unit, false},
    {u"tiles of the box", {0, 0, 0.25F, 0.25F}, DrawmereNS::OBJECTBOUNDINGBOX, unit, false},
    {u"tiles, matrix",
     {0, 0, 16, 16},
     DrawmereNS::USERSPACEONUSE,
     {0.8F, 0.6F, -0.6F, 0.8F, 5, 0},
     false},
    {u"gradient in a tile", {8, 8, 24, 24}, DrawmereNS::USERSPACEONUSE, unit, true},
};

inline constexpr int patternCount = 4;

// Masks lie over a square with a dot. Each holds a gradient.

inline constexpr Gradient maskFade = {{0, 0, 96, 0},       false, DrawmereNS::USERSPACEONUSE,
                                      DrawmereNS::GRADPAD, unit,  toBlack};
inline constexpr Gradient maskSpot = {{0.5F, 0.5F, 0.5F, 0.5F, 0.5F},
                                      true,
                                      DrawmereNS::OBJECTBOUNDINGBOX,
                                      DrawmereNS::GRADPAD,
                                      unit,
                                      toNothing};

inline constexpr char16_t maskText[] = u"Mask";
inline constexpr float maskTextSize = 38;
inline constexpr float maskTextX = 1;
inline constexpr float maskTextBaseline = 62;

// Clips cut a field of stripes.

inline constexpr float stripeWidth = 8;
inline constexpr unsigned int stripeColors[] = {navy, green, orange, red};

/// Texts of a clip path, which has no font size: it is up to the viewer, 12 or 16 for most.
inline constexpr const char16_t* clipLines[] = {u"each line", u"of these", u"is a text",
                                                u"that clips"};
inline constexpr float clipLineStep = 22;
inline constexpr float clipTextX = 4;

/// The corners of a star, x and y in turn.
inline constexpr float star[] = {48, 2,  59, 34, 94, 34, 66, 55, 76, 90,
                                 48, 69, 20, 90, 30, 55, 2,  34, 37, 34};

inline constexpr Area clipRect = {10, 22, 76, 52};
inline constexpr float clipRectRadius = 14;
inline constexpr Area innerClipRect = {0, 30, 96, 36};
inline constexpr float clipCenter = 48;
inline constexpr float clipRadius = 44;
inline constexpr Matrix clipTurn = {0.70710677F, 0.70710677F, -0.70710677F,
                                    0.70710677F, 48,          -19.9F};

/// Drawn with a state of its own before a clip begins, and not clipped.
inline constexpr Area groupBefore = {0, 0, 40, 40};

inline constexpr const char16_t* maskCaptions[] = {u"mask, linear", u"mask of the box",
                                                   u"mask, text"};
inline constexpr const char16_t* clipCaptions[] = {
    u"clip",           u"clip, rectangle",    u"clip in a clip",
    u"clip with text", u"clip after a group", u"clip in a matrix",
    u"clip of the box"};
