/// The axes of variable fonts, as far as styles are made of them.
#pragma once

#include "foundation/fontservice/FS_FaceStyle.h"

#include <ft2build.h>
#include FT_FREETYPE_H
#include FT_MULTIPLE_MASTERS_H

#include <vector>

namespace MoxFontService_NS {

/// The axes wght, wdth, ital and slnt of one face; the others stay where they are.
class FS_VariationAxes {
public:
    /// Borrows: `fontFace`, for its life.
    explicit FS_VariationAxes(FT_Face fontFace);
    FS_VariationAxes(const FS_VariationAxes&) = delete;
    FS_VariationAxes& operator=(const FS_VariationAxes&) = delete;
    ~FS_VariationAxes();

    /// Sets the face to `wanted`, or as near as its axes reach.
    /// Returns: false when the face refuses.
    bool apply(const FS_FaceStyle& wanted);

    /// Replaces in `style` what the axes say of the face as it is set now.
    void readStyle(FS_FaceStyle& style) const;

    /// Returns: the styles that can be set, those of no axis taken from `style`.
    FS_StyleRange readRange(const FS_FaceStyle& style) const;

    /// Returns: whether the face has axes.
    bool areThere() const { return axes != nullptr; }

private:
    const FT_Var_Axis* find(FT_ULong tag) const;
    void set(std::vector<FT_Fixed>& places, const FT_Var_Axis& axis, double value) const;
    void setItalic(std::vector<FT_Fixed>& places) const;
    std::vector<FT_Fixed> readPlaces() const;

    FT_Face face;              // borrowed
    FT_MM_Var* axes = nullptr; // owned; null for a font without axes
};

} // namespace MoxFontService_NS
