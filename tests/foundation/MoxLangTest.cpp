#include "foundation/common/MoxLang.h"

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

TEST(MoxLang, DefaultIsTheRootLanguage) {
    EXPECT_TRUE(MoxLang().isRoot());
    EXPECT_EQ(MoxLang(), MoxLang(icu::Locale("")));
    EXPECT_STREQ(MoxLang().getLocale().getName(), "");
}

TEST(MoxLang, KeepsTheLocaleItWasMadeFrom) {
    const MoxLang german(icu::Locale::getGermany());
    EXPECT_FALSE(german.isRoot());
    EXPECT_STREQ(german.getLocale().getName(), "de_DE");
    EXPECT_FALSE(german == MoxLang());
}

TEST(MoxLang, BrokenLocaleCountsAsRoot) {
    icu::Locale broken;
    broken.setToBogus();
    EXPECT_TRUE(MoxLang(broken).isRoot());
}

TEST(MoxLang, UnstatedLanguageIsNumberZero) { EXPECT_EQ(int(MoxLang::LANGUAGE_UNSTATED), 0); }

} // namespace
