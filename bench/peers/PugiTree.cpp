#include "bench/peers/PugiTree.h"

#include "bench/PlainText.h"

#include <array>
#include <fstream>
#include <iterator>

namespace DrawmereNS {

void PugiTree::startPage(float width, float height) {
    pugi::xml_node declaration = document.append_child(pugi::node_declaration);
    declaration.append_attribute("version") = "1.0";
    declaration.append_attribute("encoding") = "UTF-8";
    startElement("svg");
    addText("xmlns", "http://www.w3.org/2000/svg");
    addNumber("width", width);
    addNumber("height", height);
}

bool PugiTree::finish() { return document.save_file(path.c_str(), "", pugi::format_raw); }

void PugiTree::startElement(std::string_view name) {
    current = current.append_child(name.data()); // every name is a literal, and so ends in a zero
}

void PugiTree::addNumber(std::string_view name, float number) {
    std::array<char, maxPlainNumber> text;
    *printPlainNumber(text.data(), number) = '\0';
    current.append_attribute(name.data()).set_value(text.data());
}

void PugiTree::addColor(std::string_view name, std::uint32_t rgb) {
    current.append_attribute(name.data()).set_value(makePlainColor(rgb).data());
}

void PugiTree::addText(std::string_view name, std::string_view text) {
    value = text;
    current.append_attribute(name.data()).set_value(value.c_str());
}

void PugiTree::addMatrix(std::string_view name, const std::array<float, 6>& matrix) {
    value = "matrix(";
    for (const float& number : matrix) {
        appendNumber(number);
        value += &number == &matrix.back() ? ')' : ',';
    }
    current.append_attribute(name.data()).set_value(value.c_str());
}

void PugiTree::addContent(const std::string& text) {
    current.append_child(pugi::node_pcdata).set_value(text.c_str());
}

void PugiTree::addImageData(std::string_view name, const std::string& imagePath) {
    std::ifstream file(imagePath, std::ios::binary);
    const std::string bytes(std::istreambuf_iterator<char>(file), {});
    std::string data = plainImagePrefix;
    const std::size_t prefix = data.size();
    data.resize(prefix + bytes.size() / 3 * 4 + 4);
    const char* const end = printPlainBase64(
        data.data() + prefix, reinterpret_cast<const unsigned char*>(bytes.data()), bytes.size());
    data.resize(static_cast<std::size_t>(end - data.data()));
    current.append_attribute(name.data()).set_value(data.c_str());
}

void PugiTree::startPath() {
    startElement("path");
    value.clear();
}

void PugiTree::moveTo(float x, float y) {
    value += 'M';
    appendPoint(x, y);
}

void PugiTree::lineTo(float x, float y) {
    value += 'L';
    appendPoint(x, y);
}

void PugiTree::curveTo(float x1, float y1, float x2, float y2, float x3, float y3) {
    value += 'C';
    appendPoint(x1, y1);
    value += ' ';
    appendPoint(x2, y2);
    value += ' ';
    appendPoint(x3, y3);
}

void PugiTree::endPathData() { current.append_attribute("d").set_value(value.c_str()); }

void PugiTree::appendNumber(float number) {
    std::array<char, maxPlainNumber> text;
    value.append(text.data(), printPlainNumber(text.data(), number));
}

void PugiTree::appendPoint(float x, float y) {
    appendNumber(x);
    value += ',';
    appendNumber(y);
}

} // namespace DrawmereNS
