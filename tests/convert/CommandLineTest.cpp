// What the program says to its arguments, before there is a document.
#include "tests/convert/Conversion.h"
#include "tests/convert/TinyPdf.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::MatchesRegex;

constexpr int misuse = 2;

TEST(CommandLine, HelpListsEveryOptionAndShowsExamples) {
    const CommandResult result = Conversion().run({"--help"});
    EXPECT_EQ(result.status, 0);
    for (const char* const word :
         {"--output",      "--pages",        "--number-format", "--keep-number", "--single-file",
          "--index",       "--profile",      "--text",          "--precision",   "--gzip",
          "--password",    "--images",       "--image-format",  "--dpi",         "--quality",
          "--shading-dpi", "--small-device", "--max-size",      "--error-svg",   "--jobs",
          "--timeout",     "--max-memory",   "--verbose",       "--quiet",       "--version",
          "Examples:",     "Exit status"}) {
        EXPECT_THAT(result.output, HasSubstr(word));
    }
}

TEST(CommandLine, VersionIsALine) {
    const CommandResult result = Conversion().run({"--version"});
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.output, MatchesRegex("drawmere-convert [0-9.]+\n"));
}

struct Misuse {
    std::vector<std::string> words;
    const char* complaint;
};

const Misuse misuses[] = {
    {{}, "FILE"},
    {{"a.pdf", "--nonsense"}, "--nonsense"},
    {{"a.pdf", "--pages", "3-1"}, "runs backwards"},
    {{"a.pdf", "--pages", "x"}, "no page number"},
    {{"a.pdf", "--pages", "7"}, "a.pdf: none of the pages asked for is among its 2"},
    {{"a.pdf", "--profile", "huge"}, "--profile"},
    {{"a.pdf", "--text", "letters"}, "--text"},
    {{"a.pdf", "--precision", "0"}, "--precision"},
    {{"a.pdf", "--images", "some"}, "--images"},
    {{"a.pdf", "--image-format", "bmp"}, "--image-format"},
    {{"a.pdf", "--dpi", "0"}, "--dpi"},
    {{"a.pdf", "--quality", "101"}, "--quality"},
    {{"a.pdf", "--jobs", "0"}, "--jobs"},
    {{"a.pdf", "--timeout", "-1"}, "--timeout"},
    {{"a.pdf", "--timeout", "nan"}, "--timeout"},
    {{"a.pdf", "--precision", "nan"}, "--precision"},
    {{"a.pdf", "--number-format", "../1"}, "--number-format"},
    {{"a.pdf", "a.pdf"}, "a.pdf is given twice"},
    {{"a.pdf", "--max-size", "5"}, "--max-size"},
    {{"a.pdf", "--small-device", "--max-size", "5"}, "--error-svg"},
    {{"a.pdf", "--small-device", "--max-size", "5", "--error-svg", "none.svg"}, "none.svg"},
    {{"a.pdf", "--small-device", "--profile", "full"}, "--small-device"},
    {{"a.pdf", "-o", "-", "--images", "copy"}, "--images"},
    {{"a.pdf", "-o", "-", "--index"}, "--index"},
    {{"a.pdf", "--single-file", "--index"}, "--index"},
    {{"a.pdf", "b.pdf", "-o", "-"}, "one document"},
    {{"a.pdf", "b.pdf", "-o", "c.svg"}, "c.svg/"},
    {{"a.pdf", "-o", "a.pdf/x/"}, "a.pdf: "},
};

TEST(CommandLine, WrongUseIsSaidAndWritesNothing) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", makePlainPdf(2));
    for (const Misuse& row : misuses) {
        const CommandResult result = conversion.run(row.words);
        EXPECT_EQ(result.status, misuse) << row.complaint;
        EXPECT_THAT(result.output, HasSubstr(row.complaint));
        EXPECT_THAT(conversion.list(), ElementsAre("a.pdf"));
    }
}

TEST(CommandLine, ADocumentIsNeverOverwrittenByItsOwnPage) {
    const Conversion conversion;
    const std::string drawing =
        "<svg xmlns='http://www.w3.org/2000/svg' width='9' height='9'><path d='M1 1h5v5z'/></svg>";
    conversion.directory.write("a.svg", drawing);
    const CommandResult result = conversion.run({"a.svg"});
    EXPECT_EQ(result.status, misuse);
    EXPECT_THAT(result.output, HasSubstr("would take the place of a document"));
    EXPECT_EQ(conversion.directory.read("a.svg"), drawing);
}

TEST(CommandLine, TwoDocumentsMayNotShareAName) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", makePlainPdf(1));
    std::filesystem::create_directory(conversion.directory.path("b"));
    conversion.directory.write("b/a.pdf", makePlainPdf(1));
    const CommandResult result = conversion.run({"a.pdf", "b/a.pdf", "-o", "out/"});
    EXPECT_EQ(result.status, misuse);
    EXPECT_THAT(result.output,
                HasSubstr("b/a.pdf: ./out/a.svg would take the place of a page of a.pdf"));
    EXPECT_THAT(conversion.list("out"), ElementsAre("a.svg"));
}

} // namespace
} // namespace DrawmereTest
