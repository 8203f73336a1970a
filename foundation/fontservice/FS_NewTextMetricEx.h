/// The measures of a face that concern its lines of text.
#pragma once

namespace MoxFontService_NS {

/// What a face says about its lines.
/// Units: those of the em that was asked for; y upwards, so a descender is negative.
struct FS_NewTextMetricEx {
    int unitsPerEm = 0; ///< the em of all other members
    int ascender = 0;
    int descender = 0;
    int lineGap = 0;
    int capHeight = 0; ///< 0 when the face doesn't say
    int xHeight = 0;   ///< 0 when the face doesn't say
    int underlinePosition = 0;
    int underlineThickness = 0;
    int averageCharWidth = 0; ///< 0 when the face doesn't say
    int maxCharWidth = 0;
    int weight = 400; ///< as CSS counts it
    bool italic = false;
    bool fixedPitch = false;
};

} // namespace MoxFontService_NS
