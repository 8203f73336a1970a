// Titles that callers put into the tree: the document stays valid, whatever else is in it, and what
// the library makes finds its place.
#include "draw/DrawmereImpl.h"
#include "foundation/records/TLMemoryImage.h"
#include "tests/fonts/EmbeddedFont.h"
#include "tests/support/SvgPage.h"
#include "tests/support/SvgValidator.h"
#include "tests/support/TinyImages.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace DrawmereTest {
namespace {

struct Form {
    const char* name;
    SVGConfig::SVGTYPE profile;
    bool wispMode;
};

constexpr Form forms[] = {
    {"Full", SVGConfig::SVGTYPE_FULL, false}, {"Basic", SVGConfig::SVGTYPE_BASIC, false},
    {"Tiny", SVGConfig::SVGTYPE_TINY, false}, {"Small", SVGConfig::SVGTYPE_TINY, true},
    {"Wisp", SVGConfig::SVGTYPE_WISP, false}, {"Plazmic", SVGConfig::SVGTYPE_PLAZMIC, false},
};

int count(const std::string& text, const std::string& part) {
    int found = 0;
    for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) {
        ++found;
    }
    return found;
}

class TitledDocuments : public testing::TestWithParam<Form> {
protected:
    TitledDocuments() { page.config.wispMode = GetParam().wispMode; }

    SVGDocument& tree() { return *page->impl->getDocument(); }

    void putFirst(MoxNode& parent, SVGName name, const UnicodeString& text) {
        const MoxPtr<SVGElement> element = tree().createSVGElement(name);
        element->appendChildText(text);
        parent.insertBefore(element.get(), parent.getFirstChild());
    }

    void titleDocument() {
        MoxElement& root = *tree().getDocumentElement();
        root.setAttribute(MoxName(u"xml:lang"), u"en");
        putFirst(root, SVGName::desc, u"What is in it");
        putFirst(root, SVGName::title, u"What it is");
    }

    void titleLast() {
        putFirst(*tree().getDocumentElement()->lastLink(), SVGName::title, u"A part");
    }

    void drawGradient() {
        page->startLinearGradient(pt(0), pt(0), pt(9), pt(9), SVGMatrix(), USERSPACEONUSE, GRADPAD);
        page->setStopColor(MoxColor(1, 2, 3), 0, 1);
        page->endGradiant();
    }

    void drawImage(int columns) {
        const std::string png = makePng(columns, 2);
        TalGraphic::TLMemoryImage image(png);
        page->pushState();
        page->drawImage(&image, image.getGraphicType(), pt(20), pt(10), pt(1), pt(2));
        page->popState();
    }

    void drawText() {
        SVGFont font = makeFont(latinFace, /*byGlyphs=*/false);
        page->setFont(&font, &testFonts());
        page->drawText(u"ab", pt(1), pt(9), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                       /*leftToRight=*/true);
    }

    void drawParts() {
        page->pushState();
        page->drawRect(pt(1), pt(2), pt(3), pt(4), pt(0), pt(0), PAINTMODE_FILL);
        page->popState();
        titleLast();
        page->startLink(u"http://www.example.com/", MoxName());
        drawText();
        page->endLink();
        titleLast();
    }

    void drawAll() {
        drawGradient();
        drawImage(3);
        drawParts();
    }

    /// Returns: the complaints that other documents don't give rise to.
    std::vector<std::string> listFaults() {
        const SvgValidator validator(GetParam().profile);
        std::vector<std::string> faults = validator.listFaults(page.document());
        std::erase_if(faults, [&](const std::string& fault) { return validator.findKnown(fault); });
        return faults;
    }

    int countDefs() { return count(page.document(), "<defs"); }

    SvgPage page{GetParam().profile};
};

TEST_P(TitledDocuments, TitleThatComesLastStandsFirst) {
    drawAll();
    titleDocument();
    EXPECT_TRUE(page.body().starts_with("<title>What it is</title>\n<desc>What is in it</desc>\n"));
    EXPECT_TRUE(page.rootTag().ends_with(" xml:lang=\"en\">"));
    EXPECT_EQ(count(page.document(), "<title>A part</title>"), 2);
    EXPECT_EQ(countDefs(), GetParam().wispMode ? 0 : 1);
    EXPECT_EQ(count(page.document(), "<font "), 1);
    EXPECT_EQ(listFaults(), std::vector<std::string>());
}

TEST_P(TitledDocuments, TitleThatComesFirstStandsBehindTheDefinitions) {
    titleDocument();
    drawAll();
    EXPECT_EQ(countDefs(), GetParam().wispMode ? 0 : 1);
    EXPECT_EQ(page.body().starts_with("<title>"), GetParam().wispMode);
    EXPECT_EQ(listFaults(), std::vector<std::string>());
}

TEST_P(TitledDocuments, TitleAheadOfTheDefinitionsKeepsLaterOnesApartFromThem) {
    drawImage(3);
    titleDocument();
    drawImage(4);
    EXPECT_EQ(countDefs(), GetParam().wispMode ? 1 : 2); // one is taken away with its image
    EXPECT_EQ(listFaults(), std::vector<std::string>());
}

INSTANTIATE_TEST_SUITE_P(Forms, TitledDocuments, testing::ValuesIn(forms),
                         [](const auto& row) { return row.param.name; });

} // namespace
} // namespace DrawmereTest
