// Runs that fail: what is told to whom, and what survives.
#include "draw/DrawmereImpl.h"
#include "foundation/common/MoxKeptText.h"
#include "tests/frontend/RunFiles.h"
#include "tests/support/Gunzip.h"
#include "tree/SVGTreeManager.h"

#include <gtest/gtest.h>

#include <stdexcept>

namespace DrawmereTest {
namespace {

namespace fs = std::filesystem;

/// A run whose page 2 can't be made: a directory stands in its place.
struct BlockedRun : RunFiles {
    BlockedRun() { fs::create_directories(directory.path("out2.svg")); }
};

/// A run whose page 2 meets a full disk.
struct FullDiskRun : RunFiles {
    FullDiskRun() { fs::create_symlink("/dev/full", directory.path("out2.svg")); }
};

TEST(DrawmereFailure, APageThatCannotBeMadeIsThrownByDefault) {
    BlockedRun run;
    run.drawPage(1);
    EXPECT_EQ(errorOf([&run] { run.drawPage(2); }), unwritable(run.directory.path("out2.svg")));
    EXPECT_TRUE(run.holdsPage("out1.svg", 1));
}

TEST(DrawmereFailure, AMissingDirectoryIsFoundWhenThePageIsWritten) {
    RunFiles run("missing/out.svg");
    EXPECT_EQ(errorOf([&run] { run.drawPage(1); }),
              unwritable(run.directory.path("missing/out1.svg")));
}

TEST(DrawmereFailure, AHandlerThatReturnsTurnsAFailureIntoANormalReturn) {
    BlockedRun run;
    RememberingHandler handler;
    run.open();
    run.drawmere.setErrorHandler(&handler);
    run.begin(2);
    run.drawmere.finishRootSvg();
    EXPECT_EQ(handler.told, unwritable(run.directory.path("out2.svg")) + "\n");
}

TEST(DrawmereFailure, AFailedPageStaysOpenAndCanBeFinishedLater) {
    BlockedRun run;
    RememberingHandler handler;
    run.open();
    run.drawmere.setErrorHandler(&handler);
    run.begin(2);
    DrawmereImpl* const open = run.drawmere.impl;
    run.drawmere.finishRootSvg();
    EXPECT_EQ(run.drawmere.impl, open);
    EXPECT_TRUE(run.drawmere.documents.empty());
    EXPECT_EQ(utf8(run.drawmere.pageFiles[2]), "out2.svg");
    fs::remove(run.directory.path("out2.svg"));
    run.drawmere.finishRootSvg();
    EXPECT_EQ(run.drawmere.impl, nullptr);
    EXPECT_TRUE(run.holdsPage("out2.svg", 2));
}

TEST(DrawmereFailure, AfterAFailedPageTheNextOnesAreWritten) {
    BlockedRun run;
    EXPECT_NE(errorOf([&run] { run.drawPage(2); }), "");
    run.drawPage(3);
    run.drawmere.finish();
    EXPECT_TRUE(run.holdsPage("out3.svg", 3));
}

TEST(DrawmereFailure, AFullDiskIsToldAndEveryOtherPageStays) {
    FullDiskRun run;
    run.drawPage(1);
    EXPECT_EQ(errorOf([&run] { run.drawPage(2); }), unwritable(run.directory.path("out2.svg")));
    EXPECT_TRUE(run.config.streamsByName.empty()); // the stream was released before
    run.drawPage(3);
    run.drawmere.finish();
    EXPECT_TRUE(run.holdsPage("out1.svg", 1) && run.holdsPage("out3.svg", 3));
}

TEST(DrawmereFailure, AFullDiskIsToldForACompressedPageToo) {
    FullDiskRun run;
    run.config.gzip = true;
    EXPECT_EQ(errorOf([&run] { run.drawPage(2); }), unwritable(run.directory.path("out2.svg")));
}

TEST(DrawmereFailure, AFullDiskIsToldForASingleFile) {
    RunFiles run;
    run.config.singleFile = true;
    fs::create_symlink("/dev/full", run.directory.path("out.svg"));
    run.drawPage(1);
    EXPECT_EQ(errorOf([&run] { run.drawmere.finish(); }),
              unwritable(run.directory.path("out.svg")));
}

/// A stream of the caller's that takes nothing.
struct FullStream {
    FullStream(bool gzip, int shapes) {
        run.config.streamOutput = true;
        run.config.gzip = gzip;
        run.drawmere.initRootSvg(&stream);
        run.begin(1);
        for (int i = 0; i < shapes; ++i) {
            run.drawmere.drawLine({}, {}, {}, {}, PAINTMODE_STROKE);
        }
        run.drawmere.finishRootSvg();
    }

    std::ofstream stream{"/dev/full"};
    RunFiles run;
};

TEST(DrawmereFailure, AFullDiskIsToldForTheCallersStream) {
    constexpr int moreThanBuffersHold = 5000;
    for (const bool gzip : {false, true}) {
        FullStream full(gzip, moreThanBuffersHold);
        EXPECT_EQ(errorOf([&full] { full.run.drawmere.finish(); }),
                  "16414 Specified uri that svg output couldn't create.");
    }
}

TEST(DrawmereFailure, TheCallersStreamIsNotFlushedSoItsFlushTellsOfASmallDocument) {
    FullStream full(/*gzip=*/false, /*shapes=*/1);
    full.run.drawmere.finish();
    EXPECT_TRUE(full.stream.good());
    EXPECT_FALSE(full.stream.flush().good());
}

/// A text that can't be read back when the document is written.
class LostText : public MoxCommonNS::MoxKeptText {
public:
    std::size_t getLength() const override { return 1; }

    bool handOut(std::string_view /*lineFeed*/, const Taker& /*take*/) const override {
        return false;
    }
};

void loseText(Drawmere& drawmere) {
    drawmere.impl->treeManager->document->getDocumentElement()->setAttribute(
        MoxName(u"lost"), MoxValue::fromKept(new LostText));
}

class HugeText : public LostText {
public:
    bool handOut(std::string_view /*lineFeed*/, const Taker& take) const override {
        take(std::string(100000, 'x'));
        throw std::bad_alloc();
    }
};

TEST(DrawmereFailure, ACompressedDocumentThatMemoryDoesNotSufficeForHasNoEnd) {
    RunFiles run;
    run.config.gzip = true;
    run.open();
    run.begin(1);
    run.drawmere.impl->treeManager->document->getDocumentElement()->setAttribute(
        MoxName(u"huge"), MoxValue::fromKept(new HugeText));
    EXPECT_THROW(run.drawmere.finishRootSvg(), std::bad_alloc);
    EXPECT_THROW(gunzip(run.directory.read("out1.svg")), std::runtime_error);
}

TEST(DrawmereFailure, ATextThatIsLostIsToldLikeAFullDisk) {
    for (const bool gzip : {false, true}) {
        RunFiles run;
        run.config.gzip = gzip;
        run.open();
        run.begin(1);
        loseText(run.drawmere);
        EXPECT_EQ(errorOf([&run] { run.drawmere.finishRootSvg(); }),
                  unwritable(run.directory.path("out1.svg")));
    }
}

TEST(DrawmereFailure, ATextThatIsLostIsToldForTheCallersStream) {
    for (const bool gzip : {false, true}) {
        for (const bool throws : {false, true}) {
            RunFiles run;
            run.config.streamOutput = true;
            run.config.gzip = gzip;
            std::ostringstream stream;
            run.drawmere.initRootSvg(&stream);
            run.begin(1);
            loseText(run.drawmere);
            run.drawmere.finishRootSvg();
            RememberingHandler handler;
            run.drawmere.setErrorHandler(&handler);
            if (throws) {
                stream.exceptions(std::ios::badbit);
            }
            run.drawmere.finish();
            EXPECT_EQ(handler.told, throws
                                        ? "other\n"
                                        : "16414 Specified uri that svg output couldn't create.\n");
            EXPECT_TRUE(stream.bad());
        }
    }
}

TEST(DrawmereFailure, TheEndOfARunStopsAtTheFirstPageThatFails) {
    BlockedRun run;
    RememberingHandler handler;
    for (const int number : {1, 2, 3}) {
        run.drawPage(number, u"#nowhere");
    }
    run.drawmere.setErrorHandler(&handler);
    run.drawmere.finish();
    EXPECT_EQ(handler.told, unwritable(run.directory.path("out2.svg")) + "\n");
    EXPECT_TRUE(run.holdsPage("out1.svg", 1));
    EXPECT_FALSE(run.directory.has("out3.svg"));
}

TEST(DrawmereFailure, AFailedRunOfOnePageIsNotRenamed) {
    RunFiles run;
    RememberingHandler handler;
    run.drawmere.setErrorHandler(&handler);
    fs::create_directories(run.directory.path("out1.svg"));
    run.drawPage(1, u"#nowhere");
    run.drawmere.finish();
    EXPECT_EQ(handler.told, unwritable(run.directory.path("out1.svg")) + "\n");
    EXPECT_EQ(run.list(), "out1.svg");
}

/// Throws whatever is written to it.
class ThrowingBuffer : public std::streambuf {
protected:
    std::streamsize xsputn(const char*, std::streamsize) override {
        throw std::length_error("full");
    }

    int_type overflow(int_type) override { throw std::length_error("full"); }
};

TEST(DrawmereFailure, WhatIsNoErrorOfTheLibraryIsRethrownAtTheEnd) {
    RunFiles run;
    ThrowingBuffer buffer;
    std::ostream stream(&buffer);
    stream.exceptions(std::ios::badbit); // makes the stream let exceptions of its buffer pass
    run.config.streamOutput = true;
    run.drawmere.initRootSvg(&stream);
    run.drawmere.finishRootSvg();
    EXPECT_THROW(run.drawmere.finish(), std::length_error);
    stream.exceptions(std::ios::goodbit);
    stream.clear();
    stream.exceptions(std::ios::badbit);
    RememberingHandler handler;
    run.drawmere.setErrorHandler(&handler);
    EXPECT_NO_THROW(run.drawmere.finish());
    EXPECT_EQ(handler.told, "other\n");
}

/// A link that throws, once it is armed, when it is asked where it leads.
class TrapElement : public SVGElement {
public:
    explicit TrapElement(SVGDocument* document) : SVGElement(document) {
        setName({}, {}, SVGName(SVGName::a));
    }

    const MoxValue& getAttribute(MoxName name) const override {
        if (armed) {
            throw std::out_of_range("trap");
        }
        return SVGElement::getAttribute(name);
    }

    bool armed = false;
};

TEST(DrawmereFailure, WhatIsNoErrorOfTheLibraryIsRethrownAtTheEndOfADocument) {
    RunFiles run;
    run.open();
    const MoxPtr<TrapElement> trap(new TrapElement(run.drawmere.impl->getDocument()));
    run.drawmere.impl->addElement(trap.get(), /*direct=*/true, /*makeCurrent=*/false);
    trap->armed = true;
    EXPECT_THROW(run.drawmere.finishRootSvg(), std::out_of_range);
    RememberingHandler handler;
    run.drawmere.setErrorHandler(&handler);
    EXPECT_NO_THROW(run.drawmere.finishRootSvg());
    EXPECT_EQ(handler.told, "other\n");
    EXPECT_NE(run.drawmere.impl, nullptr);
    trap->armed = false;
}

TEST(DrawmereFailure, BrokenUrisAndNamesEndIn16414) {
    const char16_t* const names[] = {u"http://example.com/out.svg", u"file://other.host/out.svg",
                                     u"/dev/null/out.svg", u"unknown-scheme:/out.svg",
                                     u"file://%zz/out.svg"};
    for (const char16_t* const name : names) {
        RunFiles run;
        run.uri.setText(name);
        EXPECT_EQ(errorOf([&run] { run.drawPage(1); }).substr(0, 5), "16414") << utf8(name);
    }
}

TEST(DrawmereFailure, UnknownOptionsAndBrokenTextsAreWrittenAsBestTheyCan) {
    SvgPage page;
    page.config.saveOption = u"sideways,decimals=many,,decimals";
    page.config.encoding = u"no such encoding";
    page->setFillColorName(u"\xD800\x0001<\"&\n");
    page->drawCircle(pt(1.25F), pt(2), pt(3), PAINTMODE_FILL);
    EXPECT_EQ(page.document().substr(0, 39), "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n");
    EXPECT_NE(page.document().find("cx=\"1.25\""), std::string::npos);
    EXPECT_NE(page.document().find("fill=\"\uFFFD\uFFFD&lt;&quot;&amp;&#"), std::string::npos)
        << page.document();
}

} // namespace
} // namespace DrawmereTest
