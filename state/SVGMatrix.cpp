#include "SVGMatrix.h"

#include <cmath>

namespace DrawmereNS {
namespace {

// On purpose: nine digits of pi, and below the degrees of one radian to sixteen that are not all
// right. More exact constants would change last digits of what is written.
constexpr double piForAngles = 3.14159265;
constexpr double degreesPerRadian = 57.29577957855229;

constexpr double leastRotationLength = 0.95;

double radians(float degrees) { return piForAngles * static_cast<double>(degrees) / 180.0; }

/// One of the four linear numbers of a product: a row of the left matrix times a column of the
/// right one. `Number` is the precision of the sum, which is rounded once, at the end. The term
/// with 0 is part of the sum: an infinite or undefined shift makes the result undefined.
template <typename Number>
float linear(float first, float second, float shift, Number x, Number y) {
    const Number sum = static_cast<Number>(first) * x + static_cast<Number>(second) * y +
                       static_cast<Number>(shift) * static_cast<Number>(0);
    return static_cast<float>(sum);
}

/// One of the two shifts of a product.
float shifted(float first, float second, float shift, float x, float y) {
    return first * x + second * y + shift;
}

bool isWithinOne(float number) { return number >= -1.0F && number <= 1.0F; }

bool hasNoShift(const SVGMatrix& m) { return m.e == 0.0F && m.f == 0.0F; }

bool isLinearIdentity(const SVGMatrix& m) {
    return m.a == 1.0F && m.b == 0.0F && m.c == 0.0F && m.d == 1.0F;
}

bool isScale(const SVGMatrix& m) { return m.b == 0.0F && m.c == 0.0F && hasNoShift(m); }

// On purpose: the length of the first column may lie well below 1, the fourth number plays no part,
// and nothing is allowed above 1. A matrix near a rotation is thus written as one, and a true
// rotation whose squares add up to a little above 1 in six numbers.
bool isRotation(const SVGMatrix& m) {
    const float squares = m.a * m.a + m.b * m.b;
    return isWithinOne(m.b) && isWithinOne(m.c) && isWithinOne(m.d) &&
           static_cast<double>(squares) > leastRotationLength && squares <= 1.0F &&
           m.c + m.b == 0.0F && hasNoShift(m);
}

MATRIXTYPE classifySkew(const SVGMatrix& m) {
    if (m.a != 1.0F || m.d != 1.0F || !hasNoShift(m)) {
        return MATRIXTYPE_GENERAL;
    }
    if (m.b == 0.0F) {
        return m.c != 0.0F ? MATRIXTYPE_SKEWX : MATRIXTYPE_GENERAL;
    }
    return m.c == 0.0F ? MATRIXTYPE_SKEWY : MATRIXTYPE_GENERAL;
}

MATRIXTYPE classify(const SVGMatrix& m) {
    if (isLinearIdentity(m)) {
        return hasNoShift(m) ? MATRIXTYPE_ROTATE : MATRIXTYPE_TRANSLATE;
    }
    if (isScale(m)) {
        return m.a == m.d ? MATRIXTYPE_SCALE : MATRIXTYPE_SCALENONUNIFORM;
    }
    return isWithinOne(m.a) && isRotation(m) ? MATRIXTYPE_ROTATE : classifySkew(m);
}

} // namespace

SVGMatrix::SVGMatrix(float newA, float newB, float newC, float newD, float newE, float newF)
    : a(newA), b(newB), c(newC), d(newD), e(newE), f(newF) {
    setType();
}

SVGMatrix SVGMatrix::matrix(float rightA, float rightB, float rightC, float rightD, float rightE,
                            float rightF) {
    SVGMatrix result;
    result.a = linear(a, c, e, rightA, rightB);
    result.b = linear(b, d, f, rightA, rightB);
    result.c = linear(a, c, e, rightC, rightD);
    result.d = linear(b, d, f, rightC, rightD);
    result.e = shifted(a, c, e, rightE, rightF);
    result.f = shifted(b, d, f, rightE, rightF);
    setType();
    return result;
}

SVGMatrix SVGMatrix::translate(float x, float y) { return matrix(1.0F, 0.0F, 0.0F, 1.0F, x, y); }

SVGMatrix SVGMatrix::scale(float factor) { return scaleNonUniform(factor, factor); }

SVGMatrix SVGMatrix::scaleNonUniform(float x, float y) {
    return matrix(x, 0.0F, 0.0F, y, 0.0F, 0.0F);
}

SVGMatrix SVGMatrix::rotate(float degrees) {
    const double cosine = std::cos(radians(degrees));
    const double sine = std::sin(radians(degrees));
    SVGMatrix result = matrix(1.0F, 0.0F, 0.0F, 1.0F, 0.0F, 0.0F);
    result.a = linear(a, c, e, cosine, sine);
    result.b = linear(b, d, f, cosine, sine);
    result.c = linear(a, c, e, -sine, cosine);
    result.d = linear(b, d, f, -sine, cosine);
    return result;
}

SVGMatrix SVGMatrix::rotateFromVector(float x, float y) {
    if (x == 0.0F || y == 0.0F) {
        return {};
    }
    const float quotient = y / x;
    const double degrees = degreesPerRadian * std::atan(static_cast<double>(quotient));
    return rotate(static_cast<float>(degrees));
}

SVGMatrix SVGMatrix::skewX(float degrees) {
    const double slope = std::tan(radians(degrees));
    SVGMatrix result = matrix(1.0F, 0.0F, 0.0F, 1.0F, 0.0F, 0.0F);
    result.c = linear(a, c, e, slope, 1.0);
    result.d = linear(b, d, f, slope, 1.0);
    return result;
}

SVGMatrix SVGMatrix::skewY(float degrees) {
    const double slope = std::tan(radians(degrees));
    SVGMatrix result = matrix(1.0F, 0.0F, 0.0F, 1.0F, 0.0F, 0.0F);
    result.a = linear(a, c, e, 1.0, slope);
    result.b = linear(b, d, f, 1.0, slope);
    return result;
}

SVGMatrix SVGMatrix::multiply(const SVGMatrix& right) {
    return matrix(right.a, right.b, right.c, right.d, right.e, right.f);
}

SVGMatrix SVGMatrix::inverse() {
    SVGMatrix result;
    if (a * d != b * c) {
        const float determinant = a * d - b * c;
        result.a = d / determinant;
        result.b = -b / determinant;
        result.c = -c / determinant;
        result.d = a / determinant;
        result.e = (c * f - d * e) / determinant;
        result.f = (b * e - a * f) / determinant;
    }
    setType();
    return result;
}

void SVGMatrix::setType() { type = classify(*this); }

} // namespace DrawmereNS
