#include "tools/convert/IndexPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using namespace DrawmereConvert; // NOLINT(google-build-using-namespace): the subject
using testing::HasSubstr;
using testing::Not;

IndexDocument makeDocument(const std::string& name) {
    IndexDocument document;
    document.title = "Title of " + name;
    document.entries = {{name + "1.svg", 0, {200, 100}, {}, {{"there", 25}}},
                        {name + "3.svg", 2, {50.5F, 100}, {}, {}}};
    return document;
}

TEST(IndexPage, EveryPageHasAPlaceOfItsSize) {
    const std::string page = makeIndexPage({makeDocument("a")});
    EXPECT_TRUE(isIndexPage(page));
    EXPECT_THAT(page, HasSubstr("<title>Title of a</title>"));
    EXPECT_THAT(page,
                HasSubstr("<section id=\"p1\" style=\"--w:200;--h:100\" data-file=\"a1.svg\">"));
    EXPECT_THAT(page,
                HasSubstr("<section id=\"p2\" style=\"--w:50.5;--h:100\" data-file=\"a3.svg\">"));
}

TEST(IndexPage, LinksLieWhereTheyAreOnThePage) {
    IndexDocument document = makeDocument("a");
    document.entries[0].links = {{20, 10, 100, 5, "a3.svg"}};
    EXPECT_THAT(makeIndexPage({document}),
                HasSubstr("<a href=\"#p2\" style=\"left:10%;top:10%;width:50%;height:5%\"></a>"));
}

TEST(IndexPage, LinksLeadToPagesAndPlacesOfTheIndex) {
    IndexDocument document = makeDocument("a");
    document.entries[1].links = {{0, 0, 1, 1, "a1.svg#there"}, {0, 0, 1, 1, "#own"}};
    const std::string page = makeIndexPage({document});
    EXPECT_THAT(page, HasSubstr("<i id=\"p1.there\" style=\"top:25%\"></i>"));
    EXPECT_THAT(page, HasSubstr("<a href=\"#p1.there\" style"));
    EXPECT_THAT(page, HasSubstr("<a href=\"#p2.own\" style"));
}

TEST(IndexPage, OtherPlacesOpenBesideItAndProgramsAreLeftOut) {
    IndexDocument document = makeDocument("a");
    document.entries[0].links = {{0, 0, 1, 1, "https://www.example.com/?a=1&b=2"},
                                 {0, 0, 1, 1, "javascript:alert(1)"},
                                 {0, 0, 1, 1, "data:text/html,x"}};
    const std::string page = makeIndexPage({document});
    EXPECT_THAT(page,
                HasSubstr("<a href=\"https://www.example.com/?a=1&amp;b=2\" target=\"_blank\" "
                          "rel=\"noopener\""));
    EXPECT_THAT(page, Not(HasSubstr("javascript:")));
    EXPECT_THAT(page, Not(HasSubstr("data:")));
}

TEST(IndexPage, TheOutlineIsNestedAndLeadsToPagesThatAreThere) {
    IndexDocument document = makeDocument("a");
    document.outline = {{"One <&", 0, 0}, {"Below", 2, 1}, {"Missing", 1, 1}, {"Two", 2, 0}};
    EXPECT_THAT(makeIndexPage({document}),
                HasSubstr("<nav>\n<ul>\n<li><a href=\"#p1\">One &lt;&amp;</a>\n<ul>\n"
                          "<li><a href=\"#p2\">Below</a>\n<li><span>Missing</span>\n</ul>\n"
                          "<li><a href=\"#p2\">Two</a>\n</ul>\n</nav>"));
}

TEST(IndexPage, WithoutAnOutlineThereIsNoPlaceForOne) {
    EXPECT_THAT(makeIndexPage({makeDocument("a")}), Not(HasSubstr("<nav>")));
}

TEST(IndexPage, SeveralDocumentsAreChaptersOfIt) {
    EXPECT_THAT(makeIndexPage({makeDocument("a"), makeDocument("b")}),
                HasSubstr("<nav>\n<ul>\n<li><a href=\"#p1\">Title of a</a>\n</ul>\n"
                          "<ul>\n<li><a href=\"#p3\">Title of b</a>\n</ul>\n</nav>"));
}

TEST(IndexPage, NothingComesFromElsewhere) {
    const std::string page = makeIndexPage({makeDocument("a")});
    EXPECT_THAT(page, Not(HasSubstr("http")));
    EXPECT_THAT(page, Not(HasSubstr("<script src")));
    EXPECT_THAT(page, Not(HasSubstr("@import")));
}

TEST(IndexPage, OtherFilesAreNotTakenForIt) {
    EXPECT_FALSE(isIndexPage("<!DOCTYPE html><title>My own page</title>"));
    EXPECT_FALSE(isIndexPage(""));
}

} // namespace
} // namespace DrawmereTest
