#include "foundation/common/MoxWord.h"

#include <cstdint>
#include <gtest/gtest.h>
#include <string_view>

namespace {

using namespace MoxCommonNS;

enum SHADE : std::int32_t { SHADE_LIGHT = 0, SHADE_DARK = 1 };

constexpr MoxWord<SHADE> shadeWords[] = {
    {SHADE_LIGHT, u"light"},
    {SHADE_DARK, u"dark"},
    {SHADE_DARK, u"darker"},
};

static_assert(findWord(shadeWords, SHADE_LIGHT) != nullptr, "works at compile time");

TEST(MoxWord, FindsTheFirstRowOfAKey) {
    EXPECT_EQ(std::u16string_view(findWord(shadeWords, SHADE_LIGHT)), u"light");
    EXPECT_EQ(std::u16string_view(findWord(shadeWords, SHADE_DARK)), u"dark");
}

TEST(MoxWord, UnknownKeyHasNoWord) {
    EXPECT_EQ(findWord(shadeWords, static_cast<SHADE>(-7)), nullptr);
}

} // namespace
