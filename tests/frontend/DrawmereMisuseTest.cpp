// Runs that callers get wrong: ends out of turn, odd page numbers and names, places that vanish.
#include "draw/DrawmereImpl.h"
#include "tests/frontend/RunFiles.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

#include <limits>

namespace DrawmereTest {
namespace {

namespace fs = std::filesystem;

constexpr int least = std::numeric_limits<int>::min();
constexpr int largest = std::numeric_limits<int>::max();

/// Draws a page that links to a destination of its own and to one that is declared nowhere.
void drawWaitingPage(RunFiles& run, int number) {
    const UnicodeString own = u"own" + UnicodeString::fromUTF8(std::to_string(number));
    run.open();
    run.begin(number);
    run.drawmere.setInternalLinkAnchor(own, 0, 0);
    for (const UnicodeString& link : {u"#" + own, UnicodeString(u"#nowhere")}) {
        run.drawmere.startLink(link, MoxName());
        run.drawmere.endLink();
    }
    run.drawmere.endPage();
    run.drawmere.finishRootSvg();
}

bool linksTo(const RunFiles& run, const std::string& file, const std::string& target) {
    return run.directory.read(file).find("<a xlink:href=\"" + target + "\"") != std::string::npos;
}

// Ends out of turn.

TEST(DrawmereMisuse, ASecondEndLeavesWhatTheFirstOneWroteAlone) {
    RunFiles run;
    drawWaitingPage(run, 1);
    drawWaitingPage(run, 2);
    run.drawmere.finish();
    EXPECT_TRUE(linksTo(run, "out1.svg", "#own1"));
    run.directory.write("out1.svg", "changed since");
    run.drawmere.finish();
    EXPECT_EQ(run.directory.read("out1.svg"), "changed since");
    EXPECT_EQ(run.list(), "out1.svg out2.svg");
    EXPECT_EQ(run.drawmere.documents.size(), 2U);
}

TEST(DrawmereMisuse, ASecondEndRenamesNothingElse) {
    RunFiles run;
    run.drawPage(1);
    run.drawmere.finish();
    run.directory.write("out1.svg", "another run's");
    run.drawmere.finish();
    EXPECT_TRUE(run.holdsPage("out.svg", 1));
    EXPECT_EQ(run.directory.read("out1.svg"), "another run's");
}

TEST(DrawmereMisuse, ASecondEndAddsNothingToAStreamOrASingleFile) {
    RunFiles run;
    std::ostringstream stream;
    run.config.streamOutput = true;
    run.drawmere.initRootSvg(&stream);
    run.begin(1);
    run.drawmere.finishRootSvg();
    run.drawmere.finish();
    const std::string once = stream.str();
    run.drawmere.finish();
    EXPECT_EQ(stream.str(), once);

    RunFiles single;
    single.config.singleFile = true;
    single.drawPage(1);
    single.drawmere.finish();
    single.directory.write("out.svg", "changed since");
    single.drawmere.finish();
    EXPECT_EQ(single.directory.read("out.svg"), "changed since");
}

TEST(DrawmereMisuse, ASecondEndWritesWhatTheFirstOneCouldNot) {
    RunFiles run;
    RememberingHandler handler;
    fs::create_directories(run.directory.path("out2.svg"));
    for (const int number : {1, 2, 3}) {
        drawWaitingPage(run, number);
    }
    run.drawmere.setErrorHandler(&handler);
    run.drawmere.finish();
    run.drawmere.finish();
    EXPECT_EQ(handler.told, unwritable(run.directory.path("out2.svg")) + "\n" +
                                unwritable(run.directory.path("out2.svg")) + "\n");
    EXPECT_EQ(run.list(), "out1.svg out2.svg");
    fs::remove(run.directory.path("out2.svg"));
    run.drawmere.finish();
    for (const int number : {1, 2, 3}) {
        const std::string name = std::to_string(number);
        EXPECT_TRUE(run.holdsPage("out" + name + ".svg", number));
        EXPECT_TRUE(linksTo(run, "out" + name + ".svg", "#own" + name));
    }
}

TEST(DrawmereMisuse, AllLinksAreSolvedBeforeTheFirstPageIsWritten) {
    RunFiles run;
    RememberingHandler handler;
    run.drawmere.setErrorHandler(&handler);
    fs::create_directories(run.directory.path("out1.svg"));
    run.drawPage(1, u"#there");
    run.drawPage(2, u"#there");
    run.drawPage(3, u"", u"there");
    run.drawmere.finish();
    EXPECT_EQ(handler.told, unwritable(run.directory.path("out1.svg")) + "\n");
    std::ostringstream second;
    run.drawmere.saveDocument(run.drawmere.documents[2].get(), &second);
    EXPECT_NE(second.str().find("<a xlink:href=\"out3.svg\""), std::string::npos);
    EXPECT_FALSE(run.directory.has("out2.svg"));
}

TEST(DrawmereMisuse, AnEndBeforeTheEndOfADocumentLosesNothingOfIt) {
    RunFiles run;
    run.open();
    run.begin(1);
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "");
    run.drawmere.drawCircle(pt(1), pt(1), pt(77), PAINTMODE_NONE);
    run.drawmere.endPage();
    run.drawmere.finishRootSvg();
    run.drawmere.finish();
    EXPECT_TRUE(run.holdsPage("out.svg", 1) && run.holdsPage("out.svg", 77));
}

TEST(DrawmereMisuse, AfterTheEndAnotherDocumentCanBeDrawn) {
    RunFiles run;
    drawWaitingPage(run, 1);
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out.svg");
    drawWaitingPage(run, 2);
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out.svg out2.svg");
    EXPECT_TRUE(run.holdsPage("out2.svg", 2));
}

TEST(DrawmereMisuse, ARunWithoutDocumentsTellsNothing) {
    RunFiles run;
    RememberingHandler handler;
    run.drawmere.setErrorHandler(&handler);
    for (const bool single : {false, true}) {
        run.config.singleFile = single;
        run.drawmere.finish();
        run.drawmere.finishRootSvg();
    }
    EXPECT_EQ(handler.told + run.list(), "");
    run.config.singleFile = false;
    run.drawPage(1);
    EXPECT_TRUE(run.holdsPage("out1.svg", 1));
}

// Page numbers.

TEST(DrawmereMisuse, OfTwoPagesOfOneNumberTheOneWrittenLastHasTheFile) {
    RunFiles run;
    run.drawPage(4);
    run.drawPage(4, u"", u"second");
    EXPECT_TRUE(run.directory.read("out4.svg").find("id=\"second\"") != std::string::npos);
    run.drawPage(5, u"#nowhere");
    run.drawPage(5, u"", u"at once");
    EXPECT_TRUE(run.directory.read("out5.svg").find("id=\"at once\"") != std::string::npos);
    run.drawmere.finish();
    EXPECT_TRUE(linksTo(run, "out5.svg", "#nowhere"));
    EXPECT_EQ(run.list(), "out4.svg out5.svg");
}

TEST(DrawmereMisuse, DestinationsOfTwoPagesOfOneNumberShareItsFile) {
    RunFiles run;
    run.drawPage(1, u"#one");
    run.drawPage(2, u"#two");
    run.drawPage(7, u"", u"one");
    run.drawPage(7, u"", u"two");
    run.drawmere.finish();
    EXPECT_TRUE(linksTo(run, "out1.svg", "out7.svg") && linksTo(run, "out2.svg", "out7.svg"));
}

TEST(DrawmereMisuse, AnyNumberMakesAPageWithAFileOfItsOwn) {
    const struct {
        const char16_t* format;
        int number;
        const char* file;
        const char* id;
    } rows[] = {
        {u"", -5, "out-5.svg", "p-5"},
        {u"", 0, "out0.svg", "p0"},
        {u"", largest, "out2147483647.svg", "p2147483647"},
        {u"", least, "out-2147483648.svg", "p-2147483648"},
        {u"001", -5, "out-005.svg", "p-5"},
        {u"001", largest, "out2147483647.svg", "p2147483647"},
        {u"I", largest, "out2147483647.svg", "p2147483647"},
        {u"i", -5, "out-5.svg", "p-5"},
        {u"a", largest, "outfxshrxw.svg", "p2147483647"},
        {u"A", 0, "out0.svg", "p0"},
    };

    for (const auto& row : rows) {
        RunFiles run;
        run.uri.numberFormat = row.format;
        run.drawPage(1, u"#there");
        run.drawPage(row.number, u"#nowhere", u"there");
        run.drawmere.finish();
        EXPECT_NE(run.directory.read(row.file).find("id=\"" + std::string(row.id) + "\""),
                  std::string::npos)
            << run.list();
        bool arrives = false;
        for (const char* const first :
             {"out1.svg", "out001.svg", "outI.svg", "outi.svg", "outa.svg", "outA.svg"}) {
            arrives = arrives || linksTo(run, first, row.file);
        }
        EXPECT_TRUE(arrives) << row.file;
    }
}

TEST(DrawmereMisuse, PagesAreWrittenInTheOrderOfTheirNumbers) {
    RunFiles run;
    RememberingHandler handler;
    fs::create_directories(run.directory.path("out0.svg"));
    for (const int number : {largest, 0, -5}) {
        run.drawPage(number, u"#nowhere");
    }
    run.drawmere.setErrorHandler(&handler);
    run.drawmere.finish();
    EXPECT_EQ(run.list(), "out-5.svg out0.svg");
}

// Names of destinations.

std::string readFile(const RunFiles& run, const std::string& name, XmlReading& reading) {
    reading = readXml(run.directory.read(name));
    return reading.error;
}

TEST(DrawmereMisuse, AnyNameIsADestinationAndLeavesTheFilesWellFormed) {
    const UnicodeString names[] = {
        UnicodeString(),
        u"#",
        u"##",
        u"two words",
        u"a\tb\nc\rd",
        u"<a href=\"x\">&amp;'</a>]]>",
        u"Mox-SVG-page",
        u"Mox-SVG-page-x",
        u"out1.svg#a?b=c&d",
        u"\u00E9\u4E00\U0001F600",
        u"%23%00",
        UnicodeString(u'\0') + u"behind",
        UnicodeString(u'\x01') + u"\uFFFE",
        UnicodeString(char16_t(0xD800)) + u"alone",
        UnicodeString(100000, u'x', 100000),
    };
    for (const UnicodeString& name : names) {
        RunFiles run;
        run.drawPage(1, u"#" + name);
        EXPECT_EQ(run.list(), "") << utf8(name);
        run.open();
        run.begin(2);
        run.drawmere.setInternalLinkAnchor(name, 0, 0);
        run.drawmere.setInternalView(name, 0, 0, 1, 1);
        run.drawmere.endPage();
        run.drawmere.finishRootSvg();
        EXPECT_EQ(run.list(), "out2.svg");
        run.drawmere.finish();
        XmlReading page;
        EXPECT_EQ(readFile(run, "out1.svg", page), "") << utf8(name);
        EXPECT_EQ(page.element("a").attribute("xlink:href"), "out2.svg") << utf8(name);
        EXPECT_EQ(readFile(run, "out2.svg", page), "") << utf8(name);
    }
}

TEST(DrawmereMisuse, ALinkAndItsDestinationOnOnePageKeepTheSameOddName) {
    const UnicodeString names[] = {u"two words", u"<\"&'>", u"a\tb", UnicodeString(u'\x01') + u"b",
                                   UnicodeString(char16_t(0xDC00))};
    for (const UnicodeString& name : names) {
        RunFiles run;
        run.drawPage(1, u"#" + name, name);
        XmlReading page;
        EXPECT_EQ(readFile(run, "out1.svg", page), "");
        const std::string target = page.element("a").attribute("xlink:href");
        std::set<std::string> ids;
        for (const XmlEvent& event : page.events) {
            ids.insert("#" + event.attribute("id"));
        }
        EXPECT_TRUE(ids.contains(target)) << target;
    }
}

// Places that vanish.

/// A run in a directory that can be taken away and brought back.
struct VanishingRun : RunFiles {
    VanishingRun() : RunFiles("here/out.svg") { bring(); }

    void take() const { fs::rename(directory.path("here"), directory.path("away")); }

    void bring() const { fs::create_directories(directory.path("here")); }
};

TEST(DrawmereMisuse, ADirectoryThatVanishesIsToldAndTheRunGoesOnWhenItIsBack) {
    VanishingRun run;
    RememberingHandler handler;
    run.drawmere.setErrorHandler(&handler);
    run.drawPage(1);
    run.take();
    run.drawPage(2);
    run.drawPage(3);
    EXPECT_EQ(handler.told, unwritable(run.directory.path("here/out2.svg")) + "\n" +
                                unwritable(run.directory.path("here/out3.svg")) + "\n");
    EXPECT_TRUE(run.holdsPage("away/out1.svg", 1));
    run.bring();
    run.drawmere.finishRootSvg(); // page 3 is still open
    run.drawPage(4);
    run.drawmere.finish();
    EXPECT_TRUE(run.holdsPage("here/out3.svg", 3) && run.holdsPage("here/out4.svg", 4));
}

TEST(DrawmereMisuse, ADirectoryThatVanishedIsFoundBeforeADocumentIsOpenedWhenPathsAreChecked) {
    VanishingRun run;
    RememberingHandler handler;
    run.config.checkPaths = true;
    run.drawmere.setErrorHandler(&handler);
    run.drawPage(1);
    run.take();
    EXPECT_EQ(errorOf([&run] { run.open(); }).substr(0, 5), "16410"); // past the handler
    EXPECT_EQ(run.drawmere.impl, nullptr);
    EXPECT_EQ(handler.told, "");
    run.bring();
    run.drawPage(2);
    EXPECT_TRUE(run.holdsPage("here/out2.svg", 2));
}

TEST(DrawmereMisuse, ADirectoryThatVanishesBeforeTheEndStopsItAtItsFirstPage) {
    VanishingRun run;
    RememberingHandler handler;
    run.drawmere.setErrorHandler(&handler);
    drawWaitingPage(run, 1);
    drawWaitingPage(run, 2);
    run.drawPage(3);
    run.take();
    run.drawmere.finish();
    EXPECT_EQ(handler.told, unwritable(run.directory.path("here/out1.svg")) + "\n");
    EXPECT_TRUE(run.holdsPage("away/out3.svg", 3));
    run.bring();
    run.drawPage(4);
    run.drawmere.finish();
    for (const int number : {1, 2, 4}) {
        EXPECT_TRUE(run.holdsPage("here/out" + std::to_string(number) + ".svg", number)) << number;
    }
}

TEST(DrawmereMisuse, ASingleFileWhoseDirectoryVanishedIsTold) {
    VanishingRun run;
    run.config.singleFile = true;
    run.drawPage(1);
    run.take();
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }),
              unwritable(run.directory.path("here/out.svg")));
    run.bring();
    run.drawmere.finish();
    EXPECT_TRUE(run.holdsPage("here/out.svg", 1));
}

} // namespace
} // namespace DrawmereTest
