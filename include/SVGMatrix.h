/// The affine matrix of the drawing interface.
#pragma once

#include "DrawmereExport.h"

#include <cstdint>

namespace DrawmereNS {

/// What a matrix does, which decides how it is written. The numbers 1 and 6 are not in use.
enum MATRIXTYPE : std::int32_t {
    MATRIXTYPE_UNKNOWN = -1, ///< not classified
    MATRIXTYPE_GENERAL = 0,
    MATRIXTYPE_TRANSLATE = 2,
    MATRIXTYPE_SCALE = 3,           ///< both factors are equal
    MATRIXTYPE_SCALENONUNIFORM = 4, ///< the factors differ
    MATRIXTYPE_ROTATE = 5,          ///< a rotation about the origin, or the identity
    MATRIXTYPE_SKEWX = 7,
    MATRIXTYPE_SKEWY = 8,
};

/// Six numbers as SVG 1.1 orders them: x' = a x + c y + e and y' = b x + d y + f. Passed by value.
///
/// The operations return a new matrix with `this` as the left factor, so what they add applies
/// first. On purpose, they classify `this` and not their result, which says "rotation" whatever it
/// holds: call `setType` on a result before reading its `type`.
class DRAWMERE_API SVGMatrix {
public:
    /// The identity, classified.
    SVGMatrix() = default;

    /// The matrix of these numbers, classified.
    SVGMatrix(float newA, float newB, float newC, float newD, float newE, float newF);

    /// A copy.
    SVGMatrix(const SVGMatrix&) = default;
    /// Copies everything.
    SVGMatrix& operator=(const SVGMatrix&) = default;
    virtual ~SVGMatrix() = default;

    /// Returns: `this` times the matrix of these numbers.
    SVGMatrix matrix(float rightA, float rightB, float rightC, float rightD, float rightE,
                     float rightF);
    /// Returns: `this` after a shift by `x` and `y`.
    SVGMatrix translate(float x, float y);
    /// Returns: `this` after a scaling by `factor`.
    SVGMatrix scale(float factor);
    /// Returns: `this` after a scaling by `x` and `y`.
    SVGMatrix scaleNonUniform(float x, float y);

    /// Units: degrees, clockwise where y points down.
    SVGMatrix rotate(float degrees);

    /// Rotates by the angle whose tangent is `y` / `x`, so a vector and its opposite rotate alike.
    /// Returns: the identity, not `this`, when either number is 0.
    SVGMatrix rotateFromVector(float x, float y);

    /// Units: degrees.
    SVGMatrix skewX(float degrees);
    /// Units: degrees.
    SVGMatrix skewY(float degrees);

    /// Returns: `this` times `right`.
    SVGMatrix multiply(const SVGMatrix& right);

    /// Returns: the inverse; the identity for a matrix that has none.
    SVGMatrix inverse();

    /// Classifies the matrix by its numbers, exactly as they are.
    void setType();

    float a = 1.0F;               ///< x from x
    float b = 0.0F;               ///< y from x
    float c = 0.0F;               ///< x from y
    float d = 1.0F;               ///< y from y
    float e = 0.0F;               ///< x of the shift
    float f = 0.0F;               ///< y of the shift
    int type = MATRIXTYPE_ROTATE; ///< a `MATRIXTYPE`, as `setType` found it last
};

} // namespace DrawmereNS
