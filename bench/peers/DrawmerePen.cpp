// The library, called as a page formatter calls it.
#include "Drawmere.h"
#include "bench/peers/Pen.h"
#include "foundation/records/TLFileImage.h"

#include <map>

namespace DrawmereNS {
namespace {

using TalGraphic::TLFileImage;

MoxLength pt(float number) { return MoxLength::fromRaw(number); }

MoxPointT<MoxLength> at(const BenchPoint& point) { return {pt(point.x), pt(point.y)}; }

class DrawmerePen : public Pen {
public:
    explicit DrawmerePen(const std::string& directory)
        : Pen(directory), uri(UnicodeString::fromUTF8(stem + ".svg")) {
        config.streamOutput = false;
        config.keepPageNumber = true;
        config.saveOption = u"decimals=3";
        drawmere = std::make_unique<Drawmere>(&config, &uri);
    }

    void startDocument(int number) override {
        drawmere->initRootSvg(UnicodeString::fromUTF8(makePath(number)));
        const MoxLength width = pt(benchPageWidth);
        const MoxLength height = pt(benchPageHeight);
        drawmere->startPage(number, MoxRectT<MoxLength>(pt(0), pt(0), width, height));
        drawmere->setCanvasSize(width, height);
    }

    void finishDocument() override {
        drawmere->endPage();
        drawmere->finishRootSvg();
    }

    void finishRun() override {
        drawmere->finish();
        drawmere.reset();
    }

    void pushState() override { drawmere->pushState(); }

    void popState() override { drawmere->popState(); }

    void setMatrix(const PenMatrix& matrix) override {
        drawmere->setTransMatrix(
            SVGMatrix(matrix.a, matrix.b, matrix.c, matrix.d, matrix.e, matrix.f));
    }

    void setFillColor(std::uint32_t rgb) override { drawmere->setFillColor(MoxColor(rgb)); }

    void setStrokeColor(std::uint32_t rgb) override { drawmere->setStrokeColor(MoxColor(rgb)); }

    void setStrokeWidth(float width) override { drawmere->setStrokeWidth(pt(width)); }

    void setFont(std::size_t family, int size) override {
        font = findFont(family, size);
        drawmere->setFont(font, nullptr);
    }

    /// A definition takes the font away.
    void clip(const PenBox& box) override {
        drawmere->startClipRect(USERSPACEONUSE);
        drawRect(box, {.fill = true, .stroke = false});
        drawmere->endClipDef();
        drawmere->doClip();
        drawmere->setFont(font, nullptr);
    }

    void drawRect(const PenBox& box, PenPaint paint) override {
        const PAINTMODE fill = paint.stroke ? PAINTMODE_FILLSTROKE : PAINTMODE_FILL;
        drawmere->drawRect(pt(box.x), pt(box.y), pt(box.width), pt(box.height), pt(0), pt(0),
                           paint.fill ? fill : PAINTMODE_STROKE);
    }

    void drawGradient(const PenBox& box, std::uint32_t left, std::uint32_t right) override {
        drawmere->pushState();
        const UnicodeString id = drawmere->startLinearGradient(
            pt(box.x), pt(0), pt(box.x + box.width), pt(0), SVGMatrix(), USERSPACEONUSE, GRADPAD);
        drawmere->setStopColor(MoxColor(left), 0, 1);
        drawmere->setStopColor(MoxColor(right), 1, 1);
        drawmere->endGradiant();
        drawmere->setFillColorId(id);
        drawRect(box, {.fill = true, .stroke = false});
        drawmere->popState();
        drawmere->setFont(font, nullptr);
    }

    void startPath(const BenchPoint& point) override {
        drawmere->startPathData();
        drawmere->setPathMoveTo(at(point));
    }

    void lineTo(const BenchPoint& point) override { drawmere->setPathLineTo(at(point)); }

    void curveTo(const BenchSegment& segment) override {
        drawmere->setPathCubicBezierCurveTo(at(segment.control1), at(segment.control2),
                                            at(segment.target));
    }

    void strokePath() override { drawmere->endPathData(PAINTMODE_STROKE); }

    void drawText(const PenText& run, float x, float y) override {
        drawmere->drawText(run.text, pt(x), pt(y), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                           /*leftToRight=*/true);
    }

    /// The cursor of the tree comes back from the definitions with the state.
    void drawImage(const std::string& path, const PenBox& box) override {
        TLFileImage image(UnicodeString::fromUTF8(path));
        drawmere->pushState();
        drawmere->drawImage(&image, image.getGraphicType(), pt(box.width), pt(box.height),
                            pt(box.x), pt(box.y));
        drawmere->popState();
    }

private:
    SVGFont* findFont(std::size_t family, int size) {
        const auto [place, isNew] = fonts.try_emplace({family, size});
        SVGFont& found = place->second;
        if (isNew) {
            const UnicodeString name = UnicodeString::fromUTF8(penFamilies[family]);
            found.setFontAttribute(name, pt(static_cast<float>(size)), FONTWEIGHT_NORMAL,
                                   FSTYLE_NORMAL, name, /*familyOnly=*/true);
        }
        return &found;
    }

    SVGConfig config;
    SVGPageUri uri;
    std::unique_ptr<Drawmere> drawmere;
    std::map<std::pair<std::size_t, int>, SVGFont> fonts;
    SVGFont* font = nullptr; // borrowed from `fonts`
};

} // namespace

std::unique_ptr<Pen> makePen(const std::string& directory) {
    return std::make_unique<DrawmerePen>(directory);
}

} // namespace DrawmereNS
