#include "SVGMatrix.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <limits>
#include <string>

using namespace DrawmereNS;

namespace {

constexpr float infinity = std::numeric_limits<float>::infinity();
constexpr float nan = std::numeric_limits<float>::quiet_NaN();

using Six = std::array<float, 6>;

SVGMatrix make(const Six& n) { return {n[0], n[1], n[2], n[3], n[4], n[5]}; }

Six numbersOf(const SVGMatrix& m) { return {m.a, m.b, m.c, m.d, m.e, m.f}; }

/// A matrix without anything special about it.
SVGMatrix general() { return {2, 3, 5, 7, 11, 13}; }

struct KindRow {
    const char* what;
    Six numbers;
    int type;
};

class SVGMatrixKind : public testing::TestWithParam<KindRow> {};

TEST_P(SVGMatrixKind, FollowsFromTheNumbers) {
    EXPECT_EQ(make(GetParam().numbers).type, GetParam().type) << GetParam().what;
}

const KindRow kindRows[] = {
    {"identity", {1, 0, 0, 1, 0, 0}, 5},
    {"identity with minus zeros", {1, -0.0F, -0.0F, 1, -0.0F, -0.0F}, 5},
    {"translation along x", {1, 0, 0, 1, 3, 0}, 2},
    {"translation along y", {1, 0, 0, 1, 0, 4}, 2},
    {"translation by NaN", {1, 0, 0, 1, nan, 0}, 2},
    {"translation without end", {1, 0, 0, 1, infinity, 0}, 2},
    {"scale", {2, 0, 0, 2, 0, 0}, 3},
    {"scale by minus one is no rotation by 180", {-1, 0, 0, -1, 0, 0}, 3},
    {"scale by nothing", {0, 0, 0, 0, 0, 0}, 3},
    {"scale with two factors", {1, 0, 0, 2, 0, 0}, 4},
    {"scale by NaN", {nan, 0, 0, nan, 0, 0}, 4},
    {"scale with a shift", {2, 0, 0, 2, 5, 0}, 0},
    {"a above 1", {1.5F, 1, -1, 0, 0, 0}, 0},
    {"a below -1", {-1.5F, 1, -1, 0, 0, 0}, 0},
    {"a is NaN", {nan, 1, -1, 0, 0, 0}, 0},
    {"quarter turn", {0, 1, -1, 0, 0, 0}, 5},
    {"quarter turn back", {0, -1, 1, 0, 0, 0}, 5},
    {"turn with a shift", {0, 1, -1, 0, 0, 1}, 0},
    {"first column a little short", {0.98F, 0.1F, -0.1F, 0.98F, 0, 0}, 5},
    {"first column just above the least length", {0, 0.9747F, -0.9747F, 0, 0, 0}, 5},
    {"first column just below it", {0, 0.9746F, -0.9746F, 0, 0, 0}, 0},
    {"first column too short", {0.9F, 0.1F, -0.1F, 0.9F, 0, 0}, 0},
    {"first column a little long", {0.6F, 0.80001F, -0.80001F, 0.6F, 0, 0}, 0},
    {"d plays no part", {0.98F, 0.1F, -0.1F, 0.5F, 0, 0}, 5},
    {"d at the end of its range", {0.98F, 0.1F, -0.1F, -1, 0, 0}, 5},
    {"d beyond its range", {0.98F, 0.1F, -0.1F, 1.5F, 0, 0}, 0},
    {"d is NaN", {0.98F, 0.1F, -0.1F, nan, 0, 0}, 0},
    {"b and c not opposite", {0.98F, 0.1F, -0.11F, 0.98F, 0, 0}, 0},
    {"b and c opposite but for the last bit", {0.98F, 0.1F, -0.10000001F, 0.98F, 0, 0}, 0},
    {"b beyond its range", {0, 1.5F, -1.5F, 0, 0, 0}, 0},
    {"a is 1 and b is tiny", {1, 1e-5F, -1e-5F, 1, 0, 0}, 5},
    {"skew along x", {1, 0, 1, 1, 0, 0}, 7},
    {"skew along x by NaN", {1, 0, nan, 1, 0, 0}, 7},
    {"skew along x with a shift", {1, 0, 1, 1, 2, 0}, 0},
    {"skew along x with another d", {1, 0, 1, 2, 0, 0}, 0},
    {"skew along y", {1, 1, 0, 1, 0, 0}, 8},
    {"skew along y with a shift", {1, 1, 0, 1, 0, 2}, 0},
    {"skew along both", {1, 1, 1, 1, 0, 0}, 0},
    {"a is 1, b and c are 0, d and the shift are not", {1, 0, 0, 2, 5, 0}, 0},
    {"everything", {2, 3, 5, 7, 11, 13}, 0},
};

INSTANTIATE_TEST_SUITE_P(All, SVGMatrixKind, testing::ValuesIn(kindRows));

TEST(SVGMatrix, IsTheIdentityAndClassifiedFromTheStart) {
    const SVGMatrix m;
    EXPECT_EQ(numbersOf(m), (Six{1, 0, 0, 1, 0, 0}));
    EXPECT_EQ(m.type, 5);
}

TEST(SVGMatrix, MultiplyPutsThisOnTheLeft) {
    EXPECT_EQ(numbersOf(general().multiply({1, 2, 3, 4, 5, 6})), (Six{12, 17, 26, 37, 51, 70}));
}

TEST(SVGMatrix, MatrixIsTheProductWithItsArguments) {
    EXPECT_EQ(numbersOf(general().matrix(1, 2, 3, 4, 5, 6)), (Six{12, 17, 26, 37, 51, 70}));
}

TEST(SVGMatrix, ProductsAreRoundedAtEachStep) {
    SVGMatrix m(19, 7.6F, 14.4F, 13.6F, 2.8F, 15.8F);
    // Sums in double precision would give 454.48001 and 358.38 for the first and the fifth.
    EXPECT_EQ(numbersOf(m.matrix(19.6F, 5.7F, 7.2F, 11.2F, 12.5F, 8.2F)),
              (Six{454.47998F, 226.48001F, 298.08002F, 207.04001F, 358.37997F, 222.32001F}));
}

TEST(SVGMatrix, MultiplyByItselfSquares) {
    SVGMatrix m(1, 2, 3, 4, 5, 6);
    EXPECT_EQ(numbersOf(m.multiply(m)), (Six{7, 10, 15, 22, 28, 40}));
}

TEST(SVGMatrix, TranslateShiftsInItsOwnCoordinates) {
    EXPECT_EQ(numbersOf(general().translate(10, 100)), (Six{2, 3, 5, 7, 531, 743}));
}

TEST(SVGMatrix, ScaleMultipliesBothColumns) {
    EXPECT_EQ(numbersOf(general().scale(2)), (Six{4, 6, 10, 14, 11, 13}));
}

TEST(SVGMatrix, ScaleNonUniformMultipliesEachColumn) {
    EXPECT_EQ(numbersOf(general().scaleNonUniform(2, 3)), (Six{4, 6, 15, 21, 11, 13}));
}

TEST(SVGMatrix, RotateRoundsItsDoublesOnce) {
    const double t = 3.14159265 * 30.0 / 180.0;
    const SVGMatrix m = general().rotate(30);
    EXPECT_EQ(m.a, static_cast<float>(2 * std::cos(t) + 5 * std::sin(t)));
    EXPECT_EQ(m.b, static_cast<float>(3 * std::cos(t) + 7 * std::sin(t)));
    EXPECT_EQ(m.c, static_cast<float>(2 * -std::sin(t) + 5 * std::cos(t)));
    EXPECT_EQ(m.d, static_cast<float>(3 * -std::sin(t) + 7 * std::cos(t)));
    EXPECT_EQ(m.e, 11);
    EXPECT_EQ(m.f, 13);
}

TEST(SVGMatrix, RotateKnowsNineDigitsOfPi) {
    // The exact pi would give about 1e-16.
    EXPECT_NEAR(SVGMatrix().rotate(180).b, 3.58979e-9F, 1e-13F);
}

TEST(SVGMatrix, AnglesAreNotRoundedBeforeTheSums) {
    // At these angles each number changes when sine, cosine or slope is rounded to a float first.
    const double t = 3.14159265 * static_cast<double>(5.8F) / 180.0;
    const SVGMatrix turned = general().rotate(5.8F);
    EXPECT_EQ(turned.a, static_cast<float>(2 * std::cos(t) + 5 * std::sin(t)));
    EXPECT_EQ(turned.b, static_cast<float>(3 * std::cos(t) + 7 * std::sin(t)));
    EXPECT_EQ(turned.c, static_cast<float>(2 * -std::sin(t) + 5 * std::cos(t)));
    EXPECT_EQ(turned.d, static_cast<float>(3 * -std::sin(t) + 7 * std::cos(t)));
    const double alongX = std::tan(3.14159265 * static_cast<double>(47.8F) / 180.0);
    EXPECT_EQ(general().skewX(47.8F).c, static_cast<float>(2 * alongX + 5));
    EXPECT_EQ(general().skewX(47.8F).d, static_cast<float>(3 * alongX + 7));
    const double alongY = std::tan(3.14159265 * static_cast<double>(14.3F) / 180.0);
    EXPECT_EQ(general().skewY(14.3F).a, static_cast<float>(2 + 5 * alongY));
    EXPECT_EQ(general().skewY(14.3F).b, static_cast<float>(3 + 7 * alongY));
}

TEST(SVGMatrix, SkewXChangesTheSecondColumn) {
    const double slope = std::tan(3.14159265 * 30.0 / 180.0);
    const SVGMatrix m = general().skewX(30);
    EXPECT_EQ(numbersOf(m), (Six{2, 3, static_cast<float>(2 * slope + 5),
                                 static_cast<float>(3 * slope + 7), 11, 13}));
}

TEST(SVGMatrix, SkewYChangesTheFirstColumn) {
    const double slope = std::tan(3.14159265 * 30.0 / 180.0);
    const SVGMatrix m = general().skewY(30);
    EXPECT_EQ(numbersOf(m), (Six{static_cast<float>(2 + 5 * slope),
                                 static_cast<float>(3 + 7 * slope), 5, 7, 11, 13}));
}

TEST(SVGMatrix, ProductsClassifyThisAndNotTheirResult) {
    SVGMatrix m = general();
    m.type = MATRIXTYPE_UNKNOWN;
    SVGMatrix result = m.scale(2);
    EXPECT_EQ(m.type, MATRIXTYPE_GENERAL);
    EXPECT_EQ(result.type, MATRIXTYPE_ROTATE);
    result.setType();
    EXPECT_EQ(result.type, MATRIXTYPE_GENERAL);
}

TEST(SVGMatrix, EveryProductSaysRotationWhateverItHolds) {
    EXPECT_EQ(general().rotate(45).type, 5);
    EXPECT_EQ(general().translate(1, 1).type, 5);
    EXPECT_EQ(general().scaleNonUniform(2, 3).type, 5);
    EXPECT_EQ(general().matrix(1, 2, 3, 4, 5, 6).type, 5);
    EXPECT_EQ(general().skewX(10).type, 5);
    EXPECT_EQ(general().skewY(10).type, 5);
    EXPECT_EQ(general().multiply(general()).type, 5);
    EXPECT_EQ(general().inverse().type, 5);
    EXPECT_EQ(general().rotateFromVector(1, 1).type, 5);
}

TEST(SVGMatrix, AnInfiniteShiftMakesTheProductUndefined) {
    const SVGMatrix m = SVGMatrix(1, 0, 0, 1, infinity, 0).scale(2);
    EXPECT_TRUE(std::isnan(m.a));
    EXPECT_EQ(m.b, 0);
    EXPECT_TRUE(std::isnan(m.c));
    EXPECT_EQ(m.d, 2);
    EXPECT_EQ(m.e, infinity);
    EXPECT_EQ(m.f, 0);
}

TEST(SVGMatrix, AnInfiniteShiftSpoilsARotationToo) {
    const SVGMatrix m = SVGMatrix(1, 0, 0, 1, 0, infinity).rotate(90);
    EXPECT_TRUE(std::isnan(m.b));
    EXPECT_TRUE(std::isnan(m.d));
    EXPECT_FALSE(std::isnan(m.a));
}

TEST(SVGMatrix, ANaNAngleGivesNaNs) {
    EXPECT_TRUE(std::isnan(SVGMatrix().rotate(nan).a));
    EXPECT_TRUE(std::isnan(SVGMatrix().skewX(infinity).c));
}

TEST(SVGMatrix, RotateFromVectorRotatesByTheAngleOfTheVector) {
    const SVGMatrix m = SVGMatrix().rotateFromVector(3, 4);
    EXPECT_NEAR(m.a, 0.6F, 1e-6F);
    EXPECT_NEAR(m.b, 0.8F, 1e-6F);
    const auto degrees =
        static_cast<float>(57.29577957855229 * std::atan(static_cast<double>(4.0F / 3.0F)));
    EXPECT_EQ(numbersOf(m), numbersOf(SVGMatrix().rotate(degrees)));
}

TEST(SVGMatrix, RotateFromVectorRoundsTheQuotientAndTheDegrees) {
    // The quotient, the arc or the degrees of one radian in another precision each turn by
    // 39.610687.
    EXPECT_EQ(numbersOf(SVGMatrix().rotateFromVector(29, 24)),
              numbersOf(SVGMatrix().rotate(39.610691F)));
    EXPECT_NE(numbersOf(SVGMatrix().rotateFromVector(29, 24)),
              numbersOf(SVGMatrix().rotate(39.610687F)));
}

TEST(SVGMatrix, RotateFromVectorTakesAVectorAndItsOppositeForTheSame) {
    EXPECT_EQ(numbersOf(general().rotateFromVector(-1, -1)),
              numbersOf(general().rotateFromVector(1, 1)));
}

TEST(SVGMatrix, RotateFromVectorAlongAnAxisIsTheIdentityAndNotThis) {
    SVGMatrix m = general();
    m.type = MATRIXTYPE_UNKNOWN;
    EXPECT_EQ(numbersOf(m.rotateFromVector(1, 0)), (Six{1, 0, 0, 1, 0, 0}));
    EXPECT_EQ(numbersOf(m.rotateFromVector(0, 1)), (Six{1, 0, 0, 1, 0, 0}));
    EXPECT_EQ(m.type, MATRIXTYPE_UNKNOWN); // not classified either
}

TEST(SVGMatrix, InverseUndoesTheMatrix) {
    SVGMatrix m(2, 0, 0, 4, 6, 8);
    EXPECT_EQ(numbersOf(m.inverse()), (Six{0.5F, 0, 0, 0.25F, -3, -2}));
    SVGMatrix turned(1, 2, 3, 4, 5, 6);
    EXPECT_EQ(numbersOf(turned.inverse()), (Six{-2, 1, 1.5F, -0.5F, 1, -2}));
}

TEST(SVGMatrix, InverseIsRoundedAtEachStep) {
    SVGMatrix m(5.5F, 17.4F, 18, 11.2F, 15.8F, 3.5F);
    EXPECT_EQ(numbersOf(m.inverse()), (Six{-0.0445151068F, 0.0691573992F, 0.0715421364F,
                                           -0.0218600966F, 0.452941239F, -1.01617646F}));
}

TEST(SVGMatrix, AMatrixIsSingularWhenItsRoundedProductsAgree) {
    EXPECT_EQ(numbersOf(SVGMatrix(4, 8.8F, 5, 11, 1, 2).inverse()), (Six{1, 0, 0, 1, 0, 0}));
    const float huge = std::numeric_limits<float>::max();
    EXPECT_EQ(numbersOf(SVGMatrix(huge, huge, 2, 2, 1, 2).inverse()), (Six{1, 0, 0, 1, 0, 0}));
}

TEST(SVGMatrix, InverseOfASingularMatrixIsTheIdentity) {
    SVGMatrix m(2, 4, 1, 2, 5, 6);
    m.type = MATRIXTYPE_UNKNOWN;
    EXPECT_EQ(numbersOf(m.inverse()), (Six{1, 0, 0, 1, 0, 0}));
    EXPECT_EQ(m.type, MATRIXTYPE_GENERAL);
}

TEST(SVGMatrix, InverseOfNaNsIsNaNs) {
    EXPECT_TRUE(std::isnan(SVGMatrix(nan, 0, 0, 1, 0, 0).inverse().a));
}

} // namespace
