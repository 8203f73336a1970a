#include "foundation/common/MoxNamedValueMap.h"

#include "foundation/common/MoxValue.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

const MoxName red(u"red-key");
const MoxName blue(u"blue-key");

TEST(MoxNamedValueMap, AnAbsentItemHasKeyZero) {
    const MoxNamedValueMap map;
    EXPECT_EQ(map.getLength(), 0);
    EXPECT_EQ(map.getNamedItem(red).getKey(), MoxName());
    EXPECT_EQ(map.getNamedItem(red), MoxValue::NULL_VALUE);
}

TEST(MoxNamedValueMap, AnItemCarriesItsKey) {
    MoxNamedValueMap map;
    map.setNamedItem(red, 7);
    EXPECT_EQ(map.getNamedItem(red).getKey(), red);
    EXPECT_EQ(map.getNamedItem(red).getIntegerValue(), 7);
    EXPECT_EQ(map.getNamedItem(blue).getKey(), MoxName());
}

TEST(MoxNamedValueMap, ANullItemIsPresentAllTheSame) {
    MoxNamedValueMap map;
    map.setNamedItem(red, MoxValue::NULL_VALUE);
    EXPECT_EQ(map.getNamedItem(red).getKey(), red);
    EXPECT_EQ(map.getNamedItem(red).getType(), MOXVALUE_NULL);
}

TEST(MoxNamedValueMap, SettingAgainReplaces) {
    MoxNamedValueMap map;
    map.setNamedItem(red, u"a text that does not fit into the value itself");
    map.setNamedItem(red, 8);
    EXPECT_EQ(map.getLength(), 1);
    EXPECT_EQ(map.getNamedItem(red), MoxValue(8));
}

TEST(MoxNamedValueMap, TheKeyZeroHoldsNothing) {
    MoxNamedValueMap map;
    map.setNamedItem(MoxName(), 8);
    EXPECT_EQ(map.getLength(), 0);
    EXPECT_EQ(map.getNamedItem(MoxName()), MoxValue::NULL_VALUE);
}

TEST(MoxNamedValueMap, CanTakeItsOwnItem) {
    MoxNamedValueMap map;
    map.setNamedItem(red, u"a text that does not fit into the value itself");
    for (int i = 0; i < 100; ++i) {
        map.setNamedItem(MoxName::fromNumber(5000U + i), map.getNamedItem(red));
    }
    EXPECT_EQ(map.getLength(), 101);
    EXPECT_EQ(map.getNamedItem(MoxName::fromNumber(5099)), map.getNamedItem(red));
}

TEST(MoxNamedValueMap, CopiesAreDeep) {
    MoxNamedValueMap map;
    map.setNamedItem(red, u"a text that does not fit into the value itself");
    MoxNamedValueMap copy(map);
    map.setNamedItem(red, 1);
    EXPECT_EQ(copy.getNamedItem(red).getType(), MOXVALUE_STRING);
    map = copy;
    copy.setNamedItem(red, 2);
    EXPECT_EQ(map.getNamedItem(red).getType(), MOXVALUE_STRING);
}

TEST(MoxNamedValueMap, IsEqualInWhateverOrder) {
    MoxNamedValueMap one;
    one.setNamedItem(red, 1);
    one.setNamedItem(blue, 2);
    MoxNamedValueMap other;
    other.setNamedItem(blue, 2);
    EXPECT_FALSE(one == other);
    EXPECT_FALSE(other == one);
    other.setNamedItem(red, 1);
    EXPECT_TRUE(one == other);
    other.setNamedItem(red, 3);
    EXPECT_FALSE(one == other);
}

TEST(MoxNamedValueMap, ANullItemIsNotEqualToAnAbsentOne) {
    MoxNamedValueMap one;
    one.setNamedItem(red, MoxValue::NULL_VALUE);
    MoxNamedValueMap other;
    other.setNamedItem(blue, MoxValue::NULL_VALUE);
    EXPECT_FALSE(one == other);
}

} // namespace
