#include "foundation/common/MoxNodeIterable.h"

#include "foundation/common/MoxPtr.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

TEST(MoxNodeIterable, IsACountedObject) {
    const MoxPtr<MoxNodeIterable> iterable(new MoxNodeIterable);
    EXPECT_EQ(iterable->getReferenceCount(), 1);
    EXPECT_TRUE(iterable->isA(MoxRCObject::typeId));
    EXPECT_FALSE(iterable->isA(0xFF72074A));
    EXPECT_STREQ(iterable->getTypeName(), "MoxNodeIterable");
}

} // namespace
