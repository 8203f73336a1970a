// Documents that can't be read, wholly or in part, and runs that are ended.
#include "tests/convert/Conversion.h"
#include "tests/convert/TinyPdf.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

constexpr int incomplete = 1;
constexpr int unreadable = 3;

void expectUnreadable(const std::string& bytes, const std::string& complaint) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", bytes);
    const CommandResult result = conversion.run({"a.pdf", "-o", "out/"});
    EXPECT_EQ(result.status, unreadable);
    EXPECT_THAT(result.output, HasSubstr("a.pdf: " + complaint));
    EXPECT_THAT(conversion.list(), ElementsAre("a.pdf"));
}

TEST(BadInput, AnEmptyFileIsNoDocument) { expectUnreadable("", "it is empty"); }

TEST(BadInput, WhatIsNoDocumentIsSaid) {
    expectUnreadable("A letter to a friend.\n", "");
    expectUnreadable(std::string(5000, '\0'), "");
}

TEST(BadInput, ADocumentWithoutPagesIsSaid) {
    expectUnreadable(makePlainPdf(0), "there are no pages");
}

TEST(BadInput, ATruncatedDocumentIsSaid) { expectUnreadable(makePlainPdf(3).substr(0, 60), ""); }

TEST(BadInput, AMissingFileIsSaid) {
    const Conversion conversion;
    const CommandResult result = conversion.run({"none.pdf", "-o", "out/"});
    EXPECT_EQ(result.status, unreadable);
    EXPECT_THAT(result.output, HasSubstr("none.pdf: "));
    EXPECT_THAT(conversion.list(), IsEmpty());
}

TEST(BadInput, WhatIsNoFileIsSaidAndNotWaitedFor) {
    const Conversion conversion;
    const auto say = [&](const std::string& input) {
        const CommandResult result = conversion.run({input, "-o", "out/"});
        EXPECT_EQ(result.status, unreadable);
        return result.output;
    };
    EXPECT_EQ(say("/"), "/: it is a directory\n");
    EXPECT_EQ(say("/dev/null"), "/dev/null: it is not a plain file\n");
    conversion.runShell("mkfifo pipe");
    EXPECT_EQ(say("pipe"), "pipe: it is not a plain file\n");
    EXPECT_THAT(conversion.list(), ElementsAre("pipe"));
}

TEST(BadInput, TheOtherDocumentsAreConverted) {
    const Conversion conversion;
    conversion.directory.write("b.pdf", makePlainPdf(2));
    const CommandResult result = conversion.run({"none.pdf", "b.pdf", "-o", "out/"});
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(conversion.list("out"), ElementsAre("b1.svg", "b2.svg", "index.html"));
}

TEST(BadInput, AnEncryptedDocumentWantsItsPassword) {
    const Conversion conversion;
    const std::string input = Conversion::document("libreoffice-writer-password.pdf");
    const CommandResult none = conversion.run({input, "-o", "a.svg"});
    EXPECT_EQ(none.status, unreadable);
    EXPECT_THAT(none.output, HasSubstr(input + ": a password is needed"));
    const CommandResult wrong = conversion.run({input, "-o", "a.svg", "--password", "x"});
    EXPECT_EQ(wrong.status, unreadable);
    EXPECT_THAT(wrong.output, HasSubstr("the password is wrong"));
    EXPECT_EQ(conversion.run({input, "-o", "a.svg", "--password", "openpassword"}).status, 0);
    EXPECT_THAT(conversion.list(), ElementsAre("a.svg"));
}

TEST(BadInput, ADamagedDocumentIsReadAsFarAsItGoes) {
    const Conversion conversion;
    const CommandResult result =
        conversion.run({Conversion::document("corruptionOneByteMissing.pdf"), "-o", "a.svg"});
    EXPECT_EQ(result.status, 0);
    EXPECT_GT(conversion.directory.read("a.svg").size(), 10'000U);
    EXPECT_EQ(conversion.run({Conversion::document("GHOSTSCRIPT-698804-1-fuzzed.pdf")}).status,
              unreadable);
}

TEST(BadInput, ABrokenPageIsWrittenAsFarAsItGoesAndTheOthersWhole) {
    const Conversion conversion;
    conversion.directory.write("a.pdf",
                               TinyPdf()
                                   .addPlainPage()
                                   .addPage("10 10 50 50 re f /Nothing Do /Im sh BI /W 5 /H 5 ID x")
                                   .addPlainPage()
                                   .write());
    const CommandResult result = conversion.run({"a.pdf", "-o", "out/"});
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output, HasSubstr("a.pdf: page 2: "));
    EXPECT_THAT(result.output, Not(HasSubstr("page 1: ")));
    EXPECT_THAT(conversion.directory.read("out/a2.svg"), HasSubstr("width=\"50\""));
    EXPECT_TRUE(conversion.directory.has("out/a3.svg"));
}

TEST(BadInput, MemoryIsBounded) {
    const Conversion conversion;
    // An image of 20,000 by 20,000 pixels, of which a few are there.
    conversion.directory.write(
        "a.pdf", TinyPdf()
                     .addPlainPage()
                     .addPage("200 0 0 100 0 0 cm BI /W 20000 /H 20000 /BPC 8 /CS /RGB ID xyz EI ")
                     .write());
    const CommandResult result =
        conversion.run({"a.pdf", "-o", "out/", "--max-memory", "100", "--jobs", "1"});
    EXPECT_EQ(result.status, incomplete) << result.output;
    EXPECT_THAT(result.output, HasSubstr("a.pdf: page 2: "));
    EXPECT_TRUE(conversion.directory.has("out/a1.svg"));
}

TEST(BadInput, PathsThatCannotBeWrittenAreSaid) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", makePlainPdf(2));
    const CommandResult result = conversion.run({"a.pdf", "-o", "/proc/nothing/x.svg"});
    EXPECT_EQ(result.status, 2);
    EXPECT_THAT(result.output, HasSubstr("a.pdf: /proc/nothing/: "));
}

TEST(BadInput, AFileThatCannotBeWrittenIsSaidByItsOwnName) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", makePlainPdf(2));
    conversion.runShell("mkdir -p out/a1.svg");
    const CommandResult result = conversion.run({"a.pdf", "-o", "out/"});
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output, HasSubstr("a.pdf: page 1: ./out/a1.svg: Is a directory\n"));
    const std::string name = std::string(300, 'x') + ".svg";
    for (const std::string option : {"--keep-number", "--single-file"}) {
        const CommandResult tooLong = conversion.run({"a.pdf", option, "-o", "o/" + name});
        EXPECT_EQ(tooLong.status, incomplete);
        EXPECT_THAT(tooLong.output, HasSubstr("./o/xxx"));
        EXPECT_THAT(tooLong.output, Not(HasSubstr(".drawmere-")));
    }
}

/// Two plain pages and one that takes for ever between them.
struct EndlessPage : testing::Test {
    EndlessPage() {
        conversion.directory.write(
            "a.pdf", TinyPdf().addPlainPage().addEndlessPage().addPlainPage().write());
    }

    Conversion conversion;
};

TEST_F(EndlessPage, ItsTimeIsBounded) {
    const CommandResult result = conversion.run({"a.pdf", "-o", "out/", "--timeout", "0.3"});
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output, HasSubstr("a.pdf: page 2: its time was over"));
    EXPECT_THAT(conversion.list("out"), ElementsAre("a1.svg", "a2.svg", "a3.svg", "index.html"));
    EXPECT_GT(conversion.directory.read("out/a2.svg").size(), 1000U); // as far as it came
}

TEST_F(EndlessPage, InASingleFileTheOthersAreThere) {
    const CommandResult result =
        conversion.run({"a.pdf", "-o", "all.svg", "--single-file", "--timeout", "0.3"});
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(conversion.directory.read("all.svg"), HasSubstr("height=\"324pt\""));
}

// The process that draws a page is the only child of the program that lives that long.
constexpr const char* findChild = "p=$!; sleep .3; c=$(cat /proc/$p/task/$p/children); ";

TEST_F(EndlessPage, OneThatDoesNotEvenStopIsEnded) {
    const CommandResult result =
        conversion.runShell(std::string("$convert a.pdf -o out/ --jobs 1 --timeout .4 & ") +
                            findChild + "kill -STOP $c; wait $p");
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output, HasSubstr("a.pdf: page 2: given up, for its time was over"));
    EXPECT_THAT(conversion.list("out"), ElementsAre("a1.svg", "a3.svg", "index.html"));
}

TEST_F(EndlessPage, AReaderThatBreaksOffLosesOnlyItsPage) {
    const CommandResult result = conversion.runShell(
        std::string("$convert a.pdf -o out/ --jobs 1 & ") + findChild + "kill -KILL $c; wait $p");
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output, HasSubstr("a.pdf: page 2: the reader of the document broke off"));
    EXPECT_THAT(conversion.list("out"), ElementsAre("a1.svg", "a3.svg", "index.html"));
}

TEST_F(EndlessPage, AReaderThatBreaksOffLosesOnlyItsPageOfASingleFile) {
    const CommandResult result =
        conversion.runShell(std::string("$convert a.pdf -o all.svg --single-file & ") + findChild +
                            "kill -KILL $c; wait $p");
    EXPECT_EQ(result.status, incomplete);
    EXPECT_THAT(result.output, HasSubstr("2 pages written to all.svg, 1 failed"));
    EXPECT_THAT(conversion.directory.read("all.svg"), HasSubstr("height=\"212pt\""));
}

TEST_F(EndlessPage, AnInterruptLeavesNoHalfWrittenFile) {
    for (const std::string signal : {"INT", "TERM", "HUP"}) {
        const CommandResult result = conversion.runShell(
            "env --default-signal $convert a.pdf -o out/ --jobs 2 & p=$!; "
            "for i in {1..300}; do [ -e out/a1.svg -a -e out/a3.svg ] && break; sleep .05; done; "
            "kill -s " +
            signal + " $p; wait $p");
        EXPECT_GT(result.status, 128);
        EXPECT_THAT(conversion.list("out"), ElementsAre("a1.svg", "a3.svg"));
        conversion.runShell("rm -r out");
    }
    conversion.runShell("timeout -s INT .3 $convert a.pdf -o new/all.svg --single-file");
    EXPECT_THAT(conversion.list(), ElementsAre("a.pdf"));
}

} // namespace
} // namespace DrawmereTest
