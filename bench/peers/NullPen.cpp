// Nobody: what a workload costs by itself.
#include "bench/peers/Pen.h"

namespace DrawmereNS {
namespace {

class NullPen : public Pen {
public:
    using Pen::Pen;

    void startDocument(int /*number*/) override {}

    void finishDocument() override {}

    void pushState() override {}

    void popState() override {}

    void setMatrix(const PenMatrix& /*matrix*/) override {}

    void setFillColor(std::uint32_t /*rgb*/) override {}

    void setStrokeColor(std::uint32_t /*rgb*/) override {}

    void setStrokeWidth(float /*width*/) override {}

    void setFont(std::size_t /*family*/, int /*size*/) override {}

    void clip(const PenBox& /*box*/) override {}

    void drawRect(const PenBox& /*box*/, PenPaint /*paint*/) override {}

    void drawGradient(const PenBox& /*box*/, std::uint32_t /*left*/,
                      std::uint32_t /*right*/) override {}

    void startPath(const BenchPoint& /*point*/) override {}

    void lineTo(const BenchPoint& /*point*/) override {}

    void curveTo(const BenchSegment& /*segment*/) override {}

    void strokePath() override {}

    void drawText(const PenText& /*run*/, float /*x*/, float /*y*/) override {}

    void drawImage(const std::string& /*path*/, const PenBox& /*box*/) override {}
};

} // namespace

std::unique_ptr<Pen> makePen(const std::string& directory) {
    return std::make_unique<NullPen>(directory);
}

} // namespace DrawmereNS
