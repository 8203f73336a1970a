/// What every SVG writer of the table can be told.
#pragma once

#include "bench/BenchShapes.h"

#include <array>
#include <cstdint>
#include <memory>
#include <string>

namespace DrawmereNS {

/// How a shape is painted.
struct PenPaint {
    bool fill;
    bool stroke;
};

/// A run of text, as the characters and as the bytes that one writer or the other takes.
struct PenText {
    UnicodeString text;
    std::string bytes;
};

/// The six numbers of a matrix as SVG 1.1 orders them.
struct PenMatrix {
    float a;
    float b;
    float c;
    float d;
    float e;
    float f;
};

struct PenBox {
    float x;
    float y;
    float width;
    float height;
};

/// The fonts that `Pen::setFont` chooses from.
constexpr std::array<const char*, 2> penFamilies = {"DejaVu Sans Mono", "DejaVu Serif"};

/// The miter limit of SVG, for writers that have another one of their own.
constexpr int penMiterLimit = 4;

/// One writer: the library, a peer, or nobody. Lengths are points on a page of `benchPageWidth` by
/// `benchPageHeight`. Each document of a run is a file of its own in the run's directory.
class Pen {
public:
    explicit Pen(const std::string& directory) : stem(directory + "/page") {}

    Pen(const Pen&) = delete;
    Pen& operator=(const Pen&) = delete;
    virtual ~Pen() = default;

    /// Begins the file `pageN.svg`, counted from 1.
    virtual void startDocument(int number) = 0;
    virtual void finishDocument() = 0;

    /// Gives up what is kept from one document to the next.
    virtual void finishRun() {}

    // The graphic state; the colours and the font are set while no state is saved.
    virtual void pushState() = 0;
    virtual void popState() = 0;
    /// Moves what is drawn up to the next `popState`; called once behind a `pushState`.
    virtual void setMatrix(const PenMatrix& matrix) = 0;
    virtual void setFillColor(std::uint32_t rgb) = 0;
    virtual void setStrokeColor(std::uint32_t rgb) = 0;
    virtual void setStrokeWidth(float width) = 0;
    virtual void setFont(std::size_t family, int size) = 0;

    /// Clips what follows up to the next `popState`; called straight behind a `pushState`.
    virtual void clip(const PenBox& box) = 0;

    virtual void drawRect(const PenBox& box, PenPaint paint) = 0;

    /// Fills a rectangle with a gradient from its left edge to its right one.
    virtual void drawGradient(const PenBox& box, std::uint32_t left, std::uint32_t right) = 0;

    // A path: started with a move, given its segments and stroked.
    virtual void startPath(const BenchPoint& point) = 0;
    virtual void lineTo(const BenchPoint& point) = 0;
    virtual void curveTo(const BenchSegment& segment) = 0;
    virtual void strokePath() = 0;

    virtual void drawText(const PenText& run, float x, float y) = 0;

    /// Stretches a PNG file over `box`.
    virtual void drawImage(const std::string& path, const PenBox& box) = 0;

protected:
    std::string makePath(int number) const { return stem + std::to_string(number) + ".svg"; }

    std::string stem; ///< of the paths of all documents
};

/// Makes the writer that the program is linked with.
std::unique_ptr<Pen> makePen(const std::string& directory);

} // namespace DrawmereNS
