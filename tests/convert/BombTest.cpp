// Small documents that ask for much: time, memory, stack or what viewers refuse.
#include "tests/convert/Conversion.h"
#include "tests/convert/DrawnPage.h"
#include "tests/convert/TinyPdf.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>

namespace DrawmereTest {
namespace {

using DrawmereConvert::APPROXIMATION_LIMIT;
using DrawmereConvert::ConvertOptions;
using DrawmereConvert::TEXTMODE;
using DrawmereConvert::TEXTMODE_FONTS;
using DrawmereConvert::TEXTMODE_OUTLINES;
using DrawmereConvert::TEXTMODE_PLAIN;
using testing::ContainsRegex;
using testing::ElementsAre;
using testing::HasSubstr;

constexpr int incomplete = 1;
constexpr int unreadable = 3;

struct Bomb : testing::Test {
    static void SetUpTestSuite() {
        conversion = std::make_unique<Conversion>();
        const CommandResult result =
            runCommand({TEST_SOURCE_DIR "/convert/make-bombs", conversion->directory.path()});
        ASSERT_EQ(result.status, 0) << result.output;
        conversion->directory.write("plain.pdf", makePlainPdf(2));
    }

    static void TearDownTestSuite() { conversion.reset(); }

    Bomb() { conversion->runShell("rm -rf out"); }

#if defined(__SANITIZE_ADDRESS__)
    void SetUp() override { GTEST_SKIP() << "the sanitizer needs the address space for itself"; }
#endif

    /// Converts with little memory and time.
    static CommandResult run(const std::string& inputs,
                             const std::string& options = "--timeout .4 -o out/") {
        return conversion->runShell("ulimit -v 450000; $convert --max-memory 100 " + options + " " +
                                    inputs);
    }

    static std::unique_ptr<Conversion> conversion;
};

std::unique_ptr<Conversion> Bomb::conversion;

TEST_F(Bomb, AnImageOfTooManyPixelsLeavesTheRest) {
    for (const std::string name : {"bits", "stencil"}) {
        const CommandResult result = run(name + ".pdf");
        EXPECT_EQ(result.status, incomplete) << result.output;
        EXPECT_THAT(result.output, HasSubstr(name + ".pdf: page 1: malloc of"));
        EXPECT_TRUE(conversion->directory.has("out/" + name + "1.svg"));
        EXPECT_THAT(conversion->directory.read("out/" + name + "2.svg"),
                    HasSubstr("width=\"50\" height=\"50\""));
    }
    const CommandResult picture = run("side.png");
    EXPECT_EQ(picture.status, unreadable);
    EXPECT_THAT(picture.output, HasSubstr("side.png: page 1: "));
}

TEST_F(Bomb, APageThatUnpacksForEverLeavesTheRest) {
    const CommandResult result = run("content.pdf");
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output, HasSubstr("content.pdf: page 1: given up, for its time was over"));
    EXPECT_TRUE(conversion->directory.has("out/content2.svg"));
}

TEST_F(Bomb, APageThatUnpacksForEverLeavesTheRestOfOneDocument) {
    const CommandResult result = run("content.pdf", "--timeout .4 -o out/all.svg --single-file");
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(conversion->directory.read("out/all.svg"), HasSubstr("height=\"100pt\""));
    const CommandResult output = run("content.pdf", "--timeout .4 --quiet -o -");
    EXPECT_EQ(output.status, incomplete);
    EXPECT_THAT(output.output, HasSubstr("width=\"50\" height=\"50\""));
    EXPECT_THAT(output.output, HasSubstr("content.pdf: page 1: given up"));
}

TEST_F(Bomb, APageOfEndlesslyManyShapesLeavesTheRest) {
    const CommandResult result =
        conversion->runShell("ulimit -v 300000; $convert shapes.pdf --max-memory 100 -o out/");
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output,
                HasSubstr("shapes.pdf: page 1: it takes more memory than it may have"));
    EXPECT_THAT(conversion->list("out"), ElementsAre("shapes2.svg"));
}

TEST_F(Bomb, TheMemoryOfAPageIsBounded) {
    const std::string command = "$convert content.pdf -q --timeout 1 -o out/ --jobs 1 ";
    const std::string look = " & p=$!; sleep .5; read c rest </proc/$p/task/$p/children; "
                             "grep 'Max address space' /proc/$c/limits; wait $p";
    EXPECT_THAT(conversion->runShell(command + "--max-memory 100" + look).output,
                ContainsRegex("Max address space +746586112 ")); // 2 * 100 + 512 of 2^20
    EXPECT_THAT(conversion->runShell(command + "--max-memory 0" + look).output,
                ContainsRegex("Max address space +unlimited "));
}

TEST_F(Bomb, ATreeOfPagesThatIsTooDeepIsSaid) {
    const CommandResult result = run("tree.pdf", "-o out/");
    EXPECT_EQ(result.status, unreadable);
    EXPECT_THAT(result.output, HasSubstr("tree.pdf: page 1: too much recursion"));
}

TEST_F(Bomb, ACountOfPagesThatCannotBeIsSaid) {
    const CommandResult result = run("count.pdf");
    EXPECT_EQ(result.status, unreadable);
    EXPECT_THAT(result.output, HasSubstr("count.pdf: it claims to have 2000000000 pages"));
}

TEST_F(Bomb, AnOutlineThatBreaksItsReaderIsLostAlone) {
    const CommandResult result = run("deep.pdf", "-o out/");
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output, HasSubstr("deep.pdf: its outline can't be read"));
    EXPECT_THAT(conversion->list("out"), ElementsAre("deep1.svg", "deep2.svg", "index.html"));
    EXPECT_EQ(run("ring.pdf").status, 0);
}

TEST_F(Bomb, TheTimeToReadADocumentIsBounded) {
    const CommandResult result = run("nested.html");
    EXPECT_EQ(result.status, unreadable);
    EXPECT_EQ(result.output, "nested.html: it takes too long to read the document\n");
}

TEST_F(Bomb, ADocumentThatTakesTooLongLeavesTheOthers) {
    const CommandResult result = run("nested.html plain.pdf");
    EXPECT_EQ(result.status, incomplete);
    EXPECT_EQ(result.output, "nested.html: it takes too long to read the document\n"
                             "plain.pdf: 2 pages written to out/\n");
    EXPECT_THAT(conversion->list("out"), ElementsAre("index.html", "plain1.svg", "plain2.svg"));
}

TEST_F(Bomb, AReaderThatBreaksOffAtOnceIsSaid) {
    const CommandResult one = conversion->runShell(
        "$convert nested.html -o out/ & p=$!; sleep .5; kill -SEGV $p; wait $p");
    EXPECT_EQ(one.status, unreadable);
    EXPECT_EQ(one.output, "nested.html: the reader of the document broke off\n");
    const CommandResult several =
        conversion->runShell("$convert nested.html plain.pdf -o out/ & p=$!; sleep .5; "
                             "kill -KILL $(cat /proc/$p/task/$p/children); wait $p");
    EXPECT_EQ(several.status, incomplete);
    EXPECT_EQ(several.output, "nested.html: the reader of the document broke off (Killed)\n"
                              "plain.pdf: 2 pages written to out/\n");
}

TEST_F(Bomb, AnImageThatViewersRefuseGoesToAFile) {
    const CommandResult result = run("noise.pdf", "--image-format png -o out/");
    EXPECT_EQ(result.status, 0) << result.output;
    EXPECT_EQ(conversion->list("out").size(), 4U); // two pages, the index and the image
    EXPECT_LT(conversion->directory.read("out/noise1.svg").size(), 1000U);
    EXPECT_THAT(run("noise.pdf", "--image-format png -o -").output,
                HasSubstr("1 thing too large for some viewers"));
}

TEST(BrokenParts, AnImageThatCannotBeReadIsSaid) {
    const DrawnPage page({"0 0 9 9 re f 40 0 0 30 10 20 cm /I Do",
                          "/XObject<</I 5 0 R>>",
                          {{"/Type/XObject/Subtype/Image/Width 9/Height 9/BitsPerComponent 8"
                            "/ColorSpace/DeviceRGB/Filter/JPXDecode",
                            "nonsense"}}});
    EXPECT_FALSE(page.report.isComplete);
    EXPECT_FALSE(page.report.messages.empty());
    EXPECT_EQ(page.count("rect"), 1);
}

TEST(BrokenParts, AFontThatCannotBeReadIsReplaced) {
    for (const TEXTMODE mode : {TEXTMODE_OUTLINES, TEXTMODE_FONTS, TEXTMODE_PLAIN}) {
        const DrawnPage page(
            {"BT /F 20 Tf 10 40 Td (Hello) Tj ET",
             "/Font<</F<</Type/Font/Subtype/TrueType/BaseFont/Broken/Encoding/WinAnsiEncoding"
             "/FirstChar 72/LastChar 72/Widths[500]/FontDescriptor<</Type/FontDescriptor"
             "/FontName/Broken/Flags 32/FontFile2 5 0 R>>>>>>",
             {{"", "nonsense"}}},
            withText(mode));
        EXPECT_EQ(page.count("path") + static_cast<int>(page.texts().size()), 1);
    }
}

int countLimits(const std::string& content, const ConvertOptions& options) {
    const DrawnPage page({content, ""}, options);
    return page.countNotes(APPROXIMATION_LIMIT);
}

TEST(ViewersLimits, AnEndlessPathIsReported) {
    ConvertOptions options;
    options.maxPathPoints = 4;
    const std::string path = "0 0 m 9 0 l 9 9 l 5 9 l ";
    EXPECT_EQ(countLimits(path + "S", options), 0);
    EXPECT_EQ(countLimits(path + "2 1 l S", options), 1);
    EXPECT_EQ(countLimits(path + "2 1 l f", options), 1);
    EXPECT_EQ(countLimits(path + "2 1 l W n 0 0 9 9 re f", options), 1);
}

TEST(ViewersLimits, EndlesslyManyShapesAreReportedOnce) {
    ConvertOptions options;
    options.maxShapes = 2;
    const std::string shape = "0 0 9 9 re f ";
    EXPECT_EQ(countLimits(shape + shape, options), 0);
    EXPECT_EQ(countLimits(shape + shape + shape + shape, options), 1);
}

TEST(ViewersLimits, ElementsNestNoDeeperThanTheyTake) {
    std::string content;
    for (int i = 0; i < 400; ++i) {
        content += "0 0 m 199 0 l " + std::to_string(i) + " 99 l W n ";
    }
    EXPECT_LE(DrawnPage({content + "0 0 200 100 re f", ""}).depth(), 256);
}

} // namespace
} // namespace DrawmereTest
