#include "tools/convert/IndexPage.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <regex>

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
    EXPECT_THAT(
        page,
        HasSubstr(
            "<section id=\"p1\" role=\"group\" aria-label=\"Page 1\" style=\"--w:200;--h:100\" data-file=\"a1.svg\">"));
    EXPECT_THAT(
        page,
        HasSubstr(
            "<section id=\"p2\" role=\"group\" aria-label=\"Page 2\" style=\"--w:50.5;--h:100\" data-file=\"a3.svg\">"));
}

TEST(IndexPage, LinksLieWhereTheyAreOnThePage) {
    IndexDocument document = makeDocument("a");
    document.entries[0].links = {{20, 10, 100, 5, "a3.svg"}};
    EXPECT_THAT(
        makeIndexPage({document}),
        HasSubstr(
            "<a href=\"#p2\" style=\"left:10%;top:10%;width:50%;height:5%\" aria-label=\"Page 2\"></a>"));
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
    EXPECT_THAT(
        makeIndexPage({document}),
        HasSubstr(
            "<nav aria-label=\"Outline\">\n<ul>\n<li><a href=\"#p1\">One &lt;&amp;</a>\n<ul>\n"
            "<li><a href=\"#p2\">Below</a>\n<li><span>Missing</span>\n</ul>\n"
            "<li><a href=\"#p2\">Two</a>\n</ul>\n</nav>"));
}

TEST(IndexPage, AnOutlineIsInTheLanguageOfItsDocument) {
    IndexDocument document = makeDocument("a");
    document.language = "de";
    document.outline = {{"Eins", 0, 0}, {"Zwei", 0, 1}};
    EXPECT_THAT(makeIndexPage({document}), HasSubstr("<ul lang=\"de\">\n<li><a href=\"#p1\">Eins"
                                                     "</a>\n<ul>\n<li>"));
}

TEST(IndexPage, WithoutAnOutlineThereIsNoPlaceForOne) {
    EXPECT_THAT(makeIndexPage({makeDocument("a")}), Not(HasSubstr("<nav")));
}

TEST(IndexPage, SeveralDocumentsAreChaptersOfIt) {
    EXPECT_THAT(
        makeIndexPage({makeDocument("a"), makeDocument("b")}),
        HasSubstr("<nav aria-label=\"Outline\">\n<ul>\n<li><a href=\"#p1\">Title of a</a>\n</ul>\n"
                  "<ul>\n<li><a href=\"#p3\">Title of b</a>\n</ul>\n</nav>"));
}

TEST(IndexPage, EverythingHasAName) {
    IndexDocument document = makeDocument("a");
    document.entries[0].links = {{0, 0, 1, 1, "https://www.example.com/?a&b"}};
    document.outline = {{"One", 0, 0}};
    const std::string page = makeIndexPage({document});
    EXPECT_THAT(page, HasSubstr("<html lang=\"en\">"));
    EXPECT_THAT(page, HasSubstr("aria-label=\"https://www.example.com/?a&amp;b\"></a>"));
    EXPECT_THAT(page, HasSubstr("<main tabindex=\"0\" aria-label=\"Pages\">"));
    const std::regex nameless(
        "<(button|input|nav)(?![^>]*aria-label)|<a(?![^>]*aria-label)[^>]*></a>");
    EXPECT_FALSE(std::regex_search(page, nameless));
}

TEST(IndexPage, WithoutScriptsItIsAListOfPages) {
    EXPECT_THAT(makeIndexPage({makeDocument("a")}),
                HasSubstr("<noscript><ol>\n<li><a href=\"a1.svg\">Title of a, page 1</a>\n"
                          "<li><a href=\"a3.svg\">Title of a, page 3</a>\n</ol></noscript>"));
}

TEST(IndexPage, ItsPaperHoldsTheLargestPage) {
    IndexDocument document = makeDocument("a");
    document.entries[1].size = {50, 300};
    EXPECT_THAT(makeIndexPage({document}), HasSubstr("@page { margin: 0; size: 200pt 300pt; }"));
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
