// The life of a run up to its end: opening documents, pages and their names, profiles.
#include "Drawmere.h"

#include "draw/SVGBasicImpl.h"
#include "draw/SVGFullImpl.h"
#include "draw/SVGPlazmicImpl.h"
#include "draw/SVGTinyImpl.h"
#include "tests/frontend/RunFiles.h"

#include <gtest/gtest.h>

#include <limits>
#include <memory>
#include <typeinfo>

namespace DrawmereTest {
namespace {

/// Counts its deaths.
class MortalImpl : public DrawmereImpl {
public:
    MortalImpl(SVGConfig* options, int* counter) : DrawmereImpl(options), deaths(counter) {}

    ~MortalImpl() override { ++*deaths; }

private:
    int* deaths; // borrowed
};

TEST(Drawmere, StartsWithoutADocumentAndTouchesNeitherArgument) {
    const Drawmere drawmere(nullptr, nullptr);
    EXPECT_EQ(drawmere.config, nullptr);
    EXPECT_EQ(drawmere.pageUri, nullptr);
    EXPECT_EQ(utf8(drawmere.outputPath), "");
    EXPECT_EQ(drawmere.outputStream, nullptr);
    EXPECT_EQ(drawmere.impl, nullptr);
    EXPECT_EQ(drawmere.errorHandler, DrawmereErrHandler::getDefault());
    EXPECT_EQ(drawmere.currentPage, 0);
    EXPECT_EQ(drawmere.firstPage, 0);
    EXPECT_EQ(drawmere.pageCount, 0);
    EXPECT_TRUE(drawmere.pageAnchors.empty() && drawmere.allAnchors.empty());
    EXPECT_TRUE(drawmere.anchorPages.empty() && drawmere.pageFiles.empty());
    EXPECT_TRUE(drawmere.documents.empty());
}

TEST(Drawmere, ADocumentDiesWithIt) {
    SVGConfig config;
    SVGPageUri uri(u"out.svg");
    int deaths = 0;
    {
        Drawmere drawmere(&config, &uri);
        drawmere.impl = new MortalImpl(&config, &deaths);
    }
    EXPECT_EQ(deaths, 1);
}

TEST(Drawmere, ASecondDocumentDeletesTheUnfinishedOne) {
    SvgPage page;
    int deaths = 0;
    delete page.drawmere.impl;
    page.drawmere.impl = new MortalImpl(&page.config, &deaths);
    page->initRootSvg(u"out.svg");
    EXPECT_EQ(deaths, 1);
    delete page.drawmere.impl;
    page.drawmere.impl = new MortalImpl(&page.config, &deaths);
    page->initRootSvg(&page.stream);
    EXPECT_EQ(deaths, 2);
}

TEST(Drawmere, MakesAProfileForEachNumberAndFullForAnyOther) {
    const struct {
        int number;
        const std::type_info& profile;
    } rows[] = {
        {-1, typeid(SVGFullImpl)},   {0, typeid(SVGFullImpl)},
        {1, typeid(SVGBasicImpl)},   {2, typeid(SVGTinyImpl)},
        {3, typeid(SVGFullImpl)}, // on purpose: Wisp is the Full profile
        {4, typeid(SVGPlazmicImpl)}, {5, typeid(SVGFullImpl)},
        {6, typeid(SVGFullImpl)},    {std::numeric_limits<int>::max(), typeid(SVGFullImpl)},
    };

    SvgPage page;
    for (const auto& row : rows) {
        const auto type = static_cast<SVGConfig::SVGTYPE>(row.number);
        const std::unique_ptr<DrawmereImpl> impl(page->createImplInstance(type));
        const DrawmereImpl& made = *impl;
        EXPECT_EQ(typeid(made).name(), row.profile.name()) << row.number;
        EXPECT_EQ(made.config, &page.config);
    }
}

TEST(Drawmere, ADocumentHasTheProfileOfTheConfiguration) {
    SvgPage page(SVGConfig::SVGTYPE_TINY);
    EXPECT_NE(dynamic_cast<SVGTinyImpl*>(page.drawmere.impl), nullptr);
    EXPECT_NE(page.rootTag().find("baseProfile=\"tiny\""), std::string::npos);
}

TEST(Drawmere, ADocumentForAPathKnowsItsLocalPathAndNoStream) {
    SvgPage page;
    page->initRootSvg(u"file:///a%20b/out.svg");
    EXPECT_EQ(utf8(page.drawmere.outputPath), "/a b/out.svg");
    EXPECT_EQ(page.drawmere.outputStream, nullptr);
    EXPECT_NE(page.drawmere.impl->getDocument()->getDocumentElement(), nullptr);
}

TEST(Drawmere, ADocumentForAStreamKnowsTheStreamAndNoPath) {
    SvgPage page;
    page->initRootSvg(u"out.svg");
    page->initRootSvg(&page.stream);
    EXPECT_EQ(utf8(page.drawmere.outputPath), "");
    EXPECT_EQ(page.drawmere.outputStream, &page.stream);
}

// Pages.

TEST(DrawmerePages, FileNamesHaveTheNumberBeforeTheExtension) {
    const struct {
        const char16_t* uri;
        const char16_t* format;
        int page;
        const char* name;
    } rows[] = {
        {u"out.svg", u"1", 3, "out3.svg"},
        {u"out.svg", u"", 3, "out3.svg"},
        {u"out.svg", u"01", 3, "out03.svg"},
        {u"out.svg", u"001", 1234, "out1234.svg"},
        {u"out.svg", u"a", 28, "outab.svg"},
        {u"out.svg", u"I", 14, "outXIV.svg"},
        {u"out.svg", u"-1-", 7, "out-7-.svg"},
        {u"out.svg", u"1", 0, "out0.svg"},
        {u"out.svg", u"1", -2, "out-2.svg"},
        {u"dir.d/out.svg", u"1", 3, "out3.svg"},
        {u"file:///dir/out.svg", u"1", 3, "out3.svg"},
        {u"a.b.svgz", u"1", 3, "a.b3.svgz"},
        {u"out", u"1", 3, "out3"},
        {u".svg", u"1", 3, "3.svg"}, // an extension and nothing else
        {u"dir/", u"1", 3, "3"},
        {u"", u"1", 3, "3"},
        {u"s\u00FC\u00DF.svg", u"1", 3, "s\u00FC\u00DF3.svg"},
    };

    for (const auto& row : rows) {
        SVGConfig config;
        SVGPageUri uri(row.uri, row.format);
        Drawmere drawmere(&config, &uri);
        drawmere.initRootSvg(u"");
        drawmere.startPage(row.page, MoxRectT<MoxLength>());
        EXPECT_EQ(utf8(drawmere.pageFiles[row.page]), row.name);
    }
}

TEST(DrawmerePages, AreCountedAndTheFirstIsRemembered) {
    RunFiles run;
    run.open();
    run.begin(7);
    run.begin(3);
    run.begin(7);
    EXPECT_EQ(run.drawmere.firstPage, 7);
    EXPECT_EQ(run.drawmere.currentPage, 7);
    EXPECT_EQ(run.drawmere.pageCount, 3);
    EXPECT_EQ(run.drawmere.pageFiles.size(), 2U);
}

TEST(DrawmerePages, BeginWithAnAnchorAtTheirFirstCorner) {
    SvgPage page;
    page->startPage(12, MoxRectT<MoxLength>(pt(5), pt(6.5F), pt(100), pt(90)));
    EXPECT_TRUE(page.drawmere.pageAnchors.empty()); // the page mark is no anchor of the caller's
    // On purpose: the translation holds the vertical place alone.
    EXPECT_EQ(page.body(), "<g>\n<g transform=\"translate(6.5)\">\n<text id=\"p12\"/>\n</g>\n</g>");
}

TEST(DrawmerePages, ASecondStartForgetsTheAnchorsOfThePageThatNeverEnded) {
    RunFiles run;
    run.open();
    run.begin(1);
    run.drawmere.setInternalLinkAnchor(u"lost", 0, 0);
    run.begin(2);
    run.drawmere.setInternalLinkAnchor(u"kept", 0, 0);
    run.drawmere.endPage();
    EXPECT_EQ(run.drawmere.allAnchors, std::set<UnicodeString>{u"kept"});
    EXPECT_EQ(run.drawmere.pageFiles.size(), 2U); // its file stays known
}

TEST(DrawmerePages, ASecondStartOfAPageKeepsTheFirstFileName) {
    RunFiles run;
    run.open();
    run.begin(1);
    run.uri.numberFormat = u"01";
    run.begin(1);
    EXPECT_EQ(utf8(run.drawmere.pageFiles[1]), "out1.svg");
}

TEST(DrawmerePages, EndFilesTheAnchorsAndTheFirstPageKeepsAName) {
    RunFiles run;
    run.open();
    run.begin(1);
    run.drawmere.setInternalLinkAnchor(u"a", 0, 0);
    run.drawmere.setInternalView(u"v", 0, 0, 1, 1);
    run.drawmere.endPage();
    EXPECT_TRUE(run.drawmere.pageAnchors.empty());
    run.begin(2);
    run.drawmere.setInternalLinkAnchor(u"a", 0, 0);
    run.drawmere.setInternalLinkAnchor(u"b", 0, 0);
    run.drawmere.endPage();
    const std::map<UnicodeString, std::int32_t> pages = {{u"a", 1}, {u"b", 2}, {u"v", 1}};
    EXPECT_EQ(run.drawmere.anchorPages, pages);
    EXPECT_EQ(run.drawmere.allAnchors, (std::set<UnicodeString>{u"a", u"b", u"v"}));
    run.drawmere.endPage(); // a second end has nothing to file
    EXPECT_EQ(run.drawmere.anchorPages, pages);
}

TEST(DrawmerePages, WithoutADocumentNothingIsBegunOrFinished) {
    RunFiles run;
    run.begin(1);
    EXPECT_EQ(run.drawmere.pageCount, 0);
    EXPECT_TRUE(run.drawmere.pageFiles.empty());
    run.drawmere.finishRootSvg();
    EXPECT_EQ(run.list(), "");
}

TEST(Drawmere, AnExceptionFromADrawingCallLeavesAllAsItWas) {
    SvgPage page;
    page->startPage(1, MoxRectT<MoxLength>());
    page->setInternalLinkAnchor(u"a", 0, 0);
    page->drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILL);
    EXPECT_THROW(page->popState(), MoxError);
    EXPECT_EQ(page.drawmere.pageCount, 1);
    EXPECT_EQ(page.drawmere.pageAnchors, std::set<UnicodeString>{u"a"});
    page->drawCircle(pt(1), pt(2), pt(4), PAINTMODE_FILL);
    EXPECT_NE(page.document().find("r=\"3\""), std::string::npos);
    EXPECT_NE(page.document().find("r=\"4\""), std::string::npos);
}

TEST(Drawmere, ErrorsThatADocumentSurvivesComeFromTheConfiguration) {
    SvgPage page;
    EXPECT_FALSE(page->hasError());
    EXPECT_EQ(page->popError().getCode(), 0);
    page.config.pushError(MoxError(16929, u"one", UnicodeString(), -1, -1, UnicodeString()));
    page.config.pushError(MoxError(16931, u"two", UnicodeString(), -1, -1, UnicodeString()));
    EXPECT_TRUE(page->hasError());
    EXPECT_EQ(page->popError().getCode(), 16931);
    EXPECT_EQ(page->popError().getCode(), 16929);
    EXPECT_FALSE(page->hasError());
}

TEST(Drawmere, ANullHandlerBringsTheDefaultOneBack) {
    SvgPage page;
    RememberingHandler handler;
    page->setErrorHandler(&handler);
    EXPECT_EQ(page.drawmere.errorHandler, &handler);
    page->setErrorHandler(nullptr);
    EXPECT_EQ(page.drawmere.errorHandler, DrawmereErrHandler::getDefault());
}

TEST(Drawmere, AHandlerOutlivesTheDocumentItWasSetWith) {
    SvgPage page;
    RememberingHandler handler;
    page->setErrorHandler(&handler);
    page->initRootSvg(u"out.svg");
    EXPECT_EQ(page.drawmere.errorHandler, &handler);
}

} // namespace
} // namespace DrawmereTest
