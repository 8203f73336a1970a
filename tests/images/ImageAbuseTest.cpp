// Images that no caller should draw: the document stays whole, and nothing else is lost.
#include "foundation/records/TLFileImage.h"
#include "foundation/records/TLStreamImage.h"
#include "tests/images/ImagePage.h"
#include "tests/support/BrittleBuffer.h"
#include "tests/support/XmlReader.h"

#include <climits>
#include <filesystem>
#include <fstream>
#include <limits>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using TalGraphic::TLFileImage;
using TalGraphic::TLMemoryImage;
using TalGraphic::TLStreamImage;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

constexpr const char16_t* ways[] = {u"embed-all", u"link", u"copy-all", u"copy"};

constexpr char dot[] = "<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>";

/// A document whose images go one of the ways; copies go into a directory of its own.
struct AbusePage {
    explicit AbusePage(const char16_t* way = u"embed-all") {
        page.config.setImageProcessingType(MoxName(way));
        page.config.imageCopyUri = directory.uri() + u"/";
    }

    void draw(TLGraphicImage& image, float width = 30, float height = 20) {
        page->drawImage(&image, TalGraphic::TLGRAPHICTYPE_OTHER, pt(width), pt(height), pt(1),
                        pt(2));
    }

    /// The same between a push and a pop.
    void drawApart(TLGraphicImage& image, float width = 30, float height = 20) {
        page->pushState();
        draw(image, width, height);
        page->popState();
    }

    /// Expects a document without fault that holds what is drawn last, and an image for each use.
    void expectWhole() {
        page->drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE);
        const XmlReading reading = readXml(page.document());
        EXPECT_EQ(reading.error, "") << page.document();
        EXPECT_TRUE(page.body().ends_with(std::string(dot) + "\n</g>")) << page.body();
        for (const XmlEvent& event : reading.events) {
            if (event.kind == XmlEvent::START && event.name == "use") {
                const std::string id = event.attribute("xlink:href").substr(1);
                EXPECT_THAT(page.document(), HasSubstr("id=\"" + id + "\""));
            }
        }
    }

    TempDir directory;
    SvgPage page;
};

/// A stream of a type that its bytes don't tell.
class TypedStream : public TLStreamImage {
public:
    TypedStream(int imageType, std::istream* source)
        : TLStreamImage(source, u"in/a.png"), type(static_cast<TLGraphicType>(imageType)) {}

    TLGraphicType getGraphicType() override { return type; }

private:
    TLGraphicType type;
};

void drawBrittle(const char16_t* way, BrittleBuffer::Fault fault, std::size_t firstBad) {
    AbusePage abuse(way);
    BrittleBuffer buffer(makePng(64, 64), firstBad, fault);
    std::istream stream(&buffer);
    stream.exceptions(std::ios::failbit | std::ios::badbit);
    TLStreamImage image(&stream, u"in/b.png");
    TypedStream claimed(TalGraphic::TLGRAPHICTYPE_PNG, &stream);
    TypedStream other(TalGraphic::TLGRAPHICTYPE_OTHER, &stream);
    abuse.drawApart(image);
    abuse.drawApart(claimed);
    abuse.drawApart(other);
    abuse.expectWhole();
}

TEST(ImageAbuse, StreamsThatFailAnywhereEndNothing) {
    const std::size_t size = makePng(64, 64).size();
    for (const char16_t* const way : ways) {
        for (const BrittleBuffer::Fault fault : BrittleBuffer::faults) {
            for (const std::size_t firstBad : {std::size_t(0), std::size_t(5), size / 2, size}) {
                drawBrittle(way, fault, firstBad);
            }
        }
    }
}

TEST(ImageAbuse, StreamThatThrowsAtItsMiddleIsQueuedAndLeavesNoFile) {
    AbusePage abuse(u"copy");
    BrittleBuffer buffer(makePng(64, 64), 100, BrittleBuffer::THROWS);
    std::istream stream(&buffer);
    TypedStream image(TalGraphic::TLGRAPHICTYPE_PNG, &stream);
    abuse.drawApart(image);
    EXPECT_TRUE(std::filesystem::is_empty(abuse.directory.path()));
    ASSERT_THAT(abuse.page.config.errors, SizeIs(1));
    EXPECT_EQ(abuse.page.config.errors.front().getCode(), 16931);
}

TEST(ImageAbuse, DirectoriesAndMissingFilesAreQueued) {
    const TempDir directory;
    for (const char16_t* const way : ways) {
        AbusePage abuse(way);
        TLFileImage missing(directory.uri("missing.png"));
        TLFileImage folder(directory.uri());
        std::ifstream opened(directory.path());
        TLStreamImage stream(&opened, directory.uri());
        abuse.drawApart(missing);
        abuse.drawApart(folder);
        abuse.drawApart(stream);
        EXPECT_THAT(abuse.page.config.errors, SizeIs(3));
        abuse.expectWhole();
    }
}

TEST(ImageAbuse, AnImageInAGradientIsLostAndNothingElse) {
    const std::string stops =
        "y2=\"0\">\n<stop stop-color=\"#000\" offset=\"0.5\" stop-opacity=\"1\"/>\n"
        "<stop stop-color=\"#000\" offset=\"1\" stop-opacity=\"1\"/>\n</linearGradient>\n";
    for (const char16_t* const way : ways) {
        AbusePage abuse(way);
        const std::string bytes = makePng(2, 2);
        TLMemoryImage image(bytes, u"in/a.png");
        abuse.page->startLinearGradient(pt(0), pt(0), pt(1), pt(0), SVGMatrix(), OBJECTBOUNDINGBOX,
                                        GRADPAD);
        abuse.draw(image);
        abuse.page->setStopColor(MoxColor(), 0.5F, 1);
        abuse.drawApart(image);
        abuse.page->setStopColor(MoxColor(), 1, 1);
        abuse.page->endGradiant();
        abuse.drawApart(image);
        abuse.expectWhole();
        const std::string& body = abuse.page.body();
        EXPECT_THAT(body, HasSubstr(stops));
        EXPECT_NE(body.find("<image "), std::string::npos);
        EXPECT_EQ(body.find("<image "), body.rfind("<image "));
    }
}

struct Surroundings {
    void (*start)(SvgPage& page);
    void (*end)(SvgPage& page);
};

MoxRectT<MoxLength> makeBox() { return {pt(0), pt(0), pt(9), pt(9)}; }

constexpr Surroundings allSurroundings[] = {
    {[](SvgPage& page) { page->startClipDef(USERSPACEONUSE); },
     [](SvgPage& page) { page->endClipDef(); }},
    {[](SvgPage& page) {
         page->startMask(pt(0), pt(0), pt(9), pt(9), USERSPACEONUSE, USERSPACEONUSE);
     },
     [](SvgPage& page) { page->endMask(); }},
    {[](SvgPage& page) {
         page->startPattern(makeBox(), makeBox(), SVGMatrix(), USERSPACEONUSE, USERSPACEONUSE);
     },
     [](SvgPage& page) { page->endPattern(); }},
    {[](SvgPage& page) { page->startLink(u"u", MoxName()); },
     [](SvgPage& page) { page->endLink(); }},
    {[](SvgPage& page) { page->startPathData(); },
     [](SvgPage& page) {
         page->setPathMoveTo({pt(1), pt(2)});
         page->endPathData(PAINTMODE_FILL);
     }},
};

void drawWithin(const Surroundings& surroundings, const char16_t* way, SVGConfig::SVGTYPE profile) {
    AbusePage abuse(way);
    abuse.page.config.svgType = profile;
    abuse.page->initRootSvg(&abuse.page.stream);
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes, u"in/a.png");
    abuse.page->pushState();
    surroundings.start(abuse.page);
    abuse.drawApart(image);
    abuse.draw(image);
    surroundings.end(abuse.page);
    abuse.page->popState();
    abuse.drawApart(image);
    abuse.expectWhole();
}

TEST(ImageAbuse, AnImageInAnythingElseLeavesThePageWhole) {
    for (const char16_t* const way : ways) {
        for (const Surroundings& surroundings : allSurroundings) {
            drawWithin(surroundings, way, SVGConfig::SVGTYPE_FULL);
            drawWithin(surroundings, way, SVGConfig::SVGTYPE_TINY);
            drawWithin(surroundings, way, SVGConfig::SVGTYPE_BASIC);
        }
    }
}

TEST(ImageAbuse, TypesThatAreLiesEndNothing) {
    const std::string files[] = {makePng(3, 2), makeBmp(3, 2),
                                 "<svg xmlns=\"http://www.w3.org/2000/svg\"/>", "", "no image"};
    for (const char16_t* const way : ways) {
        for (const std::string& file : files) {
            AbusePage abuse(way);
            for (const int type : {-1, 0, 2, 5, 7, 9, INT_MAX}) {
                for (const char16_t* const conversion : {u"auto", u"jpg-all", u"png-all", u"jpg"}) {
                    abuse.page.config.setImageConversion(MoxName(conversion));
                    TypedImage named(type, file, u"in/x.tif");
                    TypedImage nameless(type, file, u"");
                    abuse.drawApart(named);
                    abuse.drawApart(nameless);
                }
            }
            abuse.expectWhole();
        }
    }
}

// Names.

void drawNamed(const char16_t* way, const UnicodeString& name, const std::string& bytes) {
    AbusePage abuse(way);
    abuse.page.config.svgOutputUri = u"/w/out/p.svg";
    TLMemoryImage image(bytes, name);
    TLMemoryImage same(bytes, name);
    abuse.drawApart(image);
    abuse.drawApart(same);
    abuse.expectWhole();
    const bool isCopied = UnicodeString(way).startsWith(u"copy") && !name.isEmpty();
    if (isCopied && std::filesystem::is_empty(abuse.directory.path())) {
        EXPECT_FALSE(abuse.page.config.errors.empty()) << utf8(name);
    }
}

TEST(ImageAbuse, AnyNameIsWrittenOrQueued) {
    const UnicodeString names[] = {
        UnicodeString(u"in/a\0b.bmp", 10),
        u"in/\xd800.bmp",
        u"in/ a#b?c%41&<\">'.bmp",
        u"in/\n\t\x1.bmp",
        u"..",
        u".",
        u"/",
        u"//",
        u"in/",
        u"../../../a.bmp",
        u".bmp",
        u"a:b.bmp",
        u"file:///%00.bmp",
        u"file:///in/%2F%2e%2e%2Fa.bmp",
        u"file:",
        u"http://[::1",
        u"\xfffe\xffff",
        UnicodeString(70000, UChar32(u'a'), 70000),
    };
    for (const char16_t* const way : ways) {
        for (const UnicodeString& name : names) {
            drawNamed(way, name, makePng(3, 2));
            drawNamed(way, name, makeBmp(3, 2));
        }
    }
}

TEST(ImageAbuse, NullCharacterInANameDoesNotEndThePathOfItsCopy) {
    const std::string files[] = {makePng(3, 2), makeBmp(3, 2)};
    for (const std::string& file : files) {
        AbusePage abuse(u"copy");
        TLMemoryImage image(file, UnicodeString(u"in/a\0b.bmp", 10));
        abuse.drawApart(image);
        EXPECT_TRUE(std::filesystem::is_empty(abuse.directory.path()));
        ASSERT_THAT(abuse.page.config.errors, SizeIs(1));
        EXPECT_EQ(abuse.page.config.errors.front().getCode(), 16931);
    }
}

TEST(ImageAbuse, CounterOfCopiesGoesOnBehindItsLastNumber) {
    AbusePage abuse(u"copy-all");
    abuse.page.config.copyNameCounter = INT_MAX;
    abuse.page.config.enterImageName(u"", u"", u"-2147483648.png");
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes);
    abuse.drawApart(image);
    EXPECT_TRUE(abuse.directory.has("-2147483647.png"));
    EXPECT_EQ(abuse.page.config.copyNameCounter, -INT_MAX);
}

TEST(ImageAbuse, TargetsThatCannotBeWrittenAreQueued) {
    for (const char16_t* const way : {u"copy", u"copy-all"}) {
        AbusePage abuse(way);
        abuse.page.config.imageCopyUri = u"/proc/";
        const std::string png = makePng(2, 2);
        const std::string bmp = makeBmp(2, 2);
        TLMemoryImage image(png, u"in/a.png");
        TLMemoryImage other(bmp, u"in/b.bmp");
        abuse.drawApart(image);
        abuse.drawApart(other);
        EXPECT_THAT(abuse.page.config.errors, SizeIs(2));
        abuse.expectWhole();
    }
}

// Sizes.

void drawSized(int threshold, int dpi, float length) {
    AbusePage abuse;
    abuse.page.config.downsampleDpi = dpi;
    abuse.page.config.downsampleThreshold = threshold;
    abuse.page.config.jpegQuality = dpi;
    abuse.page->setScale(length);
    const std::string bytes = makePng(40, 20);
    TLMemoryImage wide(bytes);
    TLMemoryImage high(bytes);
    abuse.drawApart(wide, length, 10);
    abuse.drawApart(high, 10, length);
    EXPECT_THAT(abuse.page.config.errors, IsEmpty());
    abuse.expectWhole();
}

TEST(ImageAbuse, SizesOfNoUseEndNothing) {
    using Limits = std::numeric_limits<float>;
    for (const int threshold : {INT_MIN, -1, 0, 1, 7, INT_MAX}) {
        for (const int dpi : {0, 1, 300, INT_MAX}) {
            for (const float length : {0.0F, -5.0F, Limits::quiet_NaN(), Limits::infinity(),
                                       -Limits::infinity(), Limits::max(), Limits::denorm_min()}) {
                drawSized(threshold, dpi, length);
            }
        }
    }
}

/// An image in front of more bytes than a text can hold.
class EndlessBuffer : public BrittleBuffer {
public:
    explicit EndlessBuffer(const std::string& content)
        : BrittleBuffer(content, content.size(), ENDS) {}

protected:
    pos_type seekoff(off_type offset, std::ios_base::seekdir from,
                     std::ios_base::openmode which) override {
        const pos_type place = BrittleBuffer::seekoff(offset, from, which);
        return from == std::ios_base::end ? pos_type(1900000000) : place;
    }
};

TEST(ImageAbuse, AnImageTooLargeToEmbedIsThrownAndTheRestStays) {
    AbusePage abuse;
    const std::string bytes = makePng(2, 2);
    EndlessBuffer buffer(bytes);
    std::istream stream(&buffer);
    TLStreamImage image(&stream, u"a");
    TLMemoryImage good(bytes, u"a");
    abuse.page->pushState();
    try {
        abuse.draw(image);
        ADD_FAILURE();
    } catch (const MoxError& error) {
        EXPECT_EQ(error.getCode(), 16405);
    }
    abuse.page->popState();
    abuse.drawApart(good);
    abuse.expectWhole();
    EXPECT_THAT(abuse.page.body(), HasSubstr("<image id=\"i0\""));
}

TEST(ImageAbuse, OneImageInSeveralDocumentsIsStoredInEach) {
    AbusePage abuse;
    const std::string bytes = makePng(2, 2);
    TLMemoryImage image(bytes, u"a");
    abuse.drawApart(image);
    abuse.page->initRootSvg(&abuse.page.stream); // the first one is given up
    abuse.drawApart(image);
    abuse.expectWhole();
    EXPECT_THAT(abuse.page.body(), HasSubstr("<image id=\"i0\""));
}

} // namespace
} // namespace DrawmereTest
