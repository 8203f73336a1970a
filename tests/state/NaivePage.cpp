#include "tests/state/NaivePage.h"

#include "tests/support/Utf8.h"

#include <cstdio>

namespace DrawmereTest {

using namespace DrawmereNS;

namespace {

std::string toText(double number) {
    char digits[32];
    const int length = std::snprintf(digits, sizeof digits, "%.9g", number);
    return std::string(digits, static_cast<std::size_t>(length));
}

double points(MoxLength length) { return static_cast<double>(length.getRawValue()); }

std::string toText(const MoxColor& color) {
    return "rgb(" + std::to_string(color.getRed()) + "," + std::to_string(color.getGreen()) + "," +
           std::to_string(color.getBlue()) + ")";
}

double opacityOf(const MoxColor& color) { return color.getAlpha() / 255.0; }

/// The word with this number; that of number 0 for any number that has none.
template <std::size_t count> const char* wordOf(const char* const (&words)[count], int number) {
    const bool listed = number >= 0 && static_cast<std::size_t>(number) < count;
    return words[listed ? number : 0];
}

constexpr const char* capWords[] = {"butt", "round", "square"};
constexpr const char* joinWords[] = {"miter", "round", "bevel"};
constexpr const char* ruleWords[] = {"nonzero", "evenodd"};

} // namespace

NaivePage::NaivePage() : states(1) {}

std::string NaivePage::document() const {
    return "<svg xmlns=\"http://www.w3.org/2000/svg\" version=\"1.1\" width=\"100pt\""
           " height=\"100pt\" viewBox=\"0 0 100 100\">" +
           body + "</svg>";
}

void NaivePage::pushState() { states.push_back(states.back()); }

void NaivePage::popState() { states.pop_back(); }

void NaivePage::setTransMatrix(const SVGMatrix& matrix) {
    const Matrix outer = states.back().matrix;
    const double a = static_cast<double>(matrix.a);
    const double b = static_cast<double>(matrix.b);
    const double c = static_cast<double>(matrix.c);
    const double d = static_cast<double>(matrix.d);
    const double e = static_cast<double>(matrix.e);
    const double f = static_cast<double>(matrix.f);
    states.back().matrix = {
        outer.a * a + outer.c * b,           outer.b * a + outer.d * b,
        outer.a * c + outer.c * d,           outer.b * c + outer.d * d,
        outer.a * e + outer.c * f + outer.e, outer.b * e + outer.d * f + outer.f};
}

void NaivePage::setFillColor(const MoxColor& color) {
    states.back().fill = toText(color);
    states.back().fillOpacity = opacityOf(color);
}

void NaivePage::setFillColorName(const UnicodeString& name) { states.back().fill = utf8(name); }

void NaivePage::setStrokeColor(const MoxColor& color) {
    states.back().stroke = toText(color);
    states.back().strokeOpacity = opacityOf(color);
}

void NaivePage::setStrokeColorName(const UnicodeString& name) { states.back().stroke = utf8(name); }

void NaivePage::setStrokeWidth(MoxLength width) { states.back().strokeWidth = points(width); }

void NaivePage::setFillRule(FILLRULE rule) { states.back().fillRule = wordOf(ruleWords, rule); }

void NaivePage::setOpacity(float value, OPACITYDEST dest) {
    State& state = states.back();
    double& opacity = dest == OPACITYDEST_FILL     ? state.fillOpacity
                      : dest == OPACITYDEST_STROKE ? state.strokeOpacity
                                                   : state.opacity;
    opacity = static_cast<double>(value);
}

void NaivePage::setDashLine(const MoxLength* dashes, int count, MoxLength offset) {
    State& state = states.back();
    state.dashes = count > 0 ? "" : "none";
    for (int i = 0; i < count; ++i) {
        state.dashes += (i > 0 ? "," : "") + toText(points(dashes[i]));
    }
    state.dashOffset = points(offset);
}

void NaivePage::setLineCap(LINECAP cap) { states.back().lineCap = wordOf(capWords, cap); }

void NaivePage::setLineJoin(LINEJOIN join) { states.back().lineJoin = wordOf(joinWords, join); }

void NaivePage::setMiterLimit(float limit) {
    states.back().miterLimit = static_cast<double>(limit);
}

void NaivePage::startLink(const UnicodeString& /*uri*/, const MoxName& /*show*/) {}

void NaivePage::endLink() {}

void NaivePage::drawLine(MoxLength x1, MoxLength y1, MoxLength x2, MoxLength y2, PAINTMODE mode) {
    write("line", {{"x1", points(x1)}, {"y1", points(y1)}, {"x2", points(x2)}, {"y2", points(y2)}},
          mode);
}

void NaivePage::drawRect(MoxLength x, MoxLength y, MoxLength width, MoxLength height, MoxLength rx,
                         MoxLength ry, PAINTMODE mode) {
    write("rect",
          {{"x", points(x)},
           {"y", points(y)},
           {"width", points(width)},
           {"height", points(height)},
           {"rx", points(rx)},
           {"ry", points(ry)}},
          mode);
}

void NaivePage::drawCircle(MoxLength cx, MoxLength cy, MoxLength r, PAINTMODE mode) {
    write("circle", {{"cx", points(cx)}, {"cy", points(cy)}, {"r", points(r)}}, mode);
}

void NaivePage::drawEllipse(MoxLength cx, MoxLength cy, MoxLength rx, MoxLength ry,
                            PAINTMODE mode) {
    write("ellipse",
          {{"cx", points(cx)}, {"cy", points(cy)}, {"rx", points(rx)}, {"ry", points(ry)}}, mode);
}

void NaivePage::drawPolyline(const float* coordinates, int count, PAINTMODE mode) {
    writePoints("polyline", coordinates, count, mode);
}

void NaivePage::drawPolygon(const float* coordinates, int count, PAINTMODE mode) {
    writePoints("polygon", coordinates, count, mode);
}

void NaivePage::write(const char* element, const std::vector<Geometry>& geometry, PAINTMODE mode) {
    body += std::string("<") + element;
    for (const Geometry& number : geometry) {
        writeNumber(number.name, number.value);
    }
    writeState(mode);
}

void NaivePage::writePoints(const char* element, const float* coordinates, int count,
                            PAINTMODE mode) {
    std::string list;
    for (int i = 0; i < count; ++i) {
        list += (i > 0 ? " " : "") + toText(static_cast<double>(coordinates[i]));
    }
    body += std::string("<") + element;
    writeText("points", list);
    writeState(mode);
}

void NaivePage::writeState(PAINTMODE mode) {
    const State& state = states.back();
    const Matrix& m = state.matrix;
    writeText("transform", "matrix(" + toText(m.a) + "," + toText(m.b) + "," + toText(m.c) + "," +
                               toText(m.d) + "," + toText(m.e) + "," + toText(m.f) + ")");
    writeText("fill", (mode & PAINTMODE_FILL) != 0 ? state.fill : "none");
    writeText("stroke", (mode & PAINTMODE_STROKE) != 0 ? state.stroke : "none");
    writeText("fill-rule", state.fillRule);
    writeText("stroke-linecap", state.lineCap);
    writeText("stroke-linejoin", state.lineJoin);
    writeText("stroke-dasharray", state.dashes);
    writeNumber("fill-opacity", state.fillOpacity);
    writeNumber("stroke-opacity", state.strokeOpacity);
    writeNumber("opacity", state.opacity);
    writeNumber("stroke-width", state.strokeWidth);
    writeNumber("stroke-miterlimit", state.miterLimit);
    writeNumber("stroke-dashoffset", state.dashOffset);
    body += "/>";
}

void NaivePage::writeText(const char* name, const std::string& value) {
    body += std::string(" ") + name + "=\"" + value + "\"";
}

void NaivePage::writeNumber(const char* name, double value) { writeText(name, toText(value)); }

} // namespace DrawmereTest
