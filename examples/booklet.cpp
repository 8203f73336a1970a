// A booklet of 200 pages with a table of contents, links between pages in both directions, an index
// and close-ups, three times: a file for each page, one file, and one stream.
// Usage: booklet [DIRECTORY]

#include "BookletLights.h"
#include "Drawmere.h"
#include "foundation/common/MoxNamedValueMap.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

using namespace DrawmereNS;

namespace {

// The pages, in points; y grows downwards and is that of a baseline for texts.
constexpr float pageWidth = 300;
constexpr float pageHeight = 420;
constexpr float margin = 32;
constexpr float right = pageWidth - margin;

// What stands on them.
constexpr int coverPage = 1;
constexpr int contentsPage = 2;
constexpr int firstLightPage = 3;
constexpr int indexPage = firstLightPage + lightCount;
constexpr int lightsOfIndexPage = 40;
constexpr int colophonPage = 200;

const MoxColor paper(0xFBF8F1);
const MoxColor ink(0x22262E);
const MoxColor soft(0x6B7280);
const MoxColor sea(0x1F5F7A);
const std::array<MoxColor, 4> paints = {MoxColor(0xB5382A), MoxColor(0x22262E), MoxColor(0x1F7A74),
                                        MoxColor(0xC98A1B)};

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

float real(int number) { return static_cast<float>(number); }

UnicodeString toText(int number) { return UnicodeString::fromUTF8(std::to_string(number)); }

int getPage(int light) { return firstLightPage + light; }

/// Returns: the page of the index that lists the `position`th light by name.
int getIndexPage(int position) { return indexPage + position / lightsOfIndexPage; }

// Each page has a destination of its own at its top.

UnicodeString getDestination(int page) { return u"page" + toText(page); }

UnicodeString getCloseUp(int page) { return u"closeup" + toText(page); }

/// The booklet as it is drawn: into a document for each page, or into one for all, where they stand
/// below each other and the frame shows one at a time.
struct Booklet {
    Drawmere& drawmere;
    bool isOneDocument;
    UnicodeString stem; ///< of the file names of the pages
    std::vector<int> lightsByName = sortByName();

    float getTop(int page) const { return isOneDocument ? pageHeight * real(page - 1) : 0; }
};

void setType(Drawmere& page, float size, const MoxColor& color, FONTWEIGHT weight) {
    SVGFont font;
    font.setFontAttribute(u"DejaVu Serif", pt(size), weight, FSTYLE_NORMAL, u"", false);
    font.fontFamily = u"'DejaVu Serif',serif";
    page.setFont(&font, nullptr);
    page.setFillColor(color);
}

struct Label {
    UnicodeString text;
    float x;
    float y;
    float size = 10;
    MoxColor color = ink;
    TEXTANCHOR anchor = TEXTANCHOR_START;
    FONTWEIGHT weight = FONTWEIGHT_NORMAL;
};

void drawLabel(Drawmere& page, const Label& label) {
    page.pushState();
    setType(page, label.size, label.color, label.weight);
    page.setTextAnchor(label.anchor);
    page.drawText(label.text, pt(label.x), pt(label.y), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
    page.popState();
}

// Links. Each label ends with the number of the page that it leads to.

/// Describes a link to a destination anywhere in the booklet.
MoxValue makeLink(const UnicodeString& destination) {
    MoxCommonNS::MoxNamedValueMap internal;
    internal.setNamedItem(MoxName(u"id"), MoxValue(destination));
    MoxCommonNS::MoxNamedValueMap link;
    link.setNamedItem(MoxName(u"internal"), MoxValue(internal));
    return MoxValue(link);
}

void drawLink(Drawmere& page, const UnicodeString& destination, Label label) {
    label.color = sea;
    page.startLink(makeLink(destination));
    drawLabel(page, label);
    page.endLink();
}

void drawLinkToPage(Drawmere& page, int target, Label label) {
    label.text.append(u' ').append(toText(target));
    drawLink(page, getDestination(target), label);
}

void drawRule(Drawmere& page, float y) {
    page.pushState();
    page.setStrokeWidth(pt(0.5F));
    page.setStrokeColor(soft);
    page.drawLine(pt(margin), pt(y), pt(right), pt(y), PAINTMODE_STROKE);
    page.popState();
}

void drawHeading(Drawmere& page, const UnicodeString& text, const UnicodeString& above) {
    drawLabel(page, {above, margin, 44, 8, soft});
    drawLabel(page, {text, margin, 70, 20, ink, TEXTANCHOR_START, FONTWEIGHT_BOLD});
    drawRule(page, 80);
}

// A lighthouse: a striped tower that grows narrower, a lantern and its beam.

struct Tower {
    float x;      ///< of its middle
    float foot;   ///< y of its lower end
    float height; ///< of the tower without the lantern
    int stripes;
    MoxColor paint;

    float top() const { return foot - height; }

    float halfWidth(float y) const { return 9 + 9 * (y - top()) / height; }
};

template <std::size_t count>
void fillPolygon(Drawmere& page, const MoxColor& color, std::array<float, count> points) {
    page.setFillColor(color);
    page.drawPolygon(points.data(), static_cast<int>(count), PAINTMODE_FILL);
}

void drawStripe(Drawmere& page, const Tower& tower, int stripe) {
    const float upper = tower.top() + tower.height * real(stripe) / real(tower.stripes);
    const float lower = tower.top() + tower.height * real(stripe + 1) / real(tower.stripes);
    fillPolygon(page, stripe % 2 == 0 ? tower.paint : MoxColor(0xFFFFFF),
                std::array{tower.x - tower.halfWidth(upper), upper,
                           tower.x + tower.halfWidth(upper), upper,
                           tower.x + tower.halfWidth(lower), lower,
                           tower.x - tower.halfWidth(lower), lower});
}

void drawTower(Drawmere& page, const Tower& tower) {
    const float lantern = tower.top() - 14;
    page.pushState();
    fillPolygon(page, MoxColor(0xF3D27A),
                std::array{tower.x, lantern + 7, right, lantern - 12, right, lantern + 26});
    for (int i = 0; i < tower.stripes; ++i) {
        drawStripe(page, tower, i);
    }
    page.setFillColor(MoxColor(0xF7E3A1));
    page.drawRect(pt(tower.x - 6), pt(lantern), pt(12), pt(14), pt(0), pt(0), PAINTMODE_FILL);
    fillPolygon(page, tower.paint,
                std::array{tower.x - 9, lantern, tower.x + 9, lantern, tower.x, lantern - 10});
    page.setFillColor(sea);
    page.drawRect(pt(margin), pt(tower.foot), pt(right - margin), pt(5), pt(0), pt(0),
                  PAINTMODE_FILL);
    page.popState();
}

// The pages.

void drawCover(const Booklet& booklet) {
    Drawmere& page = booklet.drawmere;
    drawTower(page, {110, 300, 150, 7, paints[0]});
    drawLabel(page, {u"The Booklet of Lights", pageWidth / 2, 70, 20, ink, TEXTANCHOR_MIDDLE,
                     FONTWEIGHT_BOLD});
    drawLinkToPage(page, contentsPage, {u"Contents", margin, 350});
    drawLinkToPage(page, indexPage, {u"Index", margin, 366});
}

void drawContents(const Booklet& booklet) {
    Drawmere& page = booklet.drawmere;
    drawHeading(page, u"Contents", u"Twelve coasts, sixteen lights each");
    float y = 106;
    for (int light = 0; light < lightCount; light += lightsOfCoast) {
        drawLinkToPage(page, getPage(light), {getCoast(light).name, margin, y});
        y += 18;
    }
    drawLinkToPage(page, indexPage, {u"Index", margin, y});
    drawLinkToPage(page, colophonPage, {u"Colophon", margin, y + 18});
}

int findInIndex(const Booklet& booklet, int light) {
    const auto& lights = booklet.lightsByName;
    return static_cast<int>(std::find(lights.begin(), lights.end(), light) - lights.begin());
}

/// The index comes behind all lights, so each of these pages waits for the end of the run, and its
/// links to pages before it become file names too. A page whose links all lead backwards would be
/// written at once, and its links would stay in its own file.
void drawLightLinks(const Booklet& booklet, int light) {
    Drawmere& page = booklet.drawmere;
    const int number = getPage(light);
    const int twin = findTwin(light);
    drawLink(page, getCloseUp(number), {u"A closer look", margin, 330});
    drawLinkToPage(page, getPage(twin), {u"As quick: " + getName(twin), margin, 346});
    drawLinkToPage(page, contentsPage, {u"Contents", margin, 362});
    drawLinkToPage(page, getIndexPage(findInIndex(booklet, light)), {u"Index", 120, 362});
    drawLinkToPage(page, number - 1, {u"Back", margin, 378});
    drawLinkToPage(page, number + 1, {u"On", 120, 378});
}

void drawLight(const Booklet& booklet, int light) {
    Drawmere& page = booklet.drawmere;
    const int number = getPage(light);
    const float height = 50 + 2 * real(getMetres(light));
    const Tower tower = {110, 300, height, 3 + light % 5,
                         paints.at(static_cast<std::size_t>(light) % paints.size())};
    drawHeading(page, getName(light), getCoast(light).name);
    drawLabel(page, {toText(getMetres(light)) + u" metres, a flash every " +
                         toText(getSeconds(light)) + u" seconds",
                     margin, 96});
    drawTower(page, tower);
    // A view is counted in the coordinates of the document, whatever the page has been moved by.
    page.setInternalView(getCloseUp(number), tower.x - 45,
                         booklet.getTop(number) + tower.top() - 40, 90, 90);
    drawLightLinks(booklet, light);
}

void drawIndex(const Booklet& booklet, int number) {
    Drawmere& page = booklet.drawmere;
    constexpr int rows = lightsOfIndexPage / 2;
    const int first = (number - indexPage) * lightsOfIndexPage;
    drawHeading(page, u"Index", u"All lights by name");
    for (int i = 0; i < std::min(lightsOfIndexPage, lightCount - first); ++i) {
        const int light = booklet.lightsByName.at(first + i);
        const float x = i < rows ? margin : pageWidth / 2;
        drawLinkToPage(page, getPage(light), {getName(light), x, 98 + 14 * real(i % rows), 8});
    }
    drawLinkToPage(page, colophonPage, {u"Colophon", margin, 388});
}

/// Nothing comes behind this page, so it can't wait for a page to come: its way back names the
/// file.
void drawColophon(const Booklet& booklet) {
    Drawmere& page = booklet.drawmere;
    drawHeading(page, u"Colophon", u"The end");
    drawLabel(page, {u"No light in this booklet is to be steered by.", margin, 106});
    page.startLink(booklet.isOneDocument ? u"#" + getDestination(coverPage)
                                         : booklet.stem + u"001.svg",
                   MoxName());
    drawLabel(page, {u"Cover 1", margin, 130, 10, sea});
    page.endLink();
    page.startLink(u"https://www.w3.org/TR/SVG11/linking.html", MoxName(u"new"));
    drawLabel(page, {u"How links work, in a window of its own", margin, 148, 10, sea});
    page.endLink();
}

/// Where a page is a file, every link from outside leads to its top. In one document it takes a
/// view to bring another page into the frame: an anchor is an empty text, and viewers don't go to
/// one.
void declarePage(const Booklet& booklet, int number) {
    if (booklet.isOneDocument) {
        booklet.drawmere.setInternalView(getDestination(number), 0, booklet.getTop(number),
                                         pageWidth, pageHeight);
    } else {
        booklet.drawmere.setInternalLinkAnchor(getDestination(number), 0, 0);
    }
}

void drawPage(const Booklet& booklet, int number) {
    Drawmere& page = booklet.drawmere;
    page.setFillColor(paper);
    page.drawRect(pt(0), pt(0), pt(pageWidth), pt(pageHeight), pt(0), pt(0), PAINTMODE_FILL);
    declarePage(booklet, number);
    if (number == coverPage) {
        drawCover(booklet);
    } else if (number == contentsPage) {
        drawContents(booklet);
    } else if (number < indexPage) {
        drawLight(booklet, number - firstLightPage);
    } else if (number < colophonPage) {
        drawIndex(booklet, number);
    } else {
        drawColophon(booklet);
    }
    drawLabel(page, {toText(number), pageWidth / 2, 408, 8, soft, TEXTANCHOR_MIDDLE});
}

// The three ways to write it.

const MoxRectT<MoxLength> pageArea(pt(0), pt(0), pt(pageWidth), pt(pageHeight));

void drawAllPages(const Booklet& booklet) {
    Drawmere& drawmere = booklet.drawmere;
    drawmere.setCanvasSize(pt(pageWidth), pt(pageHeight));
    for (int number = coverPage; number <= colophonPage; ++number) {
        drawmere.pushState();
        drawmere.setTransMatrix(SVGMatrix(1, 0, 0, 1, 0, booklet.getTop(number)));
        drawmere.pushState(); // moves groups from here on, not each element: a view can't be moved
        drawmere.startPage(number, pageArea);
        drawPage(booklet, number);
        drawmere.endPage();
        drawmere.popState();
        drawmere.popState();
    }
    drawmere.finishRootSvg();
    drawmere.finish();
}

/// Writes booklet001.svg to booklet200.svg.
void writePages(const UnicodeString& directory) {
    SVGConfig config;
    config.streamOutput = false;       // pages go to files, not to a stream
    config.saveOption = u"decimals=2"; // more would not be seen
    const UnicodeString stem = u"booklet";
    SVGPageUri uri(directory + stem + u".svg", u"001");
    Drawmere drawmere(&config, &uri);
    const Booklet booklet{drawmere, /*isOneDocument=*/false, stem};
    for (int number = coverPage; number <= colophonPage; ++number) {
        drawmere.initRootSvg(uri.getText());
        drawmere.startPage(number, pageArea);
        drawmere.setCanvasSize(pt(pageWidth), pt(pageHeight));
        drawPage(booklet, number);
        drawmere.endPage();
        drawmere.finishRootSvg();
    }
    drawmere.finish();
}

/// Writes booklet-whole.svg.
void writeFile(const UnicodeString& directory) {
    SVGConfig config;
    config.streamOutput = false;
    config.singleFile = true;
    config.saveOption = u"decimals=2";
    SVGPageUri uri(directory + u"booklet-whole.svg");
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(uri.getText());
    drawAllPages({drawmere, /*isOneDocument=*/true, u""});
}

/// Writes the same as a stream of bytes, to booklet-stream.svg here.
void writeStream(const UnicodeString& directory) {
    std::string path;
    std::ofstream stream((directory + u"booklet-stream.svg").toUTF8String(path), std::ios::binary);
    SVGConfig config;
    config.streamOutput = true;
    config.singleFile = true; // keeps the links in the document
    config.saveOption = u"decimals=2";
    SVGPageUri uri(u"booklet.svg");
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(&stream);
    drawAllPages({drawmere, /*isOneDocument=*/true, u""});
}

} // namespace

int main(int argc, char** argv) {
    try {
        const UnicodeString directory =
            argc > 1 ? UnicodeString::fromUTF8(argv[1]) + u"/" : UnicodeString();
        writePages(directory);
        writeFile(directory);
        writeStream(directory);
    } catch (const MoxError& error) {
        std::fprintf(stderr, "booklet: %s\n", error.what());
        return 1;
    }
}
