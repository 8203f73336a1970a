#include "bench/PlainWriter.h"

#include <array>
#include <charconv>
#include <cstring>

#include <fcntl.h>
#include <unistd.h>

namespace DrawmereNS {
namespace {

constexpr std::size_t bufferSize = std::size_t{1} << 20U;
constexpr std::size_t maxNumber = 64; // a float has 39 digits before the point
constexpr int decimals = 3;
constexpr std::size_t imageChunk = std::size_t{3} << 14U;

char* dropTrailingZeros(char* end) {
    while (end[-1] == '0') {
        --end;
    }
    return end[-1] == '.' ? end - 1 : end;
}

using Pair = std::array<char, 2>;

/// Returns: the two characters of base64 for each number of twelve bits.
std::vector<Pair> makePairs() {
    constexpr std::string_view alphabet =
        "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    std::vector<Pair> pairs;
    for (const char first : alphabet) {
        for (const char second : alphabet) {
            pairs.push_back({first, second});
        }
    }
    return pairs;
}

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
    append("\"");
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
    startAttribute("href");
    append("data:image/png;base64,");
    const int source = open(imagePath.c_str(), O_RDONLY | O_CLOEXEC);
    const std::unique_ptr<unsigned char[]> bytes(new unsigned char[imageChunk]);
    ssize_t count = 0;
    while ((count = read(source, bytes.get(), imageChunk)) > 0) {
        appendBase64(bytes.get(), static_cast<std::size_t>(count));
    }
    failed = close(source) != 0 || count < 0 || failed;
    append("\"");
    endEmptyElement();
}

/// Two characters at a time by a table. All chunks but the last are whole triples.
void PlainWriter::appendBase64(const unsigned char* bytes, std::size_t count) {
    static const std::vector<Pair> pairs = makePairs();
    char* out = room(count / 3 * 4 + 4);
    for (; count >= 3; count -= 3, bytes += 3, out += 4) {
        std::memcpy(out, &pairs[bytes[0] << 4U | bytes[1] >> 4U], 2);
        std::memcpy(out + 2, &pairs[(bytes[1] & 0xFU) << 8U | bytes[2]], 2);
    }
    if (count > 0) {
        const unsigned int second = count > 1 ? bytes[1] : 0U;
        std::memcpy(out, &pairs[bytes[0] << 4U | second >> 4U], 2);
        out[2] = count > 1 ? pairs[(second & 0xFU) << 8U][0] : '=';
        out[3] = '=';
        out += 4;
    }
    cursor = out;
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
    constexpr std::string_view digits = "0123456789abcdef";
    char text[] = "#rrggbb";
    for (int i = 6; i > 0; --i) {
        text[i] = digits[rgb & 0xFU];
        rgb >>= 4U;
    }
    addText(name, text);
}

void PlainWriter::addText(std::string_view name, std::string_view value) {
    startAttribute(name);
    append(value);
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

void PlainWriter::startGroup(const Matrix& matrix) {
    startElement("g");
    startAttribute("transform");
    append("matrix(");
    const float numbers[] = {matrix.a, matrix.b, matrix.c, matrix.d, matrix.e, matrix.f};
    for (const float& number : numbers) {
        appendNumber(number);
        append(&number == &numbers[5] ? ")" : ",");
    }
    append("\">");
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
    char* begin = room(maxNumber);
    const auto end =
        std::to_chars(begin, begin + maxNumber, value, std::chars_format::fixed, decimals).ptr;
    cursor = dropTrailingZeros(end);
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
