#include "foundation/common/MoxAttributeMap.h"

#include "foundation/common/MoxElement.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

TEST(MoxAttributeMap, IsEmptyByDefault) {
    const MoxAttributeMap map;
    EXPECT_EQ(map.getLength(), 0);
    EXPECT_EQ(map.begin(), map.end());
}

TEST(MoxAttributeMap, GivesNamesAndValuesInTheOrderOfFirstSetting) {
    MoxElement element(nullptr);
    element.setAttribute(MoxName(u"b"), 1);
    element.setAttribute(MoxName(u"a"), u"two");
    element.setAttribute(MoxName(u"b"), 3);

    const MoxAttributeMap map = element.getAttributes();
    ASSERT_EQ(map.getLength(), 2);
    EXPECT_EQ(map.item(0).getNodeName(), MoxName(u"b"));
    EXPECT_EQ(map.item(0).getNodeValue(), MoxValue(3));
    EXPECT_EQ(map.item(1).getNodeName(), MoxName(u"a"));
    EXPECT_EQ(map.item(1).getNodeValue(), MoxValue(u"two"));
}

TEST(MoxAttributeMap, AnItemBeyondTheEndsHasNoNameAndNoValue) {
    MoxElement element(nullptr);
    element.setAttribute(MoxName(u"a"), 1);
    for (const int index : {-1, 1, 7, 1000000}) {
        EXPECT_EQ(element.getAttributes().item(index).getNodeName(), MoxName());
        EXPECT_EQ(element.getAttributes().item(index).getNodeValue(), MoxValue::NULL_VALUE);
    }
    EXPECT_EQ(MoxAttributeMap().item(0).getNodeName(), MoxName());
}

} // namespace
