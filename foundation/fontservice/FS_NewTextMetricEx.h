/// The measures of a face that concern its lines of text.
#pragma once

namespace MoxFontService_NS {

/// What a face says about its lines.
/// Units: those of the em that was asked for; y upwards, so a descender is negative.
struct FS_NewTextMetricEx {
    int unitsPerEm = 0;         ///< the em of all other members
    int ascender = 0;           ///< of the highest letters
    int descender = 0;          ///< of the lowest letters, negative
    int lineGap = 0;            ///< what lines want between them
    int capHeight = 0;          ///< 0 when the face doesn't say
    int xHeight = 0;            ///< 0 when the face doesn't say
    int underlinePosition = 0;  ///< of its middle, negative below the baseline
    int underlineThickness = 0; ///< of the line
    int averageCharWidth = 0;   ///< 0 when the face doesn't say
    int maxCharWidth = 0;       ///< the widest advance
    int weight = 400;           ///< as CSS counts it
    bool italic = false;        ///< whether the face is slanted
    bool fixedPitch = false;    ///< whether all advances are the same
};

} // namespace MoxFontService_NS
