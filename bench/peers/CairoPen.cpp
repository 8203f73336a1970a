// Cairo's SVG surface.
#include "bench/peers/CairoPeer.h"
#include "bench/peers/Pen.h"

#include <optional>

namespace DrawmereNS {
namespace {

class CairoPen : public Pen {
public:
    using Pen::Pen;

    void startDocument(int number) override {
        cairo.emplace(makePath(number), benchPageWidth, benchPageHeight);
        cairo->setMiterLimit(penMiterLimit);
    }

    void finishDocument() override {
        cairo->finish();
        cairo.reset();
    }

    void pushState() override { cairo->save(); }

    void popState() override { cairo->restore(); }

    void setMatrix(const PenMatrix& matrix) override {
        cairo->transform({matrix.a, matrix.b, matrix.c, matrix.d, matrix.e, matrix.f});
    }

    void setFillColor(std::uint32_t rgb) override { cairo->setFillColor(rgb); }

    void setStrokeColor(std::uint32_t rgb) override { cairo->setStrokeColor(rgb); }

    void setStrokeWidth(float width) override { cairo->setStrokeWidth(width); }

    void setFont(std::size_t family, int size) override {
        cairo->setFont(penFamilies[family], static_cast<float>(size));
    }

    void clip(const PenBox& box) override { cairo->clipRect(box.x, box.y, box.width, box.height); }

    void drawRect(const PenBox& box, PenPaint paint) override {
        if (paint.fill) {
            cairo->fillAndStrokeRect(box.x, box.y, box.width, box.height);
        } else {
            cairo->strokeRect(box.x, box.y, box.width, box.height);
        }
    }

    void drawGradient(const PenBox& box, std::uint32_t left, std::uint32_t right) override {
        cairo->fillRect(box.x, box.y, box.width, box.height, left, right);
    }

    void startPath(const BenchPoint& point) override { cairo->moveTo(point.x, point.y); }

    void lineTo(const BenchPoint& point) override { cairo->lineTo(point.x, point.y); }

    void curveTo(const BenchSegment& segment) override {
        cairo->curveTo(segment.control1.x, segment.control1.y, segment.control2.x,
                       segment.control2.y, segment.target.x, segment.target.y);
    }

    void strokePath() override { cairo->strokePath(); }

    void drawText(const PenText& run, float x, float y) override {
        cairo->drawText(run.bytes.c_str(), x, y);
    }

    void drawImage(const std::string& path, const PenBox& box) override {
        cairo->drawPng(path, box.x, box.y, box.width, box.height);
    }

private:
    std::optional<CairoPeer> cairo; ///< of the open document
};

} // namespace

std::unique_ptr<Pen> makePen(const std::string& directory) {
    return std::make_unique<CairoPen>(directory);
}

} // namespace DrawmereNS
