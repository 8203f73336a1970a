/// A page that writes what it is told, call by call.
#pragma once

#include "Drawmere.h"

#include <string>
#include <vector>

namespace DrawmereTest {

/// Takes some of the drawing calls and writes each shape with all of its attributes and its whole
/// matrix: no groups, nothing inherited, nothing left out. What it makes is what a caller means.
/// The calls have the names and arguments of the public class.
class NaivePage {
public:
    NaivePage();

    /// Returns: a document of 100 by 100 points with all that was drawn.
    std::string document() const;

    void pushState();
    void popState();
    void setTransMatrix(const DrawmereNS::SVGMatrix& matrix);
    void setFillColor(const DrawmereNS::MoxColor& color);
    void setFillColorName(const DrawmereNS::UnicodeString& name);
    void setStrokeColor(const DrawmereNS::MoxColor& color);
    void setStrokeColorName(const DrawmereNS::UnicodeString& name);
    void setStrokeWidth(DrawmereNS::MoxLength width);
    void setFillRule(DrawmereNS::FILLRULE rule);
    void setOpacity(float value, DrawmereNS::OPACITYDEST dest);
    void setDashLine(const DrawmereNS::MoxLength* dashes, int count, DrawmereNS::MoxLength offset);
    void setLineCap(DrawmereNS::LINECAP cap);
    void setLineJoin(DrawmereNS::LINEJOIN join);
    void setMiterLimit(float limit);
    void startLink(const DrawmereNS::UnicodeString& uri, const DrawmereNS::MoxName& show);
    void endLink();

    void drawLine(DrawmereNS::MoxLength x1, DrawmereNS::MoxLength y1, DrawmereNS::MoxLength x2,
                  DrawmereNS::MoxLength y2, DrawmereNS::PAINTMODE mode);
    void drawRect(DrawmereNS::MoxLength x, DrawmereNS::MoxLength y, DrawmereNS::MoxLength width,
                  DrawmereNS::MoxLength height, DrawmereNS::MoxLength rx, DrawmereNS::MoxLength ry,
                  DrawmereNS::PAINTMODE mode);
    void drawCircle(DrawmereNS::MoxLength cx, DrawmereNS::MoxLength cy, DrawmereNS::MoxLength r,
                    DrawmereNS::PAINTMODE mode);
    void drawEllipse(DrawmereNS::MoxLength cx, DrawmereNS::MoxLength cy, DrawmereNS::MoxLength rx,
                     DrawmereNS::MoxLength ry, DrawmereNS::PAINTMODE mode);
    void drawPolyline(const float* points, int count, DrawmereNS::PAINTMODE mode);
    void drawPolygon(const float* points, int count, DrawmereNS::PAINTMODE mode);

private:
    /// A matrix in the precision of the renderer.
    struct Matrix {
        double a = 1;
        double b = 0;
        double c = 0;
        double d = 1;
        double e = 0;
        double f = 0;
    };

    struct State {
        Matrix matrix;
        std::string fill = "none";
        std::string stroke = "none";
        std::string fillRule = "evenodd";
        std::string lineCap = "butt";
        std::string lineJoin = "miter";
        std::string dashes = "none";
        double fillOpacity = 1;
        double strokeOpacity = 1;
        double opacity = 1;
        double strokeWidth = 1;
        double miterLimit = 4;
        double dashOffset = 0;
    };

    struct Geometry {
        const char* name;
        double value;
    };

    void write(const char* element, const std::vector<Geometry>& geometry,
               DrawmereNS::PAINTMODE mode);
    void writePoints(const char* element, const float* points, int count,
                     DrawmereNS::PAINTMODE mode);
    void writeState(DrawmereNS::PAINTMODE mode);
    void writeText(const char* name, const std::string& value);
    void writeNumber(const char* name, double value);

    std::vector<State> states; // the last one is in force
    std::string body;
};

} // namespace DrawmereTest
