#include "tests/convert/Conversion.h"
#include "tests/convert/TinyPdf.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using testing::HasSubstr;
using testing::Not;

/// A document with a table of contents, whose entries lead into later pages.
struct LinkedPages : testing::Test {
    void convert(std::vector<std::string> words) const {
        words.insert(words.begin(), Conversion::document("pdflatex-outline.pdf"));
        EXPECT_EQ(conversion.run(words).status, 0);
    }

    Conversion conversion;
};

using LinkWriter = LinkedPages;

TEST_F(LinkWriter, ALinkToAnotherPageHasItsFileAndThePlaceThere) {
    convert({"-o", "out/p.svg"});
    EXPECT_THAT(conversion.directory.read("out/p1.svg"),
                HasSubstr("<a xlink:href=\"p2.svg#dest-2-125-126\">"));
    EXPECT_THAT(conversion.directory.read("out/p2.svg"),
                HasSubstr("<text id=\"dest-2-125-126\"/>"));
}

TEST_F(LinkWriter, ThePlaceOfADestinationIsThatOfItsGroup) {
    convert({"-o", "out/p.svg"});
    EXPECT_THAT(conversion.directory.read("out/p2.svg"),
                HasSubstr("<g transform=\"translate(124.802,125.798035)\">"
                          "<g transform=\"translate(0)\"><text id=\"dest-2-125-126\"/>"));
}

TEST_F(LinkWriter, AViewLiesWhereItsRectangleIsOnThePage) {
    const std::string link = "<</Type/Annot/Subtype/Link/Rect[1 1 9 9]/Dest[";
    const std::string places = " 0 R/FitR 10 20 40 90]>>"; // of objects 19 and 21
    conversion.directory.write(
        "a.pdf", TinyPdf()
                     .addPage("", "/Annots[" + link + "19" + places + link + "21" + places + "]")
                     .addPage("10 20 30 70 re f")
                     .addPage("10 20 30 70 re f", "/Rotate 90/CropBox[10 10 150 90]")
                     .write());
    EXPECT_EQ(conversion.run({"a.pdf", "-o", "out/"}).status, 0);
    EXPECT_THAT(conversion.directory.read("out/a1.svg"),
                HasSubstr("<a xlink:href=\"a2.svg#view-2-10-10-30-70\">"));
    EXPECT_THAT(conversion.directory.read("out/a2.svg"),
                HasSubstr("<view viewBox=\"10 10 30 70\" id=\"view-2-10-10-30-70\"/>"));
    EXPECT_THAT(conversion.directory.read("out/a3.svg"),
                HasSubstr("<view viewBox=\"10 0 70 30\" id=\"view-3-10-0-70-30\"/>"));
}

TEST_F(LinkWriter, ALinkIsATransparentRectangle) {
    convert({"-o", "out/p.svg"});
    EXPECT_THAT(conversion.directory.read("out/p1.svg"),
                HasSubstr("<a xlink:href=\"p2.svg#dest-2-125-126\"><g fill-opacity=\"0\"><rect"));
}

TEST_F(LinkWriter, InASingleFileLinksStayInside) {
    convert({"-o", "all.svg", "--single-file"});
    const std::string all = conversion.directory.read("all.svg");
    EXPECT_THAT(all, HasSubstr("<a xlink:href=\"#dest-2-125-126\">"));
    EXPECT_THAT(all, HasSubstr("<text id=\"dest-2-125-126\"/>"));
}

TEST_F(LinkWriter, ALinkToAPageThatIsNotConvertedIsNone) {
    const CommandResult result = conversion.run(
        {Conversion::document("pdflatex-outline.pdf"), "-o", "out/p.svg", "--pages", "1,3"});
    EXPECT_THAT(result.output, HasSubstr(" left out"));
    const std::string page = conversion.directory.read("out/p1.svg");
    EXPECT_THAT(page, HasSubstr("p3.svg#"));
    EXPECT_THAT(page, Not(HasSubstr("p2.svg#")));
}

TEST_F(LinkWriter, ALinkOutOfTheDocumentIsTakenOver) {
    EXPECT_EQ(
        conversion.run({Conversion::document("LinkAnnot-appearances.pdf"), "-o", "p.svg"}).status,
        0);
    EXPECT_THAT(conversion.directory.read("p.svg"),
                HasSubstr("<a xlink:href=\"https://pdfa.org\">"));
}

TEST_F(LinkWriter, ALinkToAScriptIsNone) {
    conversion.directory.write("a.html", "<html><body><p><a href='javascript:alert(1)'>1</a> "
                                         "<a href='JavaScript:alert(2)'>2</a> "
                                         "<a href='MAILTO:a@example.com'>3</a> "
                                         "<a href='tel:0123'>4</a></p></body></html>");
    const CommandResult result = conversion.run({"a.html", "-o", "a.svg"});
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.output, HasSubstr("; 2 links left out"));
    const std::string page = conversion.directory.read("a.svg");
    EXPECT_THAT(page, Not(HasSubstr("cript:alert")));
    EXPECT_THAT(page, HasSubstr("<a xlink:href=\"MAILTO:a@example.com\">"));
    EXPECT_THAT(page, HasSubstr("<a xlink:href=\"tel:0123\">"));
}

} // namespace
} // namespace DrawmereTest
