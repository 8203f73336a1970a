/// Drawing element by element, as a program does that prints SVG by itself.
#pragma once

#include "bench/peers/Pen.h"

#include <optional>
#include <string_view>
#include <vector>

namespace DrawmereNS {

/// Every shape has all its own attributes, a matrix too; only a clip makes a group.
/// `Markup` takes elements and attributes, as `PlainWriter` does.
template <typename Markup> class ElementPen : public Pen {
public:
    using Pen::Pen;

    void startDocument(int number) override {
        markup.emplace(makePath(number));
        markup->startPage(benchPageWidth, benchPageHeight);
        state = State();
        lastId = 0;
    }

    void finishDocument() override {
        markup->finish();
        markup.reset();
    }

    void pushState() override { saved.push_back(state); }

    void popState() override {
        if (state.isClipped) {
            markup->endElement("g");
        }
        state = saved.back();
        saved.pop_back();
    }

    void setMatrix(const PenMatrix& matrix) override {
        state.matrix = {matrix.a, matrix.b, matrix.c, matrix.d, matrix.e, matrix.f};
    }

    void setFillColor(std::uint32_t rgb) override { state.fillColor = rgb; }

    void setStrokeColor(std::uint32_t rgb) override { state.strokeColor = rgb; }

    void setStrokeWidth(float width) override { state.strokeWidth = width; }

    void setFont(std::size_t newFamily, int size) override {
        family = penFamilies[newFamily];
        fontSize = static_cast<float>(size);
    }

    void clip(const PenBox& box) override {
        const std::string id = "c" + std::to_string(++lastId);
        markup->startElement("clipPath");
        markup->addText("id", id);
        markup->openElement();
        startBox("rect", box);
        markup->endEmptyElement();
        markup->endElement("clipPath");
        markup->startElement("g");
        markup->addText("clip-path", "url(#" + id + ")");
        markup->openElement();
        state.isClipped = true;
    }

    void drawRect(const PenBox& box, PenPaint paint) override {
        startBox("rect", box);
        addPaint(paint);
        markup->endEmptyElement();
    }

    void drawGradient(const PenBox& box, std::uint32_t left, std::uint32_t right) override {
        const std::string id = "g" + std::to_string(++lastId);
        markup->startElement("linearGradient");
        markup->addText("id", id);
        markup->addText("gradientUnits", "userSpaceOnUse");
        markup->addNumber("x1", box.x);
        markup->addNumber("y1", 0);
        markup->addNumber("x2", box.x + box.width);
        markup->addNumber("y2", 0);
        markup->openElement();
        addStop(left, 0);
        addStop(right, 1);
        markup->endElement("linearGradient");
        startBox("rect", box);
        markup->addText("fill", "url(#" + id + ")");
        markup->endEmptyElement();
    }

    void startPath(const BenchPoint& point) override {
        markup->startPath();
        markup->moveTo(point.x, point.y);
    }

    void lineTo(const BenchPoint& point) override { markup->lineTo(point.x, point.y); }

    void curveTo(const BenchSegment& segment) override {
        markup->curveTo(segment.control1.x, segment.control1.y, segment.control2.x,
                        segment.control2.y, segment.target.x, segment.target.y);
    }

    void strokePath() override {
        markup->endPathData();
        addPaint({.fill = false, .stroke = true});
        markup->endEmptyElement();
    }

    void drawText(const PenText& run, float x, float y) override {
        markup->startElement("text");
        markup->addNumber("x", x);
        markup->addNumber("y", y);
        markup->addText("font-family", family);
        markup->addNumber("font-size", fontSize);
        addPaint({.fill = true, .stroke = false});
        markup->openElement();
        markup->addContent(run.bytes);
        markup->endElement("text");
    }

    void drawImage(const std::string& path, const PenBox& box) override {
        startBox("image", box);
        markup->addText("preserveAspectRatio", "none");
        markup->addImageData("href", path);
        markup->endEmptyElement();
    }

private:
    struct State {
        std::optional<std::array<float, 6>> matrix;
        float strokeWidth = 1.0F;
        std::uint32_t fillColor = 0;
        std::uint32_t strokeColor = 0;
        bool isClipped = false;
    };

    void startBox(std::string_view name, const PenBox& box) {
        markup->startElement(name);
        markup->addNumber("x", box.x);
        markup->addNumber("y", box.y);
        markup->addNumber("width", box.width);
        markup->addNumber("height", box.height);
    }

    void addPaint(PenPaint paint) {
        if (paint.fill) {
            markup->addColor("fill", state.fillColor);
        } else {
            markup->addText("fill", "none");
        }
        if (paint.stroke) {
            markup->addColor("stroke", state.strokeColor);
            markup->addNumber("stroke-width", state.strokeWidth);
        }
        if (state.matrix) {
            markup->addMatrix("transform", *state.matrix);
        }
    }

    void addStop(std::uint32_t rgb, float offset) {
        markup->startElement("stop");
        markup->addColor("stop-color", rgb);
        markup->addNumber("offset", offset);
        markup->endEmptyElement();
    }

    std::optional<Markup> markup; ///< of the open document
    State state;
    std::vector<State> saved;
    int lastId = 0;
    std::string_view family = penFamilies[0];
    float fontSize = 0.0F;
};

} // namespace DrawmereNS
