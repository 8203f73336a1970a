/// The yardstick of the benches: SVG written straight into a buffer, without a tree.
#pragma once

#include <array>
#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace DrawmereNS {

/// Writes each element as it is drawn, with all its own attributes and absolute coordinates: what a
/// program does that prints SVG by itself and cares for speed. Numbers have three decimals at most,
/// colours six digits. Lengths are points. Nothing is checked but the writing itself.
class PlainWriter {
public:
    /// How a shape is painted.
    struct Paint {
        bool fill;
        bool stroke;
    };

    /// The six numbers of a matrix as SVG 1.1 orders them.
    using Matrix = std::array<float, 6>;

    /// Makes the file `path` and begins a document.
    explicit PlainWriter(const std::string& path);
    PlainWriter(const PlainWriter&) = delete;
    PlainWriter& operator=(const PlainWriter&) = delete;
    ~PlainWriter();

    /// Writes the root's start tag for a page of this size.
    void startPage(float width, float height);

    /// Ends the document and writes what is left. Returns: the bytes of the file, 0 when it could
    /// not be written.
    std::size_t finish();

    // The graphic state; a translation moves the coordinates of later shapes.
    void save() { saved.push_back(state); }

    void restore();
    void translate(float x, float y);

    void setFillColor(std::uint32_t rgb) { state.fillColor = rgb; }

    void setStrokeColor(std::uint32_t rgb) { state.strokeColor = rgb; }

    void setStrokeWidth(float width) { state.strokeWidth = width; }

    void drawRect(float x, float y, float width, float height, Paint paint);
    void drawCircle(float cx, float cy, float r, Paint paint);
    void drawLine(float x1, float y1, float x2, float y2);

    // A path: started, given its segments, and ended; it has no fill.
    void startPath();
    void moveTo(float x, float y);
    void lineTo(float x, float y);
    void curveTo(float x1, float y1, float x2, float y2, float x3, float y3);
    void endPath();

    /// Ends only the data of the path; its other attributes follow.
    void endPathData() { append("\""); }

    void setFont(std::string_view family, float size) {
        fontFamily = family;
        fontSize = size;
    }

    /// Writes a run of text at one x or one for each character. `text` needs no escapes.
    void drawText(std::string_view text, std::span<const float> x, float y);

    /// Writes an image with the bytes of a PNG file in base64, without line feeds.
    void drawImage(const std::string& imagePath, float x, float y, float width, float height);

    // Markup as it stands: an element is started, gets its attributes, and is ended.
    void startElement(std::string_view name);
    void addNumber(std::string_view name, float value);
    void addColor(std::string_view name, std::uint32_t rgb);
    void addText(std::string_view name, std::string_view value);
    void addMatrix(std::string_view name, const Matrix& matrix);
    /// Adds the bytes of a PNG file in base64.
    void addImageData(std::string_view name, const std::string& imagePath);

    /// Adds text that needs no escapes to an element that is open.
    void addContent(std::string_view text) { append(text); }

    void endEmptyElement() { append("/>"); }

    /// Opens a link. `target` needs no escapes.
    void startLink(std::string_view target);

    void endLink() { append("</a>"); }

    /// Ends the start tag of an element that has content.
    void openElement() { append(">"); }

    void endElement(std::string_view name);

private:
    struct State {
        float shiftX = 0.0F;
        float shiftY = 0.0F;
        float strokeWidth = 1.0F;
        std::uint32_t fillColor = 0;
        std::uint32_t strokeColor = 0;
    };

    void append(std::string_view bytes);
    void appendNumber(float value);
    void appendPoint(float x, float y);
    void startAttribute(std::string_view name);
    void addPaint(Paint paint);
    char* room(std::size_t count);
    void flush();

    int file;
    bool failed = false;
    std::size_t flushed = 0;
    State state;
    std::vector<State> saved;
    std::string fontFamily;
    float fontSize = 0.0F;
    std::unique_ptr<char[]> buffer;
    char* cursor;
};

} // namespace DrawmereNS
