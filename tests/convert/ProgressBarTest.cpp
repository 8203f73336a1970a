#include "tools/convert/ProgressBar.h"

#include "tests/convert/Conversion.h"
#include "tests/convert/TinyPdf.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereConvert::ProgressBar;
using testing::HasSubstr;
using testing::Not;

TEST(ProgressBar, ItTellsTheRateAndTheTimeThatIsLeft) {
    EXPECT_EQ(ProgressBar::describe("a.pdf", 50, 200, 10),
              "a.pdf [#######.......................] 50/200  5.0 pages/s  0:30 left");
    EXPECT_EQ(ProgressBar::describe("a.pdf", 3000, 60000, 600),
              "a.pdf [#.............................] 3000/60000  5.0 pages/s  3:10:00 left");
    EXPECT_EQ(ProgressBar::describe("a.pdf", 4, 4, 0.1),
              "a.pdf [##############################] 4/4  40 pages/s  0:00 left");
}

TEST(ProgressBar, WithoutAPageDoneThereIsNoRate) {
    EXPECT_EQ(ProgressBar::describe("a", 0, 2, 5), "a [..............................] 0/2");
}

TEST(ProgressBar, ItStandsOnATerminalAndNotInAPipe) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", makePlainPdf(3));
    const std::string line = "\"$convert a.pdf --no-index -o out/\"";
    EXPECT_THAT(conversion.runShell("script -qec " + line + " /dev/null </dev/null").output,
                HasSubstr("] 1/3"));
    EXPECT_THAT(conversion.run({"a.pdf", "-o", "out/"}).output, Not(HasSubstr("[")));
}

TEST(ProgressBar, QuietTakesItAway) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", makePlainPdf(3));
    EXPECT_EQ(conversion.runShell("script -qec \"$convert -q a.pdf\" /dev/null </dev/null").output,
              "");
}

} // namespace
} // namespace DrawmereTest
