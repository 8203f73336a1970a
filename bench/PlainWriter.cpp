#include "bench/PlainWriter.h"

#include "bench/PlainText.h"

#include <cstring>

#include <fcntl.h>
#include <unistd.h>

namespace DrawmereNS {
namespace {

constexpr std::size_t bufferSize = std::size_t{1} << 20U;
constexpr std::size_t imageChunk = std::size_t{3} << 14U;

} // namespace

PlainWriter::PlainWriter(const std::string& path)
    : file(open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0644)), failed(file < 0),
      buffer(new char[bufferSize]), cursor(buffer.get()) {
    append("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n");
}

PlainWriter::~PlainWriter() {
    if (file >= 0) {
        close(file);
    }
}

void PlainWriter::startPage(float width, float height) {
    startElement("svg");
    addText("xmlns", "http://www.w3.org/2000/svg");
    addNumber("width", width);
    addNumber("height", height);
    append(">");
}

std::size_t PlainWriter::finish() {
    append("</svg>\n");
    flush();
    failed = close(file) != 0 || failed;
    file = -1;
    return failed ? 0 : flushed;
}

void PlainWriter::restore() {
    state = saved.back();
    saved.pop_back();
}

void PlainWriter::translate(float x, float y) {
    state.shiftX += x;
    state.shiftY += y;
}

void PlainWriter::drawRect(float x, float y, float width, float height, Paint paint) {
    startElement("rect");
    addNumber("x", x + state.shiftX);
    addNumber("y", y + state.shiftY);
    addNumber("width", width);
    addNumber("height", height);
    addPaint(paint);
    endEmptyElement();
}

void PlainWriter::drawCircle(float cx, float cy, float r, Paint paint) {
    startElement("circle");
    addNumber("cx", cx + state.shiftX);
    addNumber("cy", cy + state.shiftY);
    addNumber("r", r);
    addPaint(paint);
    endEmptyElement();
}

void PlainWriter::drawLine(float x1, float y1, float x2, float y2) {
    startElement("line");
    addNumber("x1", x1 + state.shiftX);
    addNumber("y1", y1 + state.shiftY);
    addNumber("x2", x2 + state.shiftX);
    addNumber("y2", y2 + state.shiftY);
    addPaint({.fill = false, .stroke = true});
    endEmptyElement();
}

void PlainWriter::startPath() {
    startElement("path");
    startAttribute("d");
}

void PlainWriter::moveTo(float x, float y) {
    append("M");
    appendPoint(x, y);
}

void PlainWriter::lineTo(float x, float y) {
    append("L");
    appendPoint(x, y);
}

void PlainWriter::curveTo(float x1, float y1, float x2, float y2, float x3, float y3) {
    append("C");
    appendPoint(x1, y1);
    append(" ");
    appendPoint(x2, y2);
    append(" ");
    appendPoint(x3, y3);
}

void PlainWriter::endPath() {
    endPathData();
    addPaint({.fill = false, .stroke = true});
    endEmptyElement();
}

void PlainWriter::drawText(std::string_view text, std::span<const float> x, float y) {
    startElement("text");
    startAttribute("x");
    for (const float& number : x) {
        append(&number == x.data() ? "" : " ");
        appendNumber(number + state.shiftX);
    }
    append("\"");
    addNumber("y", y + state.shiftY);
    addText("font-family", fontFamily);
    addNumber("font-size", fontSize);
    addPaint({.fill = true, .stroke = false});
    append(">");
    append(text);
    append("</text>");
}

void PlainWriter::drawImage(const std::string& imagePath, float x, float y, float width,
                            float height) {
    startElement("image");
    addNumber("x", x + state.shiftX);
    addNumber("y", y + state.shiftY);
    addNumber("width", width);
    addNumber("height", height);
    addImageData("href", imagePath);
    endEmptyElement();
}

void PlainWriter::addImageData(std::string_view name, const std::string& imagePath) {
    startAttribute(name);
    append(plainImagePrefix);
    const int source = open(imagePath.c_str(), O_RDONLY | O_CLOEXEC);
    const std::unique_ptr<unsigned char[]> bytes(new unsigned char[imageChunk]);
    ssize_t count = 0;
    while ((count = read(source, bytes.get(), imageChunk)) > 0) {
        const auto size = static_cast<std::size_t>(count);
        cursor = printPlainBase64(room(size / 3 * 4 + 4), bytes.get(), size);
    }
    failed = close(source) != 0 || count < 0 || failed;
    append("\"");
}

void PlainWriter::startElement(std::string_view name) {
    append("<");
    append(name);
}

void PlainWriter::addNumber(std::string_view name, float value) {
    startAttribute(name);
    appendNumber(value);
    append("\"");
}

void PlainWriter::addColor(std::string_view name, std::uint32_t rgb) {
    addText(name, makePlainColor(rgb).data());
}

void PlainWriter::addText(std::string_view name, std::string_view value) {
    startAttribute(name);
    append(value);
    append("\"");
}

void PlainWriter::addMatrix(std::string_view name, const Matrix& matrix) {
    startAttribute(name);
    append("matrix(");
    for (const float& number : matrix) {
        appendNumber(number);
        append(&number == &matrix.back() ? ")" : ",");
    }
    append("\"");
}

void PlainWriter::startLink(std::string_view target) {
    startElement("a");
    addText("xlink:href", target);
    append(">");
}

void PlainWriter::endElement(std::string_view name) {
    append("</");
    append(name);
    append(">");
}

void PlainWriter::addPaint(Paint paint) {
    if (paint.fill) {
        addColor("fill", state.fillColor);
    } else {
        addText("fill", "none");
    }
    if (paint.stroke) {
        addColor("stroke", state.strokeColor);
        addNumber("stroke-width", state.strokeWidth);
    }
}

void PlainWriter::startAttribute(std::string_view name) {
    append(" ");
    append(name);
    append("=\"");
}

void PlainWriter::append(std::string_view bytes) {
    std::memcpy(room(bytes.size()), bytes.data(), bytes.size());
    cursor += bytes.size();
}

void PlainWriter::appendNumber(float value) {
    cursor = printPlainNumber(room(maxPlainNumber), value);
}

void PlainWriter::appendPoint(float x, float y) {
    appendNumber(x + state.shiftX);
    append(",");
    appendNumber(y + state.shiftY);
}

char* PlainWriter::room(std::size_t count) {
    if (count > static_cast<std::size_t>(buffer.get() + bufferSize - cursor)) {
        flush();
    }
    return cursor;
}

void PlainWriter::flush() {
    const auto count = static_cast<std::size_t>(cursor - buffer.get());
    failed = write(file, buffer.get(), count) != static_cast<ssize_t>(count) || failed;
    flushed += count;
    cursor = buffer.get();
}

} // namespace DrawmereNS
