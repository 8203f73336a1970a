#include "tools/convert/PageOutcome.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using namespace DrawmereConvert; // NOLINT(google-build-using-namespace): the subject

TEST(PageOutcome, ItIsTheSameWhenItArrives) {
    PageOutcome outcome;
    outcome.page = 41;
    outcome.isWritten = true;
    outcome.isLate = true;
    outcome.isUnreadable = true;
    outcome.size = {12.5F, 7};
    outcome.error = "no reason";
    outcome.report.isComplete = false;
    outcome.report.note(APPROXIMATION_MASK);
    outcome.report.messages = {"one", "", std::string("t\0o", 3)};
    outcome.report.links = {{1, 2, 3, 4, "page2.svg#there"}, {}};
    const PageOutcome arrived = unpackOutcome(packOutcome(outcome));
    EXPECT_EQ(arrived.page, 41);
    EXPECT_TRUE(arrived.isWritten);
    EXPECT_TRUE(arrived.isLate);
    EXPECT_TRUE(arrived.isUnreadable);
    EXPECT_EQ(arrived.size.width, 12.5F);
    EXPECT_EQ(arrived.size.height, 7);
    EXPECT_EQ(arrived.error, outcome.error);
    EXPECT_FALSE(arrived.report.isComplete);
    EXPECT_EQ(arrived.report.approximations, outcome.report.approximations);
    EXPECT_EQ(arrived.report.messages, outcome.report.messages);
    ASSERT_EQ(arrived.report.links.size(), 2U);
    EXPECT_EQ(arrived.report.links[0].height, 4);
    EXPECT_EQ(arrived.report.links[0].target, "page2.svg#there");
}

TEST(OutlineEntry, KeepsItselfOnTheWay) {
    using DrawmereConvert::OutlineEntry;
    const std::vector<OutlineEntry> outline = {{" One\n two ", 12, 0}, {"", -1, 3}, {"7", 0, 1}};
    EXPECT_EQ(DrawmereConvert::unpackOutline(DrawmereConvert::packOutline(outline)), outline);
    EXPECT_TRUE(DrawmereConvert::unpackOutline("").empty());
}

} // namespace
} // namespace DrawmereTest
