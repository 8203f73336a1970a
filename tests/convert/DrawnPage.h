/// A page of a document and what the converter draws of it.
#pragma once

#include "SVGConfig.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/PageReport.h"

#include <string>
#include <utility>
#include <vector>

namespace DrawmereTest {

/// A page to be made, of 200 by 100 points.
struct PageSource {
    std::string content;   ///< operators
    std::string resources; ///< entries of the page's resources
    /// Objects with numbers from 5 on, for `resources` to refer to: entries of a dictionary, and
    /// the bytes of a stream, if it has any.
    std::vector<std::pair<std::string, std::string>> objects{};
};

/// Returns: resources with a font F that is on no machine.
/// Units: `width` of each of its glyphs, in thousandths of the size.
std::string makeNobodysFont(int width);

/// Returns: the options that are usual but for the mode of text.
DrawmereConvert::ConvertOptions withText(DrawmereConvert::TEXTMODE mode);

/// Draws a page into memory, with the library's defaults but three decimals.
class DrawnPage {
public:
    explicit DrawnPage(
        const PageSource& source,
        const DrawmereConvert::ConvertOptions& options = DrawmereConvert::ConvertOptions(),
        DrawmereNS::SVGConfig::SVGTYPE profile = DrawmereNS::SVGConfig::SVGTYPE_FULL);

    /// Draws a page, counted from 0, of the file `path`.
    DrawnPage(const std::string& path, int page,
              const DrawmereConvert::ConvertOptions& options = DrawmereConvert::ConvertOptions());

    /// Returns: how many elements of this name there are.
    int count(const std::string& name) const;

    /// Returns: the attribute of the first element of this name, "(none)" when there is none.
    std::string attribute(const std::string& element, const std::string& name) const;

    /// Returns: the contents of the text elements that have one.
    std::vector<std::string> texts() const;

    /// Returns: how deep elements nest, 1 for the root alone.
    int depth() const;

    /// Returns: what follows the root's tag and what its first group, the page's anchor, holds.
    std::string body() const;

    /// Returns: how often the report notes what is drawn otherwise.
    int countNotes(DrawmereConvert::APPROXIMATION kind) const;

    std::string svg;
    DrawmereConvert::PageReport report;

private:
    void draw(const std::string& path, int page, const DrawmereConvert::ConvertOptions& options,
              DrawmereNS::SVGConfig::SVGTYPE profile);
};

} // namespace DrawmereTest
