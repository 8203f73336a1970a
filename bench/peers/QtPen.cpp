// Qt's QSvgGenerator.
#include "bench/peers/Pen.h"

#include <map>

#include <QFont>
#include <QGuiApplication>
#include <QImage>
#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>
#include <QPen>
#include <QSvgGenerator>

namespace DrawmereNS {
namespace {

double wide(float number) { return static_cast<double>(number); }

QPointF at(const BenchPoint& point) { return {wide(point.x), wide(point.y)}; }

QRectF makeRect(const PenBox& box) {
    return {wide(box.x), wide(box.y), wide(box.width), wide(box.height)};
}

QString read(const std::string& text) { return QString::fromStdString(text); }

class QtPen : public Pen {
public:
    explicit QtPen(const std::string& directory) : Pen(directory), application(argc, &words) {
        stroke.setJoinStyle(Qt::MiterJoin);
        stroke.setCapStyle(Qt::FlatCap);
        stroke.setMiterLimit(penMiterLimit);
    }

    void startDocument(int number) override {
        constexpr int dotsPerInch = 72;
        const QSize size(static_cast<int>(benchPageWidth), static_cast<int>(benchPageHeight));
        generator = std::make_unique<QSvgGenerator>();
        generator->setFileName(read(makePath(number)));
        generator->setSize(size);
        generator->setViewBox(QRect(QPoint(0, 0), size));
        generator->setResolution(dotsPerInch);
        painter.begin(generator.get());
    }

    void finishDocument() override {
        painter.end();
        generator.reset();
    }

    void pushState() override {
        painter.save();
        savedStroke = stroke;
    }

    void popState() override {
        painter.restore();
        stroke = savedStroke;
    }

    void setMatrix(const PenMatrix& matrix) override {
        painter.setTransform(QTransform(wide(matrix.a), wide(matrix.b), wide(matrix.c),
                                        wide(matrix.d), wide(matrix.e), wide(matrix.f)),
                             /*combine=*/true);
    }

    void setFillColor(std::uint32_t rgb) override { fill = QColor::fromRgb(rgb); }

    void setStrokeColor(std::uint32_t rgb) override { stroke.setColor(QColor::fromRgb(rgb)); }

    void setStrokeWidth(float width) override { stroke.setWidthF(wide(width)); }

    void setFont(std::size_t family, int size) override {
        QFont& font = fonts[{family, size}];
        if (font.pixelSize() != size) {
            font = QFont(penFamilies[family]);
            font.setPixelSize(size);
            font.setKerning(false);
        }
        painter.setFont(font);
    }

    /// The generator of Qt 5 leaves every clip out.
    void clip(const PenBox& box) override { painter.setClipRect(makeRect(box)); }

    void drawRect(const PenBox& box, PenPaint paint) override {
        painter.setPen(stroke);
        painter.setBrush(paint.fill ? QBrush(fill) : QBrush(Qt::NoBrush));
        painter.drawRect(makeRect(box));
    }

    void drawGradient(const PenBox& box, std::uint32_t left, std::uint32_t right) override {
        QLinearGradient gradient(wide(box.x), 0, wide(box.x + box.width), 0);
        gradient.setColorAt(0, QColor::fromRgb(left));
        gradient.setColorAt(1, QColor::fromRgb(right));
        painter.fillRect(makeRect(box), gradient);
    }

    void startPath(const BenchPoint& point) override {
        path = QPainterPath();
        path.moveTo(at(point));
    }

    void lineTo(const BenchPoint& point) override { path.lineTo(at(point)); }

    void curveTo(const BenchSegment& segment) override {
        path.cubicTo(at(segment.control1), at(segment.control2), at(segment.target));
    }

    void strokePath() override { painter.strokePath(path, stroke); }

    void drawText(const PenText& run, float x, float y) override {
        painter.setPen(fill);
        const auto* const units = reinterpret_cast<const QChar*>(run.text.getBuffer());
        painter.drawText(QPointF(wide(x), wide(y)), QString(units, run.text.length()));
    }

    void drawImage(const std::string& file, const PenBox& box) override {
        QImage& image = images[file];
        if (image.isNull()) {
            image.load(read(file));
        }
        painter.drawImage(makeRect(box), image);
    }

private:
    // What an application wants to know of its command line.
    char word[28] = "bench -platform offscreen\0";
    char* words = word;
    int argc = 1;
    QGuiApplication application;
    std::unique_ptr<QSvgGenerator> generator; ///< of the open document
    QPainter painter;
    QPen stroke;
    QPen savedStroke;
    QColor fill;
    QPainterPath path;
    std::map<std::pair<std::size_t, int>, QFont> fonts;
    std::map<std::string, QImage> images;
};

} // namespace

std::unique_ptr<Pen> makePen(const std::string& directory) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    return std::make_unique<QtPen>(directory);
}

} // namespace DrawmereNS
