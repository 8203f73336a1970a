#include "tools/convert/OutputNames.h"

#include "Drawmere.h"
#include "tests/convert/Conversion.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereConvert::OutputNames;
using DrawmereConvert::RunOptions;

RunOptions writeTo(const std::string& output) {
    RunOptions options;
    options.output = output;
    return options;
}

TEST(OutputNames, PageNumbersHaveAsManyDigitsAsTheLast) {
    EXPECT_EQ(OutputNames(writeTo("out/"), "a/report.pdf", 9).getPageFile(2, false), "report3.svg");
    EXPECT_EQ(OutputNames(writeTo("out/"), "a/report.pdf", 10).getPageFile(2, false),
              "report03.svg");
    EXPECT_EQ(OutputNames(writeTo("out/"), "a/report.pdf", 1000).getPageFile(2, false),
              "report0003.svg");
}

TEST(OutputNames, ASinglePageHasNoNumberUnlessItIsKept) {
    RunOptions options = writeTo("out/");
    EXPECT_EQ(OutputNames(options, "report.pdf", 10).getPageFile(2, true), "report.svg");
    options.keepNumber = true;
    EXPECT_EQ(OutputNames(options, "report.pdf", 10).getPageFile(2, true), "report03.svg");
}

TEST(OutputNames, AFileLendsItsNameAndADirectoryDoesNot) {
    const OutputNames file(writeTo("some/where/page.svg"), "report.pdf", 3);
    EXPECT_EQ(file.getDirectory(), "./some/where/");
    EXPECT_EQ(file.getPageFile(0, false), "page1.svg");
    EXPECT_EQ(file.getWholeFile(), "page.svg");
    const OutputNames directory(writeTo("/some/where/"), "report.pdf", 3);
    EXPECT_EQ(directory.getDirectory(), "/some/where/");
    EXPECT_EQ(directory.getPageFile(0, false), "report1.svg");
    EXPECT_EQ(OutputNames(writeTo(""), "a/report.pdf", 3).getDirectory(), "./");
    EXPECT_EQ(OutputNames(writeTo("page"), "report.pdf", 3).getPageFile(0, false), "page1.svg");
}

TEST(OutputNames, CompressedPagesSayItInTheirNames) {
    RunOptions options = writeTo("out/");
    options.gzip = true;
    EXPECT_EQ(OutputNames(options, "report.pdf", 3).getPageFile(0, false), "report1.svgz");
    options.output = "page.svg";
    EXPECT_EQ(OutputNames(options, "report.pdf", 3).getPageFile(0, false), "page1.svg");
}

// A directory like this would be the scheme of a URI.
TEST(OutputNames, ADirectoryIsNeverTakenForAUri) {
    EXPECT_EQ(OutputNames(writeTo("file:x/y.svg"), "report.pdf", 3).getDirectory(), "./file:x/");
}

TEST(OutputNames, ReferencesHaveEscapesWhereCharactersHaveAMeaning) {
    EXPECT_EQ(OutputNames::toReference("a b#c%d?e:f.svg"), "a%20b%23c%25d%3Fe%3Af.svg");
    EXPECT_EQ(OutputNames::toReference("pl\xC3\xA4n-1_(2).svg"), "pl\xC3\xA4n-1_(2).svg");
}

TEST(OutputNames, TheLibraryNamesItsFilesTheSame) {
    for (const char* const format : {"", "1", "0001", "a", "A", "i", "I", "-1-"}) {
        RunOptions options = writeTo("out/page.svg");
        options.numberFormat = format;
        const OutputNames names(options, "report.pdf", 250);
        DrawmereNS::SVGConfig config;
        DrawmereNS::SVGPageUri uri(u"out/page.svg",
                                   UnicodeString::fromUTF8(names.getNumberFormat()));
        DrawmereNS::Drawmere drawmere(&config, &uri);
        drawmere.initRootSvg(UnicodeString());
        drawmere.startPage(42, MoxCommonNS::MoxRectT<MoxCommonNS::MoxLength>());
        std::string file;
        EXPECT_EQ(names.getPageFile(41, false), drawmere.pageFiles.at(42).toUTF8String(file));
    }
}

} // namespace
} // namespace DrawmereTest
