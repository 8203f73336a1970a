#include "tools/convert/PageRanges.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <stdexcept>

namespace DrawmereTest {
namespace {

using DrawmereConvert::PageRanges;
using testing::ElementsAre;
using testing::IsEmpty;

TEST(PageRanges, WithoutAnyEveryPageIsMeant) {
    EXPECT_THAT(PageRanges().select(3), ElementsAre(0, 1, 2));
}

TEST(PageRanges, NumbersAndRangesAndOpenEndsAreTakenTogether) {
    EXPECT_THAT(PageRanges("1-3,5,8-").select(10), ElementsAre(0, 1, 2, 4, 7, 8, 9));
    EXPECT_THAT(PageRanges("-2,9-9").select(10), ElementsAre(0, 1, 8));
}

TEST(PageRanges, PagesComeInTheOrderOfTheDocumentAndOnce) {
    EXPECT_THAT(PageRanges("3,1,2-3").select(3), ElementsAre(0, 1, 2));
}

TEST(PageRanges, WhatTheDocumentLacksIsPassedOver) {
    EXPECT_THAT(PageRanges("2-99").select(3), ElementsAre(1, 2));
    EXPECT_THAT(PageRanges("7").select(3), IsEmpty());
}

TEST(PageRanges, AnythingElseIsRefused) {
    for (const char* const text :
         {"", "-", "0", "1,", ",1", "a", "1-b", "3-1", "1-2-3", "1 2", "+1", "99999999999"}) {
        EXPECT_THROW(PageRanges{text}, std::invalid_argument) << text;
    }
}

} // namespace
} // namespace DrawmereTest
