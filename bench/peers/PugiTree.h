/// A tree of pugixml that takes what the plain writer takes.
#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>

#include <pugixml.hpp>

namespace DrawmereNS {

/// Keeps elements up to the end of the document. Numbers read as the plain writer's.
class PugiTree {
public:
    explicit PugiTree(const std::string& file) : path(file) {}

    void startPage(float width, float height);

    /// Writes the file. Returns: whether that went well.
    bool finish();

    void startElement(std::string_view name);
    void addNumber(std::string_view name, float value);
    void addColor(std::string_view name, std::uint32_t rgb);
    void addText(std::string_view name, std::string_view value);
    void addMatrix(std::string_view name, const std::array<float, 6>& matrix);
    void addContent(const std::string& text);
    /// Adds an attribute with the bytes of a PNG file in base64.
    void addImageData(std::string_view name, const std::string& imagePath);

    void endEmptyElement() { leave(); }

    /// What the element holds comes next.
    void openElement() {}

    void endElement(std::string_view /*name*/) { leave(); }

    void startPath();
    void moveTo(float x, float y);
    void lineTo(float x, float y);
    void curveTo(float x1, float y1, float x2, float y2, float x3, float y3);
    void endPathData();

private:
    void leave() { current = current.parent(); }

    void appendNumber(float number);
    void appendPoint(float x, float y);

    std::string path;
    std::string value; ///< of the attribute in the making
    pugi::xml_document document;
    pugi::xml_node current = document;
};

} // namespace DrawmereNS
