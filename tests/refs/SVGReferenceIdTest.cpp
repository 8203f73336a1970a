#include "refs/SVGReferenceId.h"

#include "foundation/common/MoxDocument.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>
#include <utility>

using namespace DrawmereNS;
using DrawmereTest::utf8;
using MoxCommonNS::MoxDocument;
using MoxCommonNS::MoxName;
using MoxCommonNS::MoxPtr;
using MoxCommonNS::MoxValue;

namespace {

MoxName name(const char16_t* text) { return MoxName(UnicodeString(text)); }

std::string attribute(const MoxElement* element, const char16_t* key) {
    return utf8(element->getAttribute(name(key)).toString());
}

std::string href(const MoxElement* link) { return attribute(link, u"xlink:href"); }

/// A document under an `svg` element, and what its links are solved with: "here" is on page 3,
/// "there" on page 7, "lost" on page 9, which has no file.
class SVGReferenceIdTest : public testing::Test {
protected:
    SVGReferenceIdTest() {
        const MoxPtr<MoxElement> svg = document->createElement(name(u"svg"));
        document->appendChild(svg.get());
        root = svg.get();
        solver.setRefernceIdInfo(false, anchors, pages, files);
    }

    MoxElement* add(MoxElement* parent, const char16_t* tag) {
        const MoxPtr<MoxElement> element = document->createElement(name(tag));
        parent->appendChild(element.get());
        return element.get();
    }

    MoxElement* addLink(MoxElement* parent, const UnicodeString& target) {
        MoxElement* link = add(parent, u"a");
        link->setAttribute(name(u"xlink:href"), MoxValue(target));
        return link;
    }

    MoxElement* addAnchor(MoxElement* parent, int page) {
        MoxElement* text = add(parent, u"text");
        text->setAttribute(name(u"id"), SVGReferenceId::getPageReferenceMark(page));
        return text;
    }

    bool isSolved() const { return solver.isSolvedReferenceId(3, root); }

    std::string destination(const char16_t* reference) const {
        return utf8(solver.getDestination(reference));
    }

    MoxPtr<MoxDocument> document = new MoxDocument;
    MoxElement* root = nullptr;
    std::set<UnicodeString> anchors = {u"here", u"there", u"lost"};
    std::map<UnicodeString, int> pages = {{u"here", 3}, {u"there", 7}, {u"lost", 9}};
    std::map<int, UnicodeString> files = {{3, u"out3.svg"}, {7, u"out7.svg"}};
    SVGReferenceId solver;
};

} // namespace

TEST(SVGReferenceId, MarkOfAPageIsItsPrefixAndNumber) {
    EXPECT_EQ(utf8(SVGReferenceId::getPageReferenceMark(12)), "Mox-SVG-page-12");
    EXPECT_EQ(utf8(SVGReferenceId::getPageReferenceMark(0)), "Mox-SVG-page-0");
    EXPECT_EQ(utf8(SVGReferenceId::getPageReferenceMark(-1)), "Mox-SVG-page--1");
}

TEST(SVGReferenceId, MarkIsKnownByItsPrefix) {
    EXPECT_TRUE(SVGReferenceId::isPageReferenceId(u"Mox-SVG-page-12"));
    EXPECT_TRUE(SVGReferenceId::isPageReferenceId(u"Mox-SVG-page-"));
    EXPECT_TRUE(SVGReferenceId::isPageReferenceId(u"Mox-SVG-page-x"));
    EXPECT_FALSE(SVGReferenceId::isPageReferenceId(u"Mox-SVG-page"));
    EXPECT_FALSE(SVGReferenceId::isPageReferenceId(u"mox-svg-page-12"));
    EXPECT_FALSE(SVGReferenceId::isPageReferenceId(u"#Mox-SVG-page-12"));
    EXPECT_FALSE(SVGReferenceId::isPageReferenceId(u""));
}

TEST(SVGReferenceId, InternalDestinationBeginsWithItsSign) {
    EXPECT_TRUE(SVGReferenceId::isInternalDestination(u"#here"));
    EXPECT_TRUE(SVGReferenceId::isInternalDestination(u"#"));
    EXPECT_FALSE(SVGReferenceId::isInternalDestination(u""));
    EXPECT_FALSE(SVGReferenceId::isInternalDestination(u"a#here"));
    EXPECT_FALSE(SVGReferenceId::isInternalDestination(u"Mox-SVG-page-12"));
}

TEST(SVGReferenceId, DestinationIdLosesItsSign) {
    EXPECT_EQ(utf8(SVGReferenceId::getDestinationId(u"#here")), "here");
    EXPECT_EQ(utf8(SVGReferenceId::getDestinationId(u"#")), "");
    EXPECT_EQ(utf8(SVGReferenceId::getDestinationId(u"##a")), "#a");
    EXPECT_EQ(utf8(SVGReferenceId::getDestinationId(u"here")), "here");
    EXPECT_EQ(utf8(SVGReferenceId::getDestinationId(u"Mox-SVG-page-12")), "Mox-SVG-page-12");
    EXPECT_EQ(utf8(SVGReferenceId::getDestinationId(u"")), "");
}

TEST(SVGReferenceId, PageNumberIsReadFromTheMark) {
    const SVGReferenceId solver;
    EXPECT_EQ(solver.getReferencePageNo(u"Mox-SVG-page-12"), 12);
    EXPECT_EQ(solver.getReferencePageNo(u"Mox-SVG-page--4"), -4);
    EXPECT_EQ(solver.getReferencePageNo(u"Mox-SVG-page-"), 0);
    EXPECT_EQ(solver.getReferencePageNo(u"Mox-SVG-page-x"), 0);
    EXPECT_EQ(solver.getReferencePageNo(u"short"), 0);
}

TEST(SVGReferenceId, FinalIdOfAPageIsShort) {
    const SVGReferenceId solver;
    EXPECT_EQ(utf8(solver.getInternalPageRefernceId(u"Mox-SVG-page-12")), "p12");
    EXPECT_EQ(utf8(solver.getInternalPageRefernceId(u"Mox-SVG-page-")), "p");
}

TEST(SVGReferenceId, WithoutBooksNoDestinationIsKnown) {
    SVGReferenceId solver;
    EXPECT_TRUE(solver.isSolvedId(u"a.svg"));
    EXPECT_FALSE(solver.isSolvedId(u"#here"));
    EXPECT_EQ(utf8(solver.getDestination(u"#here")), "#here");
    EXPECT_EQ(solver.currentPage, 0);
}

TEST_F(SVGReferenceIdTest, IdIsSolvedWhenItsPageHasAFile) {
    EXPECT_TRUE(solver.isSolvedId(u"#here"));
    EXPECT_TRUE(solver.isSolvedId(u"#there"));
    EXPECT_FALSE(solver.isSolvedId(u"#lost"));
    EXPECT_FALSE(solver.isSolvedId(u"#unknown"));
    EXPECT_FALSE(solver.isSolvedId(u"#"));
}

TEST_F(SVGReferenceIdTest, WhatIsNoInternalDestinationIsSolved) {
    EXPECT_TRUE(solver.isSolvedId(u""));
    EXPECT_TRUE(solver.isSolvedId(u"http://www.example.com/#a"));
    EXPECT_TRUE(solver.isSolvedId(u"Mox-SVG-page-99"));
}

TEST_F(SVGReferenceIdTest, IdOnTheCurrentPageNeedsNoFile) {
    solver.currentPage = 9;
    EXPECT_TRUE(solver.isSolvedId(u"#lost"));
}

TEST_F(SVGReferenceIdTest, EmptyIdIsSolvedOnceItIsDeclared) {
    pages[u""] = 3;
    EXPECT_TRUE(solver.isSolvedId(u"#"));
}

TEST_F(SVGReferenceIdTest, BooksAreReadWhereTheyAre) {
    EXPECT_FALSE(solver.isSolvedId(u"#later"));
    pages[u"later"] = 8;
    files[8] = u"out8.svg";
    EXPECT_TRUE(solver.isSolvedId(u"#later"));
}

template <typename Anchors, typename Pages, typename Files>
constexpr bool canBorrow = requires(SVGReferenceId solver, Anchors&& anchors, Pages&& pages,
                                    Files&& files) {
    solver.setRefernceIdInfo(true, std::forward<Anchors>(anchors), std::forward<Pages>(pages),
                             std::forward<Files>(files));
};

TEST_F(SVGReferenceIdTest, NoBookMayBeATemporary) {
    using Anchors = std::set<UnicodeString>;
    using Pages = std::map<UnicodeString, int>;
    using Files = std::map<int, UnicodeString>;
    EXPECT_TRUE((canBorrow<Anchors&, const Pages&, Files&>));
    EXPECT_FALSE((canBorrow<Anchors, Pages&, Files&>));
    EXPECT_FALSE((canBorrow<Anchors&, Pages, Files&>));
    EXPECT_FALSE((canBorrow<Anchors&, Pages&, Files>));
    EXPECT_FALSE((canBorrow<Anchors, Pages, Files>));
}

TEST_F(SVGReferenceIdTest, InOneFileEverythingIsSolvedAndNothingRewritten) {
    solver.setRefernceIdInfo(true, anchors, pages, files);
    EXPECT_TRUE(solver.isSolvedId(u"#unknown"));
    EXPECT_EQ(destination(u"#there"), "#there");
    EXPECT_EQ(destination(u"#unknown"), "#unknown");
}

TEST_F(SVGReferenceIdTest, DestinationOnAnotherPageIsItsFileAlone) {
    solver.currentPage = 3;
    EXPECT_EQ(destination(u"#there"), "out7.svg");
    EXPECT_EQ(destination(u"#here"), "#here");
    EXPECT_EQ(destination(u"#lost"), "#lost");
    EXPECT_EQ(destination(u"#unknown"), "#unknown");
    EXPECT_EQ(destination(u"#"), "#");
    EXPECT_EQ(destination(u"a.svg"), "a.svg");
    EXPECT_EQ(destination(u""), "");
    EXPECT_EQ(destination(u"Mox-SVG-page-7"), "Mox-SVG-page-7");
}

// On purpose: "#" and the mark of a page is an id like any other.
TEST_F(SVGReferenceIdTest, MarkBehindASignIsAnIdLikeAnyOther) {
    EXPECT_FALSE(solver.isSolvedId(u"#Mox-SVG-page-7"));
    EXPECT_EQ(destination(u"#Mox-SVG-page-7"), "#Mox-SVG-page-7");
    pages[u"Mox-SVG-page-7"] = 7;
    EXPECT_TRUE(solver.isSolvedId(u"#Mox-SVG-page-7"));
    EXPECT_EQ(destination(u"#Mox-SVG-page-7"), "out7.svg");
}

TEST_F(SVGReferenceIdTest, NothingIsSolvedAndPassedOver) {
    EXPECT_TRUE(solver.isSolvedReferenceId(3, nullptr));
    solver.solveReferenceId(3, nullptr);
    EXPECT_EQ(solver.currentPage, 0);
}

TEST_F(SVGReferenceIdTest, PageWithExternalLinksAloneIsSolved) {
    EXPECT_TRUE(isSolved());
    addLink(root, u"http://www.example.com/");
    addLink(root, u"Mox-SVG-page-99");
    add(root, u"a"); // no reference at all
    EXPECT_TRUE(isSolved());
}

TEST_F(SVGReferenceIdTest, OneOpenLinkAnywhereLeavesThePageUnsolved) {
    MoxElement* group = add(add(root, u"g"), u"g");
    addLink(group, u"#there");
    EXPECT_TRUE(isSolved());
    MoxElement* outer = addLink(group, u"http://www.example.com/");
    addLink(add(outer, u"g"), u"#unknown");
    add(root, u"rect");
    EXPECT_FALSE(isSolved());
}

TEST_F(SVGReferenceIdTest, OpenLinkAtTheRootItselfCounts) {
    MoxElement* link = addLink(root, u"#unknown");
    addLink(root, u"#there");
    EXPECT_FALSE(solver.isSolvedReferenceId(3, link));
    EXPECT_TRUE(solver.isSolvedReferenceId(3, SVGReferenceIdTest::add(root, u"g")));
}

TEST_F(SVGReferenceIdTest, OnlyLinksAreAskedForReferences) {
    add(root, u"use")->setAttribute(name(u"xlink:href"), MoxValue(u"#unknown"));
    EXPECT_TRUE(isSolved());
}

TEST_F(SVGReferenceIdTest, ReferenceIsReadFromNamesAndTextsAlone) {
    MoxElement* link = addLink(root, u"");
    link->setAttribute(name(u"xlink:href"), MoxValue(name(u"#unknown")));
    EXPECT_FALSE(isSolved());
    link->setAttribute(name(u"xlink:href"), MoxValue(12));
    EXPECT_TRUE(isSolved());
    solver.solveReferenceId(3, root);
    EXPECT_EQ(href(link), "12");
}

// On purpose: a text between two elements ends the row of siblings.
TEST_F(SVGReferenceIdTest, TextBetweenElementsEndsTheWalk) {
    root->appendChildText(u"first"); // the walk to the first child passes over it
    addAnchor(root, 3);
    MoxElement* seen = addLink(root, u"#there");
    root->appendChildText(u"between");
    MoxElement* unseen = addLink(root, u"#there");
    MoxElement* unsolved = addLink(root, u"#unknown");
    EXPECT_TRUE(isSolved());
    solver.solveReferenceId(3, root);
    EXPECT_EQ(href(seen), "out7.svg");
    EXPECT_EQ(href(unseen), "#there");
    EXPECT_EQ(href(unsolved), "#unknown");
}

TEST_F(SVGReferenceIdTest, SolvingRewritesLinksToOtherPages) {
    MoxElement* anchor = addAnchor(root, 3);
    MoxElement* group = add(root, u"g");
    MoxElement* there = addLink(group, u"#there");
    MoxElement* here = addLink(group, u"#here");
    MoxElement* outside = addLink(root, u"http://www.example.com/");
    MoxElement* byPage = addLink(root, u"Mox-SVG-page-7");
    solver.solveReferenceId(3, root);
    EXPECT_EQ(attribute(anchor, u"id"), "p3");
    EXPECT_EQ(href(there), "out7.svg");
    EXPECT_EQ(href(here), "#here");
    EXPECT_EQ(href(outside), "http://www.example.com/");
    EXPECT_EQ(href(byPage), "Mox-SVG-page-7");
    EXPECT_EQ(solver.currentPage, 3);
}

TEST_F(SVGReferenceIdTest, UnsolvedLinkStaysAndSoDoesAllInsideIt) {
    MoxElement* open = addLink(root, u"#unknown");
    MoxElement* inside = addLink(add(open, u"g"), u"#there");
    MoxElement* anchorInside = addAnchor(open, 4);
    MoxElement* behind = addLink(root, u"#there");
    solver.solveReferenceId(3, root);
    EXPECT_EQ(href(open), "#unknown");
    EXPECT_EQ(href(inside), "#there");
    EXPECT_EQ(attribute(anchorInside, u"id"), "Mox-SVG-page-4");
    EXPECT_EQ(href(behind), "out7.svg");
}

TEST_F(SVGReferenceIdTest, LinkInsideASolvedLinkIsSolvedToo) {
    MoxElement* outer = addLink(root, u"#there");
    MoxElement* inner = addLink(outer, u"#there");
    solver.solveReferenceId(3, root);
    EXPECT_EQ(href(outer), "out7.svg");
    EXPECT_EQ(href(inner), "out7.svg");
}

TEST_F(SVGReferenceIdTest, EachPageAnchorSetsThePageForWhatFollows) {
    MoxElement* before = addLink(root, u"#here");
    addAnchor(root, 3);
    MoxElement* onThree = addLink(root, u"#here");
    addAnchor(add(root, u"g"), 7);
    MoxElement* onSeven = addLink(root, u"#here");
    MoxElement* alsoOnSeven = addLink(root, u"#there");
    solver.solveReferenceId(3, root);
    EXPECT_EQ(href(before), "out3.svg");
    EXPECT_EQ(href(onThree), "#here");
    EXPECT_EQ(href(onSeven), "out3.svg");
    EXPECT_EQ(href(alsoOnSeven), "#there");
    EXPECT_EQ(solver.currentPage, 7);
}

TEST_F(SVGReferenceIdTest, PageOfOneDocumentHoldsUntilTheFirstAnchorOfTheNext) {
    MoxElement* first = add(root, u"g");
    addAnchor(first, 7);
    MoxElement* second = add(root, u"g");
    MoxElement* before = addLink(second, u"#there");
    addAnchor(second, 3);
    MoxElement* behind = addLink(second, u"#there");
    solver.solveReferenceId(7, first);
    solver.solveReferenceId(3, second);
    EXPECT_EQ(href(before), "#there");
    EXPECT_EQ(href(behind), "out7.svg");
}

TEST_F(SVGReferenceIdTest, CheckDoesNotLookForPageAnchors) {
    addAnchor(root, 9);
    addLink(root, u"#lost");
    EXPECT_FALSE(isSolved());
    EXPECT_EQ(solver.currentPage, 0);
}

TEST_F(SVGReferenceIdTest, TextsWithOtherIdsStay) {
    MoxElement* text = add(root, u"text");
    text->setAttribute(name(u"id"), MoxValue(u"here"));
    MoxElement* group = add(root, u"g");
    group->setAttribute(name(u"id"), MoxValue(u"Mox-SVG-page-5"));
    add(root, u"text");
    solver.solveReferenceId(3, root);
    EXPECT_EQ(attribute(text, u"id"), "here");
    EXPECT_EQ(attribute(group, u"id"), "Mox-SVG-page-5");
    EXPECT_EQ(solver.currentPage, 0);
}

TEST_F(SVGReferenceIdTest, MarkWithoutANumberIsPageZero) {
    solver.currentPage = 3;
    MoxElement* text = add(root, u"text");
    text->setAttribute(name(u"id"), MoxValue(u"Mox-SVG-page-"));
    solver.solveReferenceId(3, root);
    EXPECT_EQ(attribute(text, u"id"), "p");
    EXPECT_EQ(solver.currentPage, 0);
}

TEST_F(SVGReferenceIdTest, InOneFileAnchorsGetTheirFinalIds) {
    solver.setRefernceIdInfo(true, anchors, pages, files);
    MoxElement* one = addAnchor(root, 1);
    MoxElement* two = addAnchor(root, 2);
    MoxElement* link = addLink(root, u"#unknown");
    EXPECT_TRUE(isSolved());
    solver.solveReferenceId(1, root);
    EXPECT_EQ(attribute(one, u"id"), "p1");
    EXPECT_EQ(attribute(two, u"id"), "p2");
    EXPECT_EQ(href(link), "#unknown");
}

TEST_F(SVGReferenceIdTest, WalkStaysBelowItsRoot) {
    MoxElement* group = add(root, u"g");
    MoxElement* inside = addLink(group, u"#there");
    MoxElement* outside = addLink(root, u"#there");
    solver.solveReferenceId(3, group);
    EXPECT_EQ(href(inside), "out7.svg");
    EXPECT_EQ(href(outside), "#there");
}

TEST_F(SVGReferenceIdTest, DeepTreeIsNoMatterOfTheStack) {
    MoxElement* deepest = root;
    for (int i = 0; i < 200000; ++i) {
        deepest = add(deepest, u"g");
    }
    MoxElement* link = addLink(deepest, u"#there");
    EXPECT_TRUE(isSolved());
    solver.solveReferenceId(3, root);
    EXPECT_EQ(href(link), "out7.svg");
}
