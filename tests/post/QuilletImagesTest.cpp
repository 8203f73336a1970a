// Images on small devices, which stand where they are used.
#include "post/QuilletExtention.h"

#include "tests/post/Quillet.h"
#include "tests/post/ReadTree.h"

namespace DrawmereTest {
namespace {

using Images = std::map<UnicodeString, MoxElement*>;

std::string withPlacedImages(const std::string& xml) {
    return pass(&QuilletExtention::embedImageDirect, xml);
}

TEST(QuilletImages, ImageStandsWhereItIsUsedAndEmptyDefinitionsGo) {
    EXPECT_EQ(withPlacedImages(rootTag + "<defs>" + twoImages + "</defs><g>" + frame("#i1") +
                               "</g><line/>" + frame("#i0") + "</svg>"),
              rootTag + "<g>" + placed("data:1") + "</g><line/>" + placed("data:0") + "</svg>");
}

TEST(QuilletImages, EachUseHasTheWholeImage) {
    EXPECT_EQ(withPlacedImages(rootTag + "<defs>" + twoImages + "</defs>" + frame("#i0") +
                               frame("#i0") + "</svg>"),
              rootTag + placed("data:0") + placed("data:0") + "</svg>");
}

TEST(QuilletImages, OtherDefinitionsStay) {
    EXPECT_EQ(withPlacedImages(rootTag + "<defs><g id=\"c\">" + frame("#i0") + "</g>" + twoImages +
                               "<image/></defs></svg>"),
              rootTag + "<defs><g id=\"c\">" + frame("#i0") + "</g></defs></svg>");
    EXPECT_EQ(withPlacedImages(rootTag + "<defs>" + twoImages + " </defs></svg>"),
              rootTag + "<defs> </defs></svg>");
}

TEST(QuilletImages, OfTwoImagesWithOneIdTheFirstIsFound) {
    EXPECT_EQ(withPlacedImages(rootTag +
                               "<defs><image id=\"i\" xlink:href=\"data:0\"/>"
                               "<image id=\"i\" xlink:href=\"data:1\"/></defs>" +
                               frame("#i") + "</svg>"),
              rootTag + "<defs><image xlink:href=\"data:1\"/></defs>"
                        "<image width=\"3\" height=\"4\" x=\"1\" y=\"2\" xlink:href=\"data:0\"/>"
                        "</svg>");
}

TEST(QuilletImages, UseThatFitsNoImageStays) {
    EXPECT_EQ(withPlacedImages(rootTag + "<defs>" + twoImages + "</defs>" + frame("#c0") +
                               "<use xlink:href=\"#i0\"/></svg>"),
              rootTag + frame("#c0") + "<use xlink:href=\"#i0\"/></svg>");
}

TEST(QuilletImages, WithoutImagesInTheFirstDefinitionsNothingChanges) {
    for (const std::string& content : {"<g>" + frame("#i0") + "</g>", "<defs/>" + frame("#i0"),
                                       "<defs/><defs>" + twoImages + "</defs>" + frame("#i0"),
                                       "<g><defs>" + twoImages + "</defs></g>" + frame("#i0")}) {
        const std::string text = rootTag + content + "</svg>";
        EXPECT_EQ(withPlacedImages(text), text);
    }
}

TEST(QuilletImages, FirstDefinitionsNeedNotBeTheFirstChild) {
    EXPECT_EQ(withPlacedImages(rootTag + "text<g/>text<defs>" + twoImages + "</defs>" +
                               frame("#i0") + "</svg>"),
              rootTag + "text<g/>text" + placed("data:0") + "</svg>");
}

TEST(QuilletImages, IdMayBeANameAndWhatIsNoTextIsEmpty) {
    const MoxPtr<SVGDocument> document =
        readTree(rootTag + "<defs>" + twoImages + "</defs>" + frame("#n") + frame("#") +
                 frame("#7") + "</svg>");
    MoxElement* const root = document->getDocumentElement();
    auto* const image = MoxCommonNS::narrow<MoxElement>(root->getFirstChild()->getFirstChild());
    image->setAttribute(toName("id"), MoxValue(toName("n")));
    MoxCommonNS::narrow<MoxElement>(image->getNextSibling())
        ->setAttribute(toName("id"), MoxValue(7));
    makeQuillet().embedImageDirect(root);
    EXPECT_EQ(writeTree(*document),
              rootTag + placed("data:0") + placed("data:1") + frame("#7") + "</svg>");
}

TEST(QuilletImages, FrameIsAnSvgWithAUseAndNoOtherElement) {
    const struct {
        const char* xml;
        bool isFrame;
    } rows[] = {
        {"<svg><use/></svg>", true},
        {"<svg>text<use/>text</svg>", true},
        {"<svg><use><g/></use></svg>", true},
        {"<svg/>", false},
        {"<svg>text</svg>", false},
        {"<svg><use/><use/></svg>", false},
        {"<svg><g/><use/></svg>", false},
        {"<svg><use/>text<g/></svg>", false},
        {"<g><use/></g>", false},
    };

    for (const auto& row : rows) {
        const MoxPtr<SVGDocument> document = readTree(row.xml);
        EXPECT_EQ(makeQuillet().isImageRefSvgElement(document->getDocumentElement()), row.isFrame)
            << row.xml;
    }
    EXPECT_FALSE(makeQuillet().isImageRefSvgElement(nullptr));
}

TEST(QuilletImages, ElementItselfMayBeAFrame) {
    const MoxPtr<SVGDocument> document =
        readTree("<svg xmlns:xlink=\"http://www.w3.org/1999/xlink\" width=\"5\">"
                 "<use xlink:href=\"#i\"/></svg>");
    const MoxPtr<MoxElement> image = document->createElement(toName("image"));
    image->setAttribute(toName("xlink:href"), MoxValue(u"data:0"));
    Images images = {{u"#i", image.get()}};
    makeQuillet().execEmbedDirect(document->getDocumentElement(), images);
    EXPECT_EQ(writeTree(*document), "<image width=\"5\" xlink:href=\"data:0\"/>");
    EXPECT_EQ(images.size(), 1U);
}

} // namespace
} // namespace DrawmereTest
