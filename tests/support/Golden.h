/// Compares what a page holds with the documents in tests/golden/.
#pragma once

#include "tests/support/SvgPage.h"

#include <gtest/gtest.h>

#include <string>

namespace DrawmereTest {

/// Returns: success when `body` is what tests/golden/<name>.svg holds, otherwise what differs.
/// Under "--update-golden" the file is written instead.
testing::AssertionResult matchesGolden(const std::string& body, const std::string& name);

/// Returns: the first line in which the texts differ, as it stands in both; empty when they agree.
std::string findDifference(const std::string& expected, const std::string& found);

} // namespace DrawmereTest

/// Expects the body of `page`, a `SvgPage`, to be that of tests/golden/<name>.svg.
#define EXPECT_GOLDEN(page, name) EXPECT_TRUE(DrawmereTest::matchesGolden((page).body(), name))
