/// Weight, slant and width of faces, and the choice of the face nearest to what is wanted.
#pragma once

#include <span>

namespace MoxFontService_NS {

/// The style of one face, or the style that is wanted.
struct FS_FaceStyle {
    static constexpr int normalWeight = 400;
    static constexpr int normalWidth = 5;

    bool operator==(const FS_FaceStyle&) const = default;

    int weight = normalWeight; ///< 1 to 1000 as CSS counts
    bool italic = false;
    int widthClass = normalWidth; ///< 1 ultra-condensed to 9 ultra-expanded
};

/// The styles that one font can take: a single one, or all between two when it is variable.
struct FS_StyleRange {
    FS_FaceStyle least;
    FS_FaceStyle most;
};

/// Returns: the style as it was given, its numbers outside their ranges made normal.
FS_FaceStyle makeStyle(int weight, bool italic, int widthClass);

/// Returns: the width in percent of the normal one that `widthClass` stands for.
double widthPercentOf(int widthClass);

/// Returns: the width class nearest to `percent` of the normal width.
int widthClassOf(double percent);

/// Returns: the word for a width, as it stands in names of families; empty for the normal one.
const char16_t* widthWordOf(int widthClass);

/// Returns: the place in `fonts` of the one that CSS takes for `wanted`, the first among equals.
/// Shape: `fonts` is not empty.
int chooseFont(std::span<const FS_StyleRange> fonts, const FS_FaceStyle& wanted);

} // namespace MoxFontService_NS
