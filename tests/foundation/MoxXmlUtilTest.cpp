#include "foundation/common/MoxXmlUtil.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

TEST(MoxXmlUtil, WithoutAPrefixTheQualifiedNameIsTheLocalName) {
    EXPECT_EQ(MoxXmlUtil::makeQName(MoxName(), MoxName(u"href")), MoxName(u"href"));
}

TEST(MoxXmlUtil, APrefixStandsBeforeAColon) {
    EXPECT_EQ(MoxXmlUtil::makeQName(MoxName(u"xlink"), MoxName(u"href")), MoxName(u"xlink:href"));
    EXPECT_EQ(MoxXmlUtil::makeQName(MoxName(u"svg"), MOXNAME_SVG), MoxName(u"svg:svg"));
}

TEST(MoxXmlUtil, ANameThatIsMissingIsEmptyText) {
    EXPECT_EQ(MoxXmlUtil::makeQName(MoxName(u"p"), MoxName()), MoxName(u"p:"));
    EXPECT_EQ(MoxXmlUtil::makeQName(MoxName(), MoxName()), MoxName());
}

} // namespace
