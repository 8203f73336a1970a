#include "foundation/common/MoxLength.h"

#include <cmath>
#include <gtest/gtest.h>
#include <limits>

namespace {

using namespace MoxCommonNS;

TEST(MoxLength, IsNoLengthByDefault) { EXPECT_EQ(MoxLength().getRawValue(), 0.0F); }

TEST(MoxLength, ConvertsEachUnitIntoPointsAndBack) {
    const struct {
        MoxUnitType unit;
        float number;
        float points;
    } rows[] = {
        {MOXUNIT_CM, 2.54F, 72.0F},          {MOXUNIT_MM, 25.4F, 72.0F},
        {MOXUNIT_MM, 0.001F, 0.0028346457F}, {MOXUNIT_INCH, 1.0F, 72.0F},
        {MOXUNIT_INCH, -0.5F, -36.0F},       {MOXUNIT_POINT, 0.1F, 0.1F},
        {MOXUNIT_PICA, 1.5F, 18.0F},
    };

    for (const auto& row : rows) {
        const MoxLength length(row.number, row.unit);
        EXPECT_FLOAT_EQ(length.getRawValue(), row.points) << row.unit;
        EXPECT_FLOAT_EQ(length.getRealValue(row.unit), row.number) << row.unit;
    }
}

TEST(MoxLength, RoundsOnceAtTheEnd) {
    // 72 and 2.54 rounded on their own would give a last digit that is off for some of these.
    for (int i = 1; i < 10000; ++i) {
        const auto number = static_cast<float>(i);
        const auto exact = static_cast<float>(static_cast<double>(i) * 3600.0 / 127.0);
        ASSERT_EQ(MoxLength(number, MOXUNIT_CM).getRawValue(), exact) << i;
        ASSERT_EQ(MoxLength(number, MOXUNIT_INCH).getRealValue(MOXUNIT_INCH), number);
    }
}

TEST(MoxLength, PointsAndNumbersThatAreNoUnitPassUnchanged) {
    const float number = 1.0F / 3.0F;
    for (const int unit : {-1, 0, 1, 5, 9, 11, 1000, std::numeric_limits<int>::max()}) {
        const MoxLength length(number, static_cast<MoxUnitType>(unit));
        EXPECT_EQ(length.getRawValue(), number) << unit;
        EXPECT_EQ(length.getRealValue(static_cast<MoxUnitType>(unit)), number) << unit;
    }
}

TEST(MoxLength, NotANumberAndInfinityPass) {
    constexpr float infinity = std::numeric_limits<float>::infinity();
    EXPECT_EQ(MoxLength(infinity, MOXUNIT_CM).getRealValue(MOXUNIT_MM), infinity);
    EXPECT_TRUE(std::isnan(MoxLength(NAN, MOXUNIT_CM).getRealValue(MOXUNIT_POINT)));
}

TEST(MoxLength, ComparesNumbersExactly) {
    EXPECT_EQ(MoxLength(1.0F, MOXUNIT_INCH), MoxLength::fromRaw(72.0F));
    EXPECT_NE(MoxLength::fromRaw(1.0F), MoxLength::fromRaw(std::nextafter(1.0F, 2.0F)));
    EXPECT_EQ(MoxLength::fromRaw(0.0F), MoxLength::fromRaw(-0.0F));
    EXPECT_NE(MoxLength::fromRaw(NAN), MoxLength::fromRaw(NAN));
}

} // namespace
