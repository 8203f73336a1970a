// A page as a formatter sets it: a heading, justified paragraphs placed word by word and glyph by
// glyph, a rule, a chart, a table and a link, in two font families. Usage: page [FILE.svg]

#include "Drawmere.h"
#include "PageLines.h"

#include <array>
#include <cmath>
#include <cstdio>
#include <numbers>
#include <vector>

using namespace DrawmereNS;

namespace {

// A4, portrait. All numbers are points, y grows downwards and is that of a baseline for texts.
constexpr float pageWidth = 595;
constexpr float pageHeight = 842;
constexpr float margin = 72;
constexpr float measure = pageWidth - 2 * margin;

const MoxColor white(0xFFFFFF);
const MoxColor ink(0x22262E);
const MoxColor soft(0x6B7280);
const MoxColor hair(0xC9CED6);
const MoxColor teal(0x1F7A74);
const MoxColor rust(0xC2572B);

const Type bodyType{serifFace, 10.5F, ink};
const Type noteType{sansFace, 8.8F, MoxColor(0x3B4250)};
const Type labelType{sansFace, 8, soft};
const Type tableType{sansFace, 9, ink};

constexpr const char16_t tideText[] =
    u"Twice a day the sea climbs the harbour wall and twice a day it leaves again, so that a boat "
    u"tied up at noon may hang from its ropes by supper. The moon sets the pace: one tide follows "
    u"the last by twelve hours and twenty-five minutes, which is why high water comes nearly an "
    u"hour later each day, and why nobody here makes a date with the sea by the clock.";

constexpr const char16_t springText[] =
    u"At new and full moon the sun and the moon pull in line, and the springs run high; at the "
    u"quarters they pull across each other, and the neaps barely cover the lower steps. The curves "
    u"below show one day of each. Both turn slowest at the top and at the bottom. They run fastest "
    u"half way, where each of the two middle hours takes a quarter of the range.";

constexpr const char16_t noteText[] =
    u"Heights are counted from the lowest water that the moon and the sun can make between them, "
    u"so a chart never promises more depth than there is. Wind and weather may still add or take "
    u"half a metre: a week of northerly gales once kept the gate under water for three tides, and "
    u"a high glass with a dry east wind has left the ferry on the mud in plain daylight.";

/// An area of the page.
struct Box {
    float x;
    float y;
    float width;
    float height;

    float right() const { return x + width; }

    float bottom() const { return y + height; }
};

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

float real(auto number) { return static_cast<float>(number); }

void setType(Drawmere& page, const Type& type) {
    SVGFont font;
    font.setFontAttribute(type.face.name, pt(type.size), type.weight, FSTYLE_NORMAL, u"", false);
    font.fontFamily = type.face.families; // with a generic name, which setFontAttribute would quote
    page.setFont(&font, nullptr);
    page.setFillColor(type.color);
}

void drawText(Drawmere& page, const UnicodeString& text, float x, float y) {
    page.drawText(text, pt(x), pt(y), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

/// Draws a text that starts, ends or has its middle at `x`.
void drawLabel(Drawmere& page, const Type& type, TEXTANCHOR anchor, const UnicodeString& text,
               float x, float y) {
    page.pushState();
    setType(page, type);
    page.setTextAnchor(anchor);
    drawText(page, text, x, y);
    page.popState();
}

void drawRule(Drawmere& page, float x1, float y1, float x2, float y2, float width,
              const MoxColor& color) {
    page.pushState();
    page.setStrokeWidth(pt(width));
    page.setStrokeColor(color);
    page.drawLine(pt(x1), pt(y1), pt(x2), pt(y2), PAINTMODE_STROKE);
    page.popState();
}

void drawRuleAcross(Drawmere& page, float y, float width, const MoxColor& color) {
    drawRule(page, margin, y, margin + measure, y, width, color);
}

// Paragraphs.

/// Draws a word with a position for each of its letters. A line is not one such text, as there are
/// viewers that heed only the first position of a text.
void drawLetters(Drawmere& page, const Type& type, const UnicodeString& word, float x, float y,
                 float spacing) {
    std::vector<MoxLength> positions;
    for (int i = 0; i < word.length(); ++i) {
        positions.push_back(pt(x));
        x += getAdvance(type, word, i) + spacing;
    }
    page.drawText(word, positions, {pt(y)}, {}, PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

void drawLine(Drawmere& page, const Paragraph& paragraph, const Line& line, float y,
              const Spacing& spacing) {
    float x = margin + measure - line.room;
    for (const UnicodeString& word : line.words) {
        if (paragraph.letterPart > 0) {
            drawLetters(page, paragraph.type, word, x, y, spacing.letter);
        } else {
            drawText(page, word, x, y);
        }
        x += getWidth(paragraph.type, word) + spacing.letter * real(word.length() - 1);
        x += spacing.word;
    }
}

/// Returns: the baseline for a line below the paragraph.
float drawParagraph(Drawmere& page, const Paragraph& paragraph, float y) {
    const std::vector<Line> lines = breakLines(paragraph, measure);
    page.pushState();
    setType(page, paragraph.type);
    for (const Line& line : lines) {
        const bool isLast = &line == &lines.back();
        drawLine(page, paragraph, line, y,
                 isLast ? getNaturalSpacing(paragraph) : getFullSpacing(paragraph, line));
        y += paragraph.leading;
    }
    page.popState();
    return y;
}

// The chart: the water level over a day, a cubic curve for every two hours.

constexpr float day = 24;
constexpr float topLevel = 7;

/// A tide of one day, in metres and hours; it swings like a cosine.
struct Tide {
    float mean;
    float range;
    float highHour;
    const MoxColor& color;
};

const Tide springs{3.2F, 5.2F, 6.2F, teal};
const Tide neaps{3.2F, 2.2F, 12.4F, rust};

/// A point or direction of the chart: hours along, metres up.
struct Level {
    float hour;
    float metres;
};

constexpr float swing = 2 * std::numbers::pi_v<float> / 12.42F; // radians in an hour

Level getLevel(const Tide& tide, float hour) {
    return {hour, tide.mean + tide.range / 2 * std::cos(swing * (hour - tide.highHour))};
}

float getSlope(const Tide& tide, float hour) {
    return -swing * tide.range / 2 * std::sin(swing * (hour - tide.highHour));
}

MoxPointT<MoxLength> place(const Box& area, const Level& level) {
    return {pt(area.x + area.width * level.hour / day),
            pt(area.bottom() - area.height * level.metres / topLevel)};
}

/// Continues the path along the curve. A third of the way along each tangent leads to the handles.
void addTide(Drawmere& page, const Box& area, const Tide& tide) {
    constexpr int curves = 12;
    constexpr float step = day / curves;
    constexpr float third = step / 3;
    for (int i = 0; i < curves; ++i) {
        const Level from = getLevel(tide, step * real(i));
        const Level to = getLevel(tide, step * real(i + 1));
        const Level handle1 = {from.hour + third, from.metres + third * getSlope(tide, from.hour)};
        const Level handle2 = {to.hour - third, to.metres - third * getSlope(tide, to.hour)};
        page.setPathCubicBezierCurveTo(place(area, handle1), place(area, handle2), place(area, to));
    }
}

void fillTide(Drawmere& page, const Box& area, const Tide& tide) {
    const MoxColor& color = tide.color;
    page.setFillColor(MoxColor(color.getRed(), color.getGreen(), color.getBlue(), 30));
    page.startPathData();
    page.setPathMoveTo(place(area, {0, 0}));
    page.setPathLineTo(place(area, getLevel(tide, 0)));
    addTide(page, area, tide);
    page.setPathLineTo(place(area, {day, 0}));
    page.setPathClosepath();
    page.endPathData(PAINTMODE_FILL);
}

void strokeTide(Drawmere& page, const Box& area, const Tide& tide) {
    page.setStrokeColor(tide.color);
    page.setStrokeWidth(pt(1.6F));
    page.startPathData();
    page.setPathMoveTo(place(area, getLevel(tide, 0)));
    addTide(page, area, tide);
    page.endPathData(PAINTMODE_STROKE);
}

void drawTide(Drawmere& page, const Box& area, const Tide& tide, const UnicodeString& name) {
    page.pushState();
    fillTide(page, area, tide);
    strokeTide(page, area, tide);
    page.popState();
    const MoxPointT<MoxLength> high = place(area, getLevel(tide, tide.highHour));
    drawLabel(page, {sansFace, 8, tide.color}, TEXTANCHOR_MIDDLE, name, high.x.getRawValue(),
              high.y.getRawValue() - 8);
}

void drawLevels(Drawmere& page, const Box& area) {
    for (int metres = 0; metres <= 6; metres += 2) {
        const float y = place(area, {0, real(metres)}).y.getRawValue();
        drawRule(page, area.x, y, area.right(), y, 0.5F, metres == 0 ? ink : hair);
        drawLabel(page, labelType, TEXTANCHOR_END, UnicodeString(u"0246"[metres / 2]), area.x - 6,
                  y + 3);
    }
}

void drawHours(Drawmere& page, const Box& area) {
    const std::array<const char16_t*, 5> hours = {u"0", u"6", u"12", u"18", u"24"};
    for (std::size_t i = 0; i < hours.size(); ++i) {
        const float x = area.x + area.width * real(i) / 4;
        drawRule(page, x, area.bottom(), x, area.bottom() + 4, 0.5F, ink);
        drawLabel(page, labelType, TEXTANCHOR_MIDDLE, hours.at(i), x, area.bottom() + 14);
    }
}

void drawAxisTitles(Drawmere& page, const Box& area) {
    drawLabel(page, labelType, TEXTANCHOR_MIDDLE, u"hour of the day", area.x + area.width / 2,
              area.bottom() + 27);
    page.pushState();
    // A quarter turn to the left, about the middle of the axis.
    page.setTransMatrix(SVGMatrix(0, -1, 1, 0, margin + 7, area.y + area.height / 2));
    drawLabel(page, labelType, TEXTANCHOR_MIDDLE, u"metres", 0, 0);
    page.popState();
}

void drawChart(Drawmere& page, const Box& area) {
    drawLevels(page, area);
    drawHours(page, area);
    drawAxisTitles(page, area);
    drawTide(page, area, springs, u"springs");
    drawTide(page, area, neaps, u"neaps");
}

void drawFigureCaption(Drawmere& page, float y) {
    const Type linkType{sansFace, labelType.size, teal};
    const UnicodeString text = u"Figure 1. One day at springs and one at neaps, drawn as ";
    drawLabel(page, labelType, TEXTANCHOR_START, text, margin, y);
    page.pushState();
    page.startLink(u"https://www.w3.org/TR/SVG11/paths.html", MoxName());
    setType(page, linkType);
    page.setTextDecoration(TEXTDECORATION_UNDERLINE);
    drawText(page, u"cubic curves", margin + getWidth(labelType, text), y);
    page.endLink();
    page.popState();
}

// The table: numbers stand with their right edges in one line.

using Row = std::array<const char16_t*, 6>;

constexpr Row titles = {u"Moon", u"High", u"Low", u"Range", u"Knots", u"Sailings"};

constexpr std::array<Row, 5> rows = {{
    {u"New", u"5.82", u"0.58", u"5.24", u"2.9", u"1,204"},
    {u"First quarter", u"4.31", u"2.08", u"2.23", u"1.2", u"318"},
    {u"Full", u"5.76", u"0.64", u"5.12", u"2.8", u"1,187"},
    {u"Last quarter", u"4.26", u"2.15", u"2.11", u"1.1", u"96"},
    {u"Mean", u"5.04", u"1.36", u"3.68", u"2.0", u"701"},
}};

void drawRow(Drawmere& page, const Row& row, const Type& type, float y) {
    const float columnWidth = measure / real(row.size());
    drawLabel(page, type, TEXTANCHOR_START, row[0], margin + 4, y);
    for (std::size_t i = 1; i < row.size(); ++i) {
        drawLabel(page, type, TEXTANCHOR_END, row.at(i), margin + columnWidth * real(i + 1) - 4, y);
    }
}

void drawTable(Drawmere& page, float y) {
    constexpr float height = 16;
    constexpr float drop = 5; // from a baseline to the rule below
    drawLabel(page, labelType, TEXTANCHOR_START,
              u"Table 1. The tide by the phases of the moon, heights in metres", margin, y);
    drawRuleAcross(page, y + 7, 1, ink);
    y += 7 + height - drop;
    drawRow(page, titles, {sansFace, tableType.size, soft}, y);
    for (const Row& row : rows) {
        const bool isFirst = &row == &rows.front();
        const bool isMean = &row == &rows.back();
        drawRuleAcross(page, y + drop, 0.5F, isFirst || isMean ? ink : hair);
        y += height;
        drawRow(page, row, tableType, y);
    }
    drawRuleAcross(page, y + drop, 1, ink);
}

// The page, from top to bottom.

void drawHeading(Drawmere& page) {
    drawLabel(page, labelType, TEXTANCHOR_START, u"Harbour Notes", margin, 50);
    drawLabel(page, labelType, TEXTANCHOR_END, u"Number 7", margin + measure, 50);
    drawLabel(page, {serifFace, 25, ink, FONTWEIGHT_BOLD}, TEXTANCHOR_START, u"What the Water Does",
              margin, 104);
    drawLabel(page, {sansFace, 10, soft}, TEXTANCHOR_START,
              u"A page about tides, for those who tie up boats", margin, 123);
    drawRuleAcross(page, 136, 1.5F, teal);
}

void drawPage(Drawmere& page) {
    page.setFillColor(white);
    page.drawRect(pt(0), pt(0), pt(pageWidth), pt(pageHeight), pt(0), pt(0), PAINTMODE_FILL);
    drawHeading(page);
    float y = drawParagraph(page, {tideText, bodyType, 15.5F, 0, 0}, 162);
    y = drawParagraph(page, {springText, bodyType, 15.5F, 16, 0}, y);
    drawChart(page, {margin + 32, y, measure - 40, 180});
    drawFigureCaption(page, y + 231);
    drawTable(page, y + 265);
    drawParagraph(page, {noteText, noteType, 13, 0, 0.3F}, y + 400);
    drawLabel(page, labelType, TEXTANCHOR_MIDDLE, u"27", pageWidth / 2, pageHeight - 40);
}

/// Writes the page to the file `path`.
void writePage(const UnicodeString& path) {
    SVGConfig config;
    config.streamOutput = false;       // pages go to files, not to a stream
    config.saveOption = u"decimals=2"; // more would not be seen
    SVGPageUri uri(path);              // a run of one page ends under this plain name
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawmere.startPage(27, MoxRectT<MoxLength>(pt(0), pt(0), pt(pageWidth), pt(pageHeight)));
    drawmere.setCanvasSize(pt(pageWidth), pt(pageHeight));
    drawPage(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

} // namespace

int main(int argc, char** argv) {
    try {
        writePage(argc > 1 ? UnicodeString::fromUTF8(argv[1]) : UnicodeString(u"page.svg"));
    } catch (const MoxError& error) {
        std::fprintf(stderr, "page: %s\n", error.what());
        return 1;
    }
}
