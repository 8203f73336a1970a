/// What a caller of the converter can choose about the pages it draws.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

namespace DrawmereConvert {

/// How text is written.
enum TEXTMODE : std::int32_t {
    TEXTMODE_OUTLINES = 0, ///< a path for each run of glyphs, exact in every viewer
    TEXTMODE_FONTS = 1,    ///< positioned text, with the document's own fonts embedded
    TEXTMODE_PLAIN = 2,    ///< positioned text with the names of the fonts
};

/// The options of all pages. What the library itself decides stands in `SVGConfig`.
struct ConvertOptions {
    TEXTMODE textMode = TEXTMODE_OUTLINES;
    float precision = 0.01F; ///< how far outlines of text may be off, across and down, in points
    int shadeDpi = 144; ///< resolution of what can only be shown as an image, shading meshes mainly

    /// Images of more bytes go to a file beside the page, when the page goes to a file.
    std::size_t maxInlineBytes = 7'300'000;

    /// An image that is all of this file is linked to under the reference; none when it is empty.
    std::string linkFile;
    std::string linkReference; ///< UTF-8, from the place of the pages

    // More than this is reported: viewers that are built on libxml2 refuse attributes of 10 MB, and
    // librsvg documents of a million elements. A shape has a group around it as a rule.
    std::size_t maxPathPoints = 600'000;
    std::int64_t maxShapes = 500'000;

    int maxDepth = 256; ///< of elements; what would go deeper is drawn without its clip or mask

    // The page of documents that have none of their own, in points.
    float layoutWidth = 420;
    float layoutHeight = 595;
    float layoutEm = 11;

    std::size_t maxMemory = 0; ///< bytes for the parser of the document, 0 for no limit
};

} // namespace DrawmereConvert
