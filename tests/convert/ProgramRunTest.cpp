// What the program writes.
#include "tests/convert/Conversion.h"
#include "tests/convert/TinyPdf.h"
#include "tests/support/Gunzip.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <regex>

namespace DrawmereTest {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;
using testing::UnorderedElementsAre;

/// A conversion of a document of twelve plain pages.
struct TwelvePages : testing::Test {
    TwelvePages() { conversion.directory.write("a.pdf", makePlainPdf(12)); }

    /// Runs the converter to its end, without complaint.
    std::string run(std::vector<std::string> words) const {
        words.insert(words.begin(), "a.pdf");
        const CommandResult result = conversion.run(words);
        EXPECT_EQ(result.status, 0) << result.output;
        return result.output;
    }

    Conversion conversion;
};

using ProgramRun = TwelvePages;

TEST_F(ProgramRun, EveryPageGetsAFileAndAllOfThemAnIndex) {
    EXPECT_EQ(run({"-o", "out/"}), "a.pdf: 12 pages written to out/\n");
    EXPECT_THAT(conversion.list("out"),
                ElementsAre("a01.svg", "a02.svg", "a03.svg", "a04.svg", "a05.svg", "a06.svg",
                            "a07.svg", "a08.svg", "a09.svg", "a10.svg", "a11.svg", "a12.svg",
                            "index.html"));
    EXPECT_EQ(runCommand({"xmllint", "--noout", conversion.directory.path("out/a07.svg")}).output,
              "");
    EXPECT_THAT(conversion.directory.read("out/a07.svg"), HasSubstr("width=\"200pt\""));
}

TEST_F(ProgramRun, WithoutAnOutputPagesGoToTheCurrentDirectory) {
    run({"--pages", "2-3", "--no-index"});
    EXPECT_THAT(conversion.list(), ElementsAre("a.pdf", "a02.svg", "a03.svg"));
}

TEST_F(ProgramRun, PagesKeepTheirNumbersWhenOnlySomeAreWritten) {
    run({"--pages", "11-,2", "-o", "out/p.svg", "--number-format", "001", "--no-index"});
    EXPECT_THAT(conversion.list("out"), ElementsAre("p002.svg", "p011.svg", "p012.svg"));
    run({"-o", "whole/p.svg", "--number-format", "001"});
    EXPECT_EQ(conversion.directory.read("out/p011.svg"),
              conversion.directory.read("whole/p011.svg"));
}

TEST_F(ProgramRun, ASinglePageHasThePlainNameAndNoIndex) {
    EXPECT_EQ(run({"--pages", "4", "-o", "out/"}), "a.pdf: 1 page written to out/a.svg\n");
    EXPECT_THAT(conversion.list("out"), ElementsAre("a.svg"));
    run({"--pages", "4", "-o", "kept/", "--keep-number", "--number-format", "i", "--index"});
    EXPECT_THAT(conversion.list("kept"), ElementsAre("aiv.svg", "index.html"));
}

TEST_F(ProgramRun, ASingleFileHoldsAllPagesBelowEachOther) {
    EXPECT_EQ(run({"--single-file", "-o", "out/all.svg"}),
              "a.pdf: 12 pages written to out/all.svg\n");
    EXPECT_THAT(conversion.list("out"), ElementsAre("all.svg"));
    const std::string svg = conversion.directory.read("out/all.svg");
    EXPECT_EQ(runCommand({"xmllint", "--noout", conversion.directory.path("out/all.svg")}).output,
              "");
    EXPECT_THAT(svg, HasSubstr("width=\"200pt\" height=\"1332pt\"")); // 12 pages, 11 gaps
}

TEST_F(ProgramRun, PagesAreTurnedAndCutAsTheDocumentSays) {
    const std::string box = "20 20 30 10 re f";
    conversion.directory.write("a.pdf", TinyPdf()
                                            .addPage(box, "/CropBox[10 10 150 90]")
                                            .addPage(box, "/CropBox[10 10 150 90]/Rotate 90")
                                            .addPage(box, "/UserUnit 2/MediaBox[0 0 50 40]")
                                            .write());
    run({"-o", "out/"});
    const auto expectPage = [&](const std::string& file, const std::string& text) {
        EXPECT_THAT(conversion.directory.read(file), HasSubstr(text));
    };
    expectPage("out/a1.svg", "width=\"140pt\" height=\"80pt\" viewBox=\"0 0 140 80\"");
    expectPage("out/a1.svg", "<rect x=\"10\" y=\"60\" width=\"30\" height=\"10\"");
    expectPage("out/a2.svg", "width=\"80pt\" height=\"140pt\" viewBox=\"0 0 80 140\"");
    expectPage("out/a2.svg", "<rect x=\"10\" y=\"10\" width=\"10\" height=\"30\"");
    expectPage("out/a3.svg", "width=\"100pt\" height=\"80pt\" viewBox=\"0 0 100 80\"");
    expectPage("out/a3.svg", "<rect x=\"40\" y=\"20\" width=\"60\" height=\"20\"");
    // One below the other, twelve points apart, on a sheet as wide as the widest.
    run({"--single-file", "-o", "all.svg"});
    expectPage("all.svg", "width=\"140pt\" height=\"324pt\"");
    expectPage("all.svg", "<rect x=\"10\" y=\"102\" width=\"10\" height=\"30\"");
    expectPage("all.svg", "<rect x=\"40\" y=\"264\" width=\"60\" height=\"20\"");
}

TEST_F(ProgramRun, TheStandardOutputTakesTheSameDocument) {
    run({"--single-file", "-o", "all.svg"});
    const CommandResult result = conversion.runShell("$convert a.pdf -o - 2>/dev/null");
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, conversion.directory.read("all.svg"));
}

TEST_F(ProgramRun, AStandardOutputThatTakesNoMoreIsAFailure) {
    const std::string report = "a.pdf: the standard output takes no more\n"
                               "a.pdf: 0 pages written, 12 failed\n";
    for (const std::string output : {"/dev/full", ">(true); wait $!"}) { // full; closed early
        const CommandResult result =
            conversion.runShell("exec 3> " + output + "; $convert a.pdf -o - >&3");
        EXPECT_EQ(result.status, 1);
        EXPECT_EQ(result.output, report);
    }
}

TEST_F(ProgramRun, CompressedPagesHoldTheSame) {
    run({"--pages", "1-2", "-o", "plain/", "--no-index"});
    run({"--pages", "1-2", "-o", "small/", "--gzip", "--no-index"});
    EXPECT_THAT(conversion.list("small"), ElementsAre("a01.svgz", "a02.svgz"));
    EXPECT_EQ(gunzip(conversion.directory.read("small/a02.svgz")),
              conversion.directory.read("plain/a02.svg"));
}

TEST_F(ProgramRun, ProfilesAreTheLibrarys) {
    for (const std::string profile : {"full", "basic", "tiny", "plazmic"}) {
        run({"--pages", "1", "--profile", profile, "-o", profile + ".svg"});
    }
    const std::string full = conversion.directory.read("full.svg");
    EXPECT_THAT(conversion.directory.read("basic.svg"), HasSubstr("baseProfile=\"basic\""));
    EXPECT_THAT(conversion.directory.read("tiny.svg"), HasSubstr("baseProfile=\"tiny\""));
    EXPECT_THAT(conversion.directory.read("plazmic.svg"), Not(HasSubstr(" xmlns=")));
    EXPECT_THAT(full, HasSubstr(" xmlns="));
    EXPECT_THAT(full, Not(HasSubstr("baseProfile")));
}

TEST_F(ProgramRun, TwiceGivesTheSameBytes) {
    run({"-o", "out/"});
    const std::string listing = conversion.runShell("cd out; cksum *").output;
    run({"-o", "out/"});
    EXPECT_EQ(conversion.runShell("cd out; cksum *").output, listing);
}

TEST_F(ProgramRun, QuietSaysNothingAndVerboseMore) {
    EXPECT_EQ(run({"--quiet"}), "");
    const std::string input = Conversion::document("coons-allflags-withfunction.pdf");
    const auto say = [&](const std::string& option) {
        return conversion.run({input, option, "-o", "out/"}).output;
    };
    EXPECT_THAT(say("--verbose"), HasSubstr("page 1: 1 shading drawn as an image"));
    EXPECT_THAT(say("--no-index"), Not(HasSubstr("page 1: ")));
    EXPECT_THAT(say("--no-index"), HasSubstr("; 1 shading drawn as an image"));
}

TEST_F(ProgramRun, AStrangersIndexIsNotReplaced) {
    conversion.directory.write("index.html", "<p>mine</p>");
    const CommandResult result = conversion.run({"a.pdf"});
    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.output, HasSubstr("./index.html: it is not replaced"));
    EXPECT_EQ(conversion.directory.read("index.html"), "<p>mine</p>");
}

TEST_F(ProgramRun, AnIndexInProgressTakesNoName) {
    EXPECT_EQ(conversion.runShell("mkdir out; printf mine >out/index.html.part").status, 0);
    run({"-o", "out/"});
    EXPECT_EQ(conversion.directory.read("out/index.html.part"), "mine");
    EXPECT_EQ(conversion.list("out").size(), 14U);
}

TEST_F(ProgramRun, NothingStaysOfAnIndexThatCantBeWritten) {
    const std::string room = "trap '' XFSZ; ulimit -f 4; "; // for pages
    const CommandResult result = conversion.runShell(room + "$convert a.pdf -o out/");
    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.output, HasSubstr("12 pages written"));
    EXPECT_THAT(result.output, HasSubstr("out/index.html: it can't be written\n"));
    EXPECT_EQ(conversion.list("out").size(), 12U);
}

/// Returns: the files that the attributes `name` in a file of `out` refer to, as paths there.
std::vector<std::string> followReferences(const Conversion& conversion, const std::string& file,
                                          const std::string& name) {
    const std::string bytes = conversion.directory.read("out/" + file);
    const std::regex attribute(" " + name + "=\"([^\"#]+)[\"#]");
    const std::regex escape("%([0-9A-F]{2})");
    std::vector<std::string> files;
    for (std::sregex_iterator at(bytes.begin(), bytes.end(), attribute), end; at != end; ++at) {
        std::string path = (*at)[1];
        for (std::smatch found; std::regex_search(path, found, escape);) {
            const auto letter = static_cast<char>(std::stoi(found[1], nullptr, 16));
            // A percent sign that is put in place must not be read as another escape.
            path.replace(static_cast<std::size_t>(found.position()), 3, 1,
                         letter == '%' ? '\x01' : letter);
        }
        std::ranges::replace(path, '\x01', '%');
        path = std::regex_replace(path, std::regex("&amp;"), "&");
        files.push_back(path);
    }
    return files;
}

TEST_F(ProgramRun, NamesMayHoldAnything) {
    for (const std::string stem : {"a b#c%20", "pl\u00E4n \u65E5\u672C", "q?&'<>\"", "x:y"}) {
        const Conversion other;
        other.directory.write(stem + ".pdf", TinyPdf().addLinkPage(1).addLinkPage(0).write());
        EXPECT_EQ(other.run({"./" + stem + ".pdf", "-o", "out/"}).status, 0);
        EXPECT_THAT(other.list("out"),
                    UnorderedElementsAre(stem + "1.svg", stem + "2.svg", "index.html"));
        EXPECT_THAT(followReferences(other, stem + "1.svg", "xlink:href"),
                    ElementsAre(stem + "2.svg"));
        EXPECT_THAT(followReferences(other, "index.html", "data-file"),
                    ElementsAre(stem + "1.svg", stem + "2.svg"));
    }
    EXPECT_EQ(run({"--pages", "1", "-o", "file:o/"}), "a.pdf: 1 page written to file:o/a.svg\n");
    run({"--single-file", "-o", "a:b.svg"});
    EXPECT_TRUE(conversion.directory.has("a:b.svg"));
}

TEST_F(ProgramRun, TheIndexKnowsTitleAndLanguage) {
    conversion.directory.write(
        "t.pdf", "%PDF-1.4\n1 0 obj\n<</Type/Catalog/Pages 2 0 R/Lang(de-DE)/Outlines 4 0 R>>\n"
                 "endobj\n2 0 obj\n<</Type/Pages/Count 2/Kids[3 0 R 3 0 R]>>\nendobj\n"
                 "3 0 obj\n<</Type/Page/Parent 2 0 R/MediaBox[0 0 9 9]>>\nendobj\n"
                 "4 0 obj\n<</First 5 0 R>>\nendobj\n5 0 obj\n<</Title(Eins)>>\nendobj\n"
                 "6 0 obj\n<</Title(Bericht)>>\nendobj\n"
                 "trailer\n<</Root 1 0 R/Info 6 0 R>>\n");
    EXPECT_EQ(conversion.run({"t.pdf", "-o", "out/"}).status, 0);
    const std::string index = conversion.directory.read("out/index.html");
    EXPECT_THAT(index, HasSubstr("<title>Bericht</title>"));
    EXPECT_THAT(index, HasSubstr("<ul lang=\"de\">\n<li><span>Eins</span>"));
}

TEST_F(ProgramRun, SeveralDocumentsShareAnIndex) {
    conversion.directory.write("b.pdf", makePlainPdf(1));
    EXPECT_EQ(run({"b.pdf", "--pages", "1", "-o", "out/"}),
              "a.pdf: 1 page written to out/a.svg\nb.pdf: 1 page written to out/b.svg\n");
    EXPECT_THAT(conversion.list("out"), ElementsAre("a.svg", "b.svg", "index.html"));
}

/// Returns: the checksums of all that a run makes of a document of the tests.
std::string sumUp(const Conversion& conversion, const std::string& name,
                  std::vector<std::string> words) {
    words.insert(words.begin(), Conversion::document(name));
    words.insert(words.end(), {"-q", "-o", "out/"});
    EXPECT_EQ(conversion.run(words).status, 0);
    return conversion.runShell("cd out; cksum *; rm *").output;
}

TEST(Jobs, AnyNumberOfThemGivesTheSameBytes) {
    const Conversion conversion;
    for (const std::string name : {"pdflatex-outline.pdf", "habibi-rotated.pdf"}) {
        for (const std::string mode : {"outlines", "fonts", "plain"}) {
            const std::string one = sumUp(conversion, name, {"--jobs", "1", "--text", mode});
            EXPECT_EQ(sumUp(conversion, name, {"--jobs", "3", "--text", mode}), one);
            EXPECT_THAT(one, HasSubstr("index.html"));
        }
    }
}

// The pages that take for ever are drawn at the same time.
TEST(Jobs, EachIsAProcess) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", TinyPdf().addEndlessPage().addEndlessPage().write());
    for (const std::string jobs : {"1", "2"}) {
        const CommandResult result = conversion.runShell(
            "$convert a.pdf -q -o out/ --timeout 1 --jobs " + jobs +
            " 2>&1 & p=$!; sleep .5; wc -w </proc/$p/task/$p/children; wait $p");
        EXPECT_THAT(result.output, StartsWith(jobs + "\n"));
    }
}

TEST(Text, WordsChooseWhatItBecomes) {
    const Conversion conversion;
    const std::string input = Conversion::document("pdflatex-outline.pdf");
    const auto convert = [&](const std::vector<std::string>& more) {
        std::vector<std::string> words = {input, "-q", "--pages", "3", "-o", "x.svg"};
        words.insert(words.end(), more.begin(), more.end());
        EXPECT_EQ(conversion.run(words).status, 0);
        return conversion.directory.read("x.svg");
    };
    EXPECT_EQ(convert({}), convert({"--text", "outlines"}));
    EXPECT_THAT(convert({}), Not(HasSubstr("</text>")));
    EXPECT_THAT(convert({"--text", "fonts"}), HasSubstr("<glyph"));
    EXPECT_THAT(convert({"--text", "plain"}), HasSubstr("</text>"));
    EXPECT_THAT(convert({"--text", "plain"}), Not(HasSubstr("<glyph")));
}

TEST(Shadings, TheirResolutionCanBeChosen) {
    const Conversion conversion;
    const std::string input = Conversion::document("coons-allflags-withfunction.pdf");
    const auto measure = [&](const std::string& dpi) {
        EXPECT_EQ(conversion.run({input, "-q", "--shading-dpi", dpi, "-o", "x.svg"}).status, 0);
        return conversion.directory.read("x.svg").size();
    };
    EXPECT_GT(measure("200"), 2 * measure("50"));
}

TEST(Images, WordsChooseWhereTheyGo) {
    const Conversion conversion;
    const std::string input = Conversion::document("image-streams-small.pdf");
    EXPECT_EQ(conversion.run({input, "-o", "embedded/"}).status, 0);
    EXPECT_EQ(conversion.list("embedded").size(), 10U);
    EXPECT_THAT(conversion.directory.read("embedded/image-streams-small3.svg"),
                HasSubstr("href=\"data:image/"));
    EXPECT_EQ(conversion.run({input, "--images", "copy-all", "-o", "copied/"}).status, 0);
    EXPECT_GE(conversion.list("copied").size(), 19U);
    const std::string page = conversion.directory.read("copied/image-streams-small3.svg");
    EXPECT_THAT(page, Not(HasSubstr("data:")));
    EXPECT_THAT(page, HasSubstr("href=\"./image-streams-small3-1."));
}

// On purpose: linked, what lies in no file of its own is embedded.
TEST(Images, LinkedWhatLiesInNoFileOfItsOwnIsEmbedded) {
    const Conversion conversion;
    const std::string input = Conversion::document("image-streams-small.pdf");
    EXPECT_EQ(conversion.run({input, "-p", "3", "-o", "a.svg"}).status, 0);
    EXPECT_EQ(conversion.run({input, "-p", "3", "-o", "b.svg", "--images", "link"}).status, 0);
    EXPECT_EQ(conversion.directory.read("a.svg"), conversion.directory.read("b.svg"));
    EXPECT_EQ(conversion.run({input, "-p", "3", "-o", "c.svg", "--images", "copy"}).status, 0);
    EXPECT_EQ(conversion.list().size(), 4U); // the image among them
}

TEST(Images, ADocumentThatIsAnImageIsLinkedWhereItIs) {
    const Conversion conversion;
    const std::string input = Conversion::document("image-streams-small.pdf");
    EXPECT_EQ(conversion.runShell("$convert -p 3 --images copy-all -o in/page.svg " + input).status,
              0);
    EXPECT_EQ(conversion.runShell("cp in/page-1.* 'it#s.jpg'").status, 0);
    EXPECT_EQ(conversion.runShell("$convert --images link -o out/ 'it#s.jpg'").status, 0);
    const std::string page = conversion.directory.read("out/it#s.svg");
    EXPECT_THAT(page, HasSubstr("xlink:href=\"../it%23s.jpg\""));
    EXPECT_THAT(page, Not(HasSubstr("data:")));
    EXPECT_EQ(conversion.list("out").size(), 1U);
}

TEST(Images, ConversionResolutionAndQualityReachThem) {
    const Conversion conversion;
    const std::string input = Conversion::document("image-streams-small.pdf");
    const auto convert = [&](const std::vector<std::string>& more) {
        std::vector<std::string> words = {input, "--pages", "3", "-o", "x.svg"};
        words.insert(words.end(), more.begin(), more.end());
        EXPECT_EQ(conversion.run(words).status, 0);
        return conversion.directory.read("x.svg");
    };
    const std::string jpeg = convert({"--image-format", "jpg-all"});
    EXPECT_THAT(jpeg, HasSubstr("data:image/jpeg"));
    EXPECT_LT(convert({"--image-format", "jpg-all", "--quality", "5"}).size(), jpeg.size());
    EXPECT_LT(convert({"--image-format", "jpg-all", "--dpi", "5"}).size(), jpeg.size());
}

TEST(SmallDevice, PagesThatAreTooLargeAreReplaced) {
    const Conversion conversion;
    conversion.directory.write("a.pdf", TinyPdf()
                                            .addPlainPage()
                                            .addPage(std::string(500, ' ') +
                                                     [] {
                                                         std::string rects;
                                                         for (int i = 0; i < 200; ++i) {
                                                             rects +=
                                                                 std::to_string(i) + " 5 9 9 re f ";
                                                         }
                                                         return rects;
                                                     }())
                                            .write());
    conversion.directory.write("e.svg", "<svg/>");
    const CommandResult result = conversion.run(
        {"a.pdf", "--small-device", "--max-size", "2", "--error-svg", "e.svg", "-o", "out/"});
    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.output, HasSubstr("page no = 2"));
    EXPECT_THAT(conversion.directory.read("out/a1.svg"), HasSubstr("baseProfile=\"tiny\""));
    EXPECT_EQ(conversion.directory.read("out/a2.svg"), "<svg/>");
}

} // namespace
} // namespace DrawmereTest
