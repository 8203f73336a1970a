#include "foundation/common/MoxNameEnum.h"

#include "foundation/common/MoxNameTable.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::utf8;

struct FixedRow {
    MoxNameEnum name;
    std::uint32_t number;
    const char* text;
};

constexpr FixedRow fixedRows[] = {
    {MOXNAME_DOCUMENT, 184, "#document"},
    {MOXNAME_ALPHABETIC, 250, "alphabetic"},
    {MOXNAME_EXTERNAL, 583, "external"},
    {MOXNAME_SVG_NAMESPACE, 763, "http://www.w3.org/2000/svg"},
    {MOXNAME_INTERNAL, 839, "internal"},
    {MOXNAME_LR_TB, 1000, "lr-tb"},
    {MOXNAME_ID, 1069, "id"},
    {MOXNAME_NEW, 1073, "new"},
    {MOXNAME_PAGE, 1167, "page"},
    {MOXNAME_SHOW, 1353, "show"},
    {MOXNAME_SVG, 1431, "svg"},
    {MOXNAME_TB, 1456, "tb"},
    {MOXNAME_TB_RL, 1459, "tb-rl"},
    {MOXNAME_TARGET, 1506, "target"},
    {MOXNAME_NAME, 1552, "name"},
    {MOXNAME_XLINK_NAMESPACE, 1913, "http://www.w3.org/1999/xlink"},
};

TEST(MoxNameEnum, EachNameHasItsNumberAndItsText) {
    for (const FixedRow& row : fixedRows) {
        EXPECT_EQ(row.name, row.number);
        EXPECT_EQ(utf8(MoxNameTable::getSharedNameString(row.name)), row.text);
    }
}

TEST(MoxNameEnum, InterningATextOfTheListGivesItsFixedNumber) {
    for (const FixedRow& row : fixedRows) {
        EXPECT_EQ(MoxName(UnicodeString::fromUTF8(row.text)).number, row.number);
    }
}

} // namespace
