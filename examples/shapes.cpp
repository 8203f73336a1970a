// A page of charts, drawn with the shape calls of `Drawmere` alone: bars, radar, lines, bubbles and
// a heat map. Usage: shapes [FILE.svg]

#include "Drawmere.h"

#include <array>
#include <cmath>
#include <cstdio>
#include <numbers>
#include <vector>

using namespace DrawmereNS;

namespace {

// A4, landscape. All numbers are points, y grows downwards.
constexpr float pageWidth = 842;
constexpr float pageHeight = 595;

const MoxColor paper(0xF3F5FA);
const MoxColor white(0xFFFFFF);
const MoxColor navy(0x1D2B4F);
const MoxColor grey(0xB4BCCD);
const MoxColor pale(0xE2E7F1);
const std::array<MoxColor, 3> seriesColors = {0x2A9D8F, 0xF4A261, 0xE5566D};

/// An area of the page.
struct Box {
    float x;
    float y;
    float width;
    float height;

    float right() const { return x + width; }

    float bottom() const { return y + height; }

    Box shrunk(float margin) const {
        return {x + margin, y + margin, width - 2 * margin, height - 2 * margin};
    }
};

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

MoxColor withAlpha(const MoxColor& color, int alpha) {
    return MoxColor(color.getRed(), color.getGreen(), color.getBlue(), alpha);
}

float real(auto number) { return static_cast<float>(number); }

/// A number from 0 to 1 that looks random and is the same in each run.
float scatter(int seed) {
    const double number = std::sin(seed * 12.9898 + 4.1414) * 43758.5453;
    return real(number - std::floor(number));
}

void fillBox(Drawmere& page, const Box& box, const MoxColor& color, float corner = 0) {
    page.setFillColor(color);
    page.drawRect(pt(box.x), pt(box.y), pt(box.width), pt(box.height), pt(corner), pt(corner),
                  PAINTMODE_FILL);
}

void drawLine(Drawmere& page, float x1, float y1, float x2, float y2) {
    page.drawLine(pt(x1), pt(y1), pt(x2), pt(y2), PAINTMODE_STROKE);
}

void drawDot(Drawmere& page, float x, float y, float radius) {
    page.drawCircle(pt(x), pt(y), pt(radius), PAINTMODE_FILLSTROKE);
}

// A push before and a pop behind each part keep what it sets from the next.

/// Draws the card of a chart. Returns: the area for the chart on it.
Box drawCard(Drawmere& page, const Box& box, const MoxColor& accent) {
    page.pushState();
    fillBox(page, box, pale, 8);
    fillBox(page, box.shrunk(0.8F), white, 7.2F);
    fillBox(page, {box.x + 16, box.y + 15, 22, 4}, accent, 2);
    fillBox(page, {box.x + 43, box.y + 15, 64, 4}, pale, 2);
    page.popState();
    return {box.x + 24, box.y + 34, box.width - 44, box.height - 56};
}

void drawGrid(Drawmere& page, const Box& box, int columns, int rows) {
    const MoxLength dashes[] = {pt(1.5F), pt(2.5F)};
    page.pushState();
    page.setStrokeColor(grey);
    page.setStrokeWidth(pt(0.5F));
    page.setDashLine(dashes, 2, pt(0));
    for (int row = 0; row < rows; ++row) {
        const float y = box.y + box.height * real(row) / real(rows);
        drawLine(page, box.x, y, box.right(), y);
    }
    for (int column = 1; column <= columns; ++column) {
        const float x = box.x + box.width * real(column) / real(columns);
        drawLine(page, x, box.y, x, box.bottom());
    }
    page.popState();
}

void drawAxes(Drawmere& page, const Box& box, int ticks) {
    page.pushState();
    page.setStrokeColor(navy);
    page.setStrokeWidth(pt(0.9F));
    page.setLineCap(LINECAP_ROUND);
    drawLine(page, box.x, box.y - 5, box.x, box.bottom());
    drawLine(page, box.x, box.bottom(), box.right() + 5, box.bottom());
    for (int tick = 1; tick <= ticks; ++tick) {
        const float x = box.x + box.width * real(tick) / real(ticks);
        drawLine(page, x, box.bottom(), x, box.bottom() + 3);
    }
    page.popState();
}

// The banner: rings for a logo, and a row of pills.

void drawRings(Drawmere& page, float x, float y) {
    page.pushState();
    page.setStrokeWidth(pt(3)); // set ahead of the first ring, it stands once, on the group
    for (const MoxColor& color : seriesColors) {
        page.setStrokeColor(color);
        page.drawCircle(pt(x), pt(y), pt(9), PAINTMODE_STROKE);
        x += 13;
    }
    page.popState();
}

void drawPills(Drawmere& page, float x, float y) {
    for (const MoxColor& color : seriesColors) {
        fillBox(page, {x, y - 5, 10, 10}, color, 3);
        fillBox(page, {x + 15, y - 2.5F, 44, 5}, withAlpha(white, 150), 2.5F);
        x += 74;
    }
}

void drawBanner(Drawmere& page, const Box& box) {
    const float middle = box.y + box.height / 2;
    fillBox(page, box, navy);
    drawRings(page, box.x + 38, middle);
    fillBox(page, {box.x + 90, middle - 4, 170, 8}, white, 4);
    drawPills(page, box.right() - 240, middle);
}

// Bars: three series over twelve months.

float getSales(int month, int series) {
    const double season = std::sin((month - 2 - series) * 0.52);
    return 0.42F + 0.26F * real(season) + 0.03F * real(month) - 0.08F * real(series) +
           0.1F * scatter(month * 3 + series);
}

void drawBars(Drawmere& page, const Box& card) {
    constexpr int months = 12;
    constexpr float barWidth = 9;
    const Box area = drawCard(page, card, seriesColors[0]);
    const float step = area.width / months;
    drawGrid(page, area, 0, 5);
    page.pushState();
    for (int series = 0; series < 3; ++series) {
        for (int month = 0; month < months; ++month) {
            const float height = area.height * getSales(month, series);
            const float x =
                area.x + step * (real(month) + 0.5F) + (real(series) - 1.5F) * (barWidth + 1);
            fillBox(page, {x, area.bottom() - height, barWidth, height}, seriesColors.at(series),
                    1.5F);
        }
    }
    page.popState();
    drawAxes(page, area, months);
}

// Radar: polygons around a centre, which a matrix moves into its place.

constexpr int spokes = 8;

/// Returns: the corners of a polygon whose corner `i` is `radii[i]` from the origin.
std::vector<float> makeStar(const std::array<float, spokes>& radii) {
    std::vector<float> points;
    for (int i = 0; i < spokes; ++i) {
        const double angle = 2 * std::numbers::pi * i / spokes - std::numbers::pi / 2;
        points.push_back(radii.at(i) * real(std::cos(angle)));
        points.push_back(radii.at(i) * real(std::sin(angle)));
    }
    return points;
}

std::vector<float> makeRing(float radius) {
    return makeStar({radius, radius, radius, radius, radius, radius, radius, radius});
}

void drawPolygon(Drawmere& page, std::vector<float> points, PAINTMODE mode) {
    page.drawPolygon(points.data(), static_cast<int>(points.size()), mode);
}

void drawRadarWeb(Drawmere& page, float radius) {
    page.setStrokeColor(grey);
    page.setStrokeWidth(pt(0.5F));
    for (int ring = 1; ring <= 5; ++ring) {
        drawPolygon(page, makeRing(radius * real(ring) / 5), PAINTMODE_STROKE);
    }
    const std::vector<float> ends = makeRing(radius);
    for (std::size_t i = 0; i < ends.size(); i += 2) {
        drawLine(page, 0, 0, ends[i], ends[i + 1]);
    }
}

void drawRadarSeries(Drawmere& page, float radius, int seed, const MoxColor& color) {
    std::array<float, spokes> radii;
    for (int i = 0; i < spokes; ++i) {
        radii.at(i) = radius * (0.42F + 0.5F * scatter(seed + i));
    }
    const std::vector<float> points = makeStar(radii);
    page.setStrokeColor(color);
    page.setStrokeWidth(pt(1.6F));
    page.setLineJoin(LINEJOIN_ROUND);
    page.setFillColor(withAlpha(color, 70));
    drawPolygon(page, points, PAINTMODE_FILLSTROKE);
    page.setFillColor(white);
    for (std::size_t i = 0; i < points.size(); i += 2) {
        drawDot(page, points[i], points[i + 1], 2.2F);
    }
}

void drawRadar(Drawmere& page, const Box& card) {
    const Box area = drawCard(page, card, seriesColors[1]);
    const float radius = area.height / 2 + 4;
    page.pushState();
    page.setTransMatrix(
        SVGMatrix(1, 0, 0, 1, area.x + area.width / 2, area.y + area.height / 2 + 4));
    drawRadarWeb(page, radius);
    drawRadarSeries(page, radius, 15, seriesColors[0]);
    drawRadarSeries(page, radius, 33, seriesColors[1]);
    page.popState();
}

// Lines: three series, the first above a filled area.

std::vector<float> makeCurve(const Box& box, int series) {
    constexpr int points = 15;
    std::vector<float> curve;
    for (int i = 0; i < points; ++i) {
        const float along = real(i) / (points - 1);
        const float wave = std::sin(5.5F * along + 1.3F * real(series));
        const float height = 0.5F + 0.2F * wave + 0.18F * along - 0.14F * real(series) +
                             0.07F * scatter(i + 90 * series);
        curve.push_back(box.x + box.width * along);
        curve.push_back(box.bottom() - box.height * height);
    }
    return curve;
}

void fillBelow(Drawmere& page, std::vector<float> curve, const Box& box, const MoxColor& color) {
    curve.insert(curve.end(), {box.right(), box.bottom(), box.x, box.bottom()});
    page.setFillColor(color);
    drawPolygon(page, curve, PAINTMODE_FILL);
}

void drawCurve(Drawmere& page, std::vector<float> curve, const MoxColor& color) {
    page.setStrokeColor(color);
    page.setStrokeWidth(pt(1.8F));
    page.setLineJoin(LINEJOIN_ROUND);
    page.drawPolyline(curve.data(), static_cast<int>(curve.size()), PAINTMODE_STROKE);
    page.setFillColor(white);
    page.setStrokeWidth(pt(1.2F));
    for (std::size_t i = 0; i < curve.size(); i += 2) {
        drawDot(page, curve[i], curve[i + 1], 2.1F);
    }
}

void drawLines(Drawmere& page, const Box& card) {
    const Box area = drawCard(page, card, seriesColors[0]);
    drawGrid(page, area, 7, 4);
    page.pushState();
    fillBelow(page, makeCurve(area, 0), area, withAlpha(seriesColors[0], 40));
    for (int series = 0; series < 3; ++series) {
        drawCurve(page, makeCurve(area, series), seriesColors.at(series));
    }
    page.popState();
    drawAxes(page, area, 7);
}

// Bubbles: three clusters, each with a tilted ellipse around it.

struct Cluster {
    float x; ///< of the centre, as a part of the area's width
    float y;
    float rx;
    float ry;
    float tilt; ///< in degrees
};

constexpr std::array<Cluster, 3> clusters = {{
    {0.26F, 0.68F, 46, 28, -18},
    {0.47F, 0.26F, 40, 25, 12},
    {0.76F, 0.55F, 30, 46, 16},
}};

void drawCluster(Drawmere& page, const Cluster& cluster, int seed, const MoxColor& color) {
    page.setFillColor(withAlpha(color, 150));
    page.setStrokeColor(color);
    page.setStrokeWidth(pt(0.8F));
    for (int i = 0; i < 11; ++i) {
        const double angle = 2 * std::numbers::pi * static_cast<double>(scatter(seed + i));
        const float distance = 0.85F * std::sqrt(scatter(seed + 50 + i));
        drawDot(page, cluster.rx * distance * real(std::cos(angle)),
                cluster.ry * distance * real(std::sin(angle)), 2 + 6 * scatter(seed + 100 + i));
    }
    const MoxLength dashes[] = {pt(4), pt(3)};
    page.setDashLine(dashes, 2, pt(0));
    page.drawEllipse(pt(0), pt(0), pt(cluster.rx), pt(cluster.ry), PAINTMODE_STROKE);
}

void drawBubbles(Drawmere& page, const Box& card) {
    const Box area = drawCard(page, card, seriesColors[2]);
    drawGrid(page, area, 4, 4);
    for (std::size_t i = 0; i < clusters.size(); ++i) {
        const Cluster& cluster = clusters[i];
        SVGMatrix place;
        place = place.translate(area.x + area.width * cluster.x, area.y + area.height * cluster.y);
        page.pushState();
        page.setTransMatrix(place.rotate(cluster.tilt));
        drawCluster(page, cluster, 200 * static_cast<int>(i) + 7, seriesColors[i]);
        page.popState();
    }
    drawAxes(page, area, 4);
}

// Heat map: a rectangle for each value, from pale to navy.

MoxColor mix(const MoxColor& from, const MoxColor& to, float part) {
    const auto channel = [part](int one, int other) {
        return static_cast<int>(std::lround(real(one) + real(other - one) * part));
    };
    return MoxColor(channel(from.getRed(), to.getRed()), channel(from.getGreen(), to.getGreen()),
                    channel(from.getBlue(), to.getBlue()));
}

MoxColor getHeatColor(float heat) {
    const MoxColor& middle = seriesColors[0];
    return heat < 0.5F ? mix(pale, middle, 2 * heat) : mix(middle, navy, 2 * heat - 1);
}

float getHeat(int column, int row) {
    const double wave = std::sin(column * 0.55 + 0.6) * std::cos((row - 3) * 0.5);
    return 0.44F + 0.36F * real(wave) + 0.2F * (scatter(column * 9 + row) - 0.4F);
}

void drawHeatMap(Drawmere& page, const Box& card) {
    constexpr int columns = 13;
    constexpr int rows = 9;
    const Box area = drawCard(page, card, navy).shrunk(-2);
    const float width = area.width / columns;
    const float height = area.height / rows;
    page.pushState();
    for (int row = 0; row < rows; ++row) {
        for (int column = 0; column < columns; ++column) {
            const Box cell = {area.x + width * real(column), area.y + height * real(row), width,
                              height};
            fillBox(page, cell.shrunk(0.8F), getHeatColor(getHeat(column, row)), 2);
        }
    }
    page.popState();
}

void drawPage(Drawmere& page) {
    fillBox(page, {0, 0, pageWidth, pageHeight}, paper);
    drawBanner(page, {0, 0, pageWidth, 54});
    drawBars(page, {24, 74, 500, 240});
    drawRadar(page, {540, 74, 278, 240});
    drawLines(page, {24, 330, 306, 241});
    drawBubbles(page, {346, 330, 228, 241});
    drawHeatMap(page, {590, 330, 228, 241});
}

/// Writes the page to the file `path`.
void writePage(const UnicodeString& path) {
    SVGConfig config;
    config.streamOutput = false;       // pages go to files, not to a stream
    config.saveOption = u"decimals=2"; // more would not be seen
    SVGPageUri uri(path);              // a run of one page ends under this plain name
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(pageWidth), pt(pageHeight)));
    drawmere.setCanvasSize(pt(pageWidth), pt(pageHeight));
    drawPage(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

} // namespace

int main(int argc, char** argv) {
    try {
        writePage(argc > 1 ? UnicodeString::fromUTF8(argv[1]) : UnicodeString(u"shapes.svg"));
    } catch (const MoxError& error) {
        std::fprintf(stderr, "shapes: %s\n", error.what());
        return 1;
    }
}
