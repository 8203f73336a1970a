#include "tools/convert/OutlineFitter.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <numbers>

namespace DrawmereTest {
namespace {

using namespace DrawmereConvert; // NOLINT(google-build-using-namespace)

using Steps = std::vector<PATHSTEP>;

constexpr float tolerance = 0.001F;

LooseOutline fit(const LooseOutline& outline, float error = tolerance) {
    LooseOutline fitted;
    fitOutline({outline.steps.data(), outline.steps.size(), outline.points.data()}, error, fitted);
    return fitted;
}

void curveTo(LooseOutline& outline, fz_point control1, fz_point control2, fz_point end) {
    outline.steps.push_back(PATHSTEP_CURVE);
    outline.points.insert(outline.points.end(), {control1, control2, end});
}

fz_point onCircle(float turn, float radius = 0.3F) {
    const float angle = turn * 2 * std::numbers::pi_v<float>;
    return {0.5F + radius * std::cos(angle), 0.5F + radius * std::sin(angle)};
}

/// A circle of so many curves.
LooseOutline makeCircle(int count) {
    LooseOutline circle{{PATHSTEP_MOVE}, {onCircle(0)}};
    const float part = 1 / static_cast<float>(count);
    const float angle = part * 2 * std::numbers::pi_v<float>;
    const float handle = 4.0F / 3 * std::tan(angle / 4);
    const auto tangent = [&](float turn, float length) {
        const fz_point at = onCircle(turn);
        return fz_point{at.x - length * (at.y - 0.5F), at.y + length * (at.x - 0.5F)};
    };
    for (int i = 0; i < count; ++i) {
        const float from = static_cast<float>(i) * part;
        const float to = from + part;
        curveTo(circle, tangent(from, handle), tangent(to, -handle), onCircle(to));
    }
    circle.steps.push_back(PATHSTEP_CLOSE);
    return circle;
}

/// Returns: the largest distance from the circle of points along the curves.
float measureCircle(const LooseOutline& outline) {
    float largest = 0;
    fz_point last = outline.points[0];
    std::size_t next = 1;
    for (const PATHSTEP step : outline.steps) {
        const bool isCubic = step == PATHSTEP_CURVE;
        if (!isCubic && step != PATHSTEP_QUADRATIC) {
            continue;
        }
        const fz_point* p = &outline.points[next];
        const fz_point end = p[isCubic ? 2 : 1];
        for (float t = 0; t <= 1; t += 0.05F) {
            const float u = 1 - t;
            const auto at = [&](float a, float b, float c, float d) {
                return isCubic
                           ? u * u * u * a + 3 * u * u * t * b + 3 * u * t * t * c + t * t * t * d
                           : u * u * a + 2 * u * t * b + t * t * d;
            };
            const float x = at(last.x, p[0].x, p[1].x, end.x) - 0.5F;
            const float y = at(last.y, p[0].y, p[1].y, end.y) - 0.5F;
            largest = std::max(largest, std::abs(std::sqrt(x * x + y * y) - 0.3F));
        }
        last = end;
        next += isCubic ? 3 : 2;
    }
    return largest;
}

TEST(OutlineFitter, FewerCurvesStayWithinTheTolerance) {
    for (const float error : {0.0003F, 0.001F, 0.004F}) {
        const LooseOutline fitted = fit(makeCircle(16), error);
        EXPECT_LT(fitted.steps.size(), 10) << error;
        EXPECT_LE(measureCircle(fitted), 1.05F * error) << error;
    }
    EXPECT_LT(fit(makeCircle(16), 0.004F).points.size(),
              fit(makeCircle(16), 0.0003F).points.size());
}

TEST(OutlineFitter, ACurveCutInTwoIsWholeAgain) {
    LooseOutline halves{{PATHSTEP_MOVE}, {{0, 0}}};
    curveTo(halves, {0, 0.2F}, {0.15F, 0.35F}, {0.35F, 0.425F});
    curveTo(halves, {0.55F, 0.5F}, {0.8F, 0.5F}, {1, 0.4F});
    const LooseOutline fitted = fit(halves);
    EXPECT_EQ(fitted.steps, (Steps{PATHSTEP_MOVE, PATHSTEP_CURVE}));
    EXPECT_FLOAT_EQ(fitted.points.back().x, 1);
    EXPECT_NEAR(fitted.points[1].y, 0.4F, 0.02F);
}

TEST(OutlineFitter, ACornerStays) {
    LooseOutline corner{{PATHSTEP_MOVE}, {{0, 0}}};
    curveTo(corner, {0, 0.2F}, {0.1F, 0.4F}, {0.3F, 0.5F});
    curveTo(corner, {0.3F, 0.7F}, {0.4F, 0.8F}, {0.6F, 0.9F});
    EXPECT_EQ(fit(corner).steps.size(), 3);
}

TEST(OutlineFitter, WhatIsAsGoodAsStraightIsALine) {
    LooseOutline flat{{PATHSTEP_MOVE}, {{0, 0}}};
    curveTo(flat, {0.2F, 0.001F}, {0.4F, 0.001F}, {0.6F, 0});
    EXPECT_EQ(fit(flat).steps, (Steps{PATHSTEP_MOVE, PATHSTEP_LINE}));
    EXPECT_NE(fit(flat, 0.0001F).steps.back(), PATHSTEP_LINE);
}

TEST(OutlineFitter, ACurveThatTurnsBackIsNoLine) {
    LooseOutline spike{{PATHSTEP_MOVE}, {{0, 0}}};
    curveTo(spike, {0.8F, 0}, {0.8F, 0}, {0.2F, 0});
    EXPECT_EQ(fit(spike).steps.back(), PATHSTEP_CURVE);
}

TEST(OutlineFitter, ACurveThatNothingReplacesStaysAsItIs) {
    LooseOutline blunt{{PATHSTEP_MOVE}, {{0, 0}}};
    curveTo(blunt, {0, 0}, {0.9F, 0.9F}, {0.9F, 0.2F}); // without a handle at one end
    const LooseOutline fitted = fit(blunt, 0.00001F);
    ASSERT_EQ(fitted.steps, blunt.steps);
    for (std::size_t i = 0; i < fitted.points.size(); ++i) {
        EXPECT_NEAR(fitted.points[i].x, blunt.points[i].x, 0.0001F) << i;
        EXPECT_NEAR(fitted.points[i].y, blunt.points[i].y, 0.0001F) << i;
    }
}

TEST(OutlineFitter, AQuadraticCurveIsFoundAgain) {
    LooseOutline raised{{PATHSTEP_MOVE}, {{0, 0}}};
    curveTo(raised, {0.2F, 0.4F}, {0.4F, 0.4F}, {0.6F, 0}); // of (0.3, 0.6)
    const LooseOutline fitted = fit(raised);
    ASSERT_EQ(fitted.steps, (Steps{PATHSTEP_MOVE, PATHSTEP_QUADRATIC}));
    EXPECT_NEAR(fitted.points[1].x, 0.3F, 1e-5F);
    EXPECT_NEAR(fitted.points[1].y, 0.6F, 1e-5F);
}

TEST(OutlineFitter, ALineBackToTheBeginningIsLeftOut) {
    const LooseOutline square{
        {PATHSTEP_MOVE, PATHSTEP_LINE, PATHSTEP_LINE, PATHSTEP_LINE, PATHSTEP_LINE, PATHSTEP_CLOSE},
        {{0, 0}, {1, 0}, {1, 1}, {0, 1}, {0, 0}}};
    EXPECT_EQ(fit(square).steps,
              (Steps{PATHSTEP_MOVE, PATHSTEP_LINE, PATHSTEP_LINE, PATHSTEP_LINE}));
}

TEST(OutlineFitter, BrokenNumbersGoThrough) {
    constexpr float undefined = std::numeric_limits<float>::quiet_NaN();
    constexpr float infinite = std::numeric_limits<float>::infinity();
    for (const float broken : {undefined, infinite, -infinite, 3e38F}) {
        LooseOutline outline{{PATHSTEP_MOVE}, {{0, 0}}};
        curveTo(outline, {broken, 0}, {0, broken}, {1, 1});
        curveTo(outline, {2, 1}, {3, 1}, {broken, broken});
        EXPECT_EQ(fit(outline).steps.size(), 3) << broken;
    }
}

TEST(OutlineFitter, APointIsNoCurve) {
    LooseOutline point{{PATHSTEP_MOVE}, {{0.5F, 0.5F}}};
    curveTo(point, {0.5F, 0.5F}, {0.5F, 0.5F}, {0.5F, 0.5F});
    EXPECT_EQ(fit(point).steps, (Steps{PATHSTEP_MOVE, PATHSTEP_LINE}));
    EXPECT_TRUE(fit(LooseOutline()).steps.empty());
}

} // namespace
} // namespace DrawmereTest
