#include "foundation/common/MoxError.h"

#include <string>
#include <type_traits>

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

MoxError makeError() { return MoxError(16414, u"can't open größe.svg", u"in.xml", 3, 14, u"more"); }

TEST(MoxError, EmptyRecordHasCodeZeroNoTextsAndNoPlace) {
    const MoxError error;
    EXPECT_EQ(error.getCode(), 0);
    EXPECT_TRUE(error.getMessage().isEmpty());
    EXPECT_TRUE(error.getSource().isEmpty());
    EXPECT_TRUE(error.getExtra().isEmpty());
    EXPECT_EQ(error.getLine(), -1);
    EXPECT_EQ(error.getColumn(), -1);
    EXPECT_STREQ(error.what(), "");
}

TEST(MoxError, KeepsWhatItWasMadeWith) {
    const MoxError error = makeError();
    EXPECT_EQ(error.getCode(), 16414);
    EXPECT_EQ(error.getMessage(), UnicodeString(u"can't open größe.svg"));
    EXPECT_EQ(error.getSource(), UnicodeString(u"in.xml"));
    EXPECT_EQ(error.getLine(), 3);
    EXPECT_EQ(error.getColumn(), 14);
    EXPECT_EQ(error.getExtra(), UnicodeString(u"more"));
}

TEST(MoxError, WhatIsTheMessageInUtf8) {
    EXPECT_STREQ(makeError().what(), "can't open gr\xC3\xB6\xC3\x9F"
                                     "e.svg");
}

TEST(MoxError, SetMessageChangesMessageAndWhatButNoCopy) {
    MoxError error = makeError();
    const MoxError copy = error;
    error.setMessage(u"other");
    EXPECT_EQ(error.getMessage(), UnicodeString(u"other"));
    EXPECT_STREQ(error.what(), "other");
    EXPECT_EQ(error.getCode(), 16414);
    EXPECT_EQ(copy.getMessage(), makeError().getMessage());
    EXPECT_STREQ(copy.what(), makeError().what());
    error.setMessage(UnicodeString());
    EXPECT_STREQ(error.what(), "");
}

TEST(MoxError, AssignmentCopiesEverything) {
    MoxError error;
    error = makeError();
    EXPECT_EQ(error.getCode(), 16414);
    EXPECT_EQ(error.getColumn(), 14);
    EXPECT_STREQ(error.what(), makeError().what());
}

TEST(MoxError, CopiesShareTheBytesOfTheMessage) {
    const MoxError error = makeError();
    const MoxError copy = error;
    EXPECT_EQ(copy.what(), error.what());
}

TEST(MoxError, ThrowFatalErrorThrowsTheRecord) {
    try {
        makeError().throwFatalError();
        FAIL();
    } catch (const MoxError& error) {
        EXPECT_EQ(error.getCode(), 16414);
        EXPECT_EQ(error.getMessage(), makeError().getMessage());
    }
}

TEST(MoxError, IsCaughtAsAStandardException) {
    EXPECT_THROW(makeError().throwFatalError(), std::exception);
    EXPECT_TRUE(std::has_virtual_destructor_v<MoxError>);
}

} // namespace
