/// Draws what the interpreter of a page calls for.
#pragma once

#include "tools/convert/BlendedGroups.h"
#include "tools/convert/Canvas.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/ImageWriter.h"
#include "tools/convert/Layers.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/PaintColors.h"
#include "tools/convert/PathPainter.h"
#include "tools/convert/ShadingWriter.h"
#include "tools/convert/TextPainter.h"

#include <mupdf/fitz.h>

#include <exception>
#include <functional>
#include <vector>

namespace DrawmereConvert {

/// One page on its way into the open document. Its operations, with those of `paths` and `texts`,
/// are the callbacks of a device of MuPDF; matrices and areas are in the document's coordinates.
/// They throw; `PageDevice` keeps that from MuPDF.
class PagePainter {
public:
    /// Shape: `area`, where the page is in the document; `scanPage` looks ahead at it; `pageRun`
    /// runs it again.
    PagePainter(fz_context* context, const ConvertOptions& chosen, GlyphOutlines& glyphOutlines,
                FontBook& fontBook, PageReport& pageReport, Drawmere& drawmere, const fz_rect& area,
                const std::function<void(GroupScan&)>& scanPage, const PageRun& pageRun);

    void fillShade(fz_shade* shade, const fz_matrix& matrix, float alpha);
    void fillImage(fz_image* image, const fz_matrix& matrix, float alpha);
    void fillImageMask(fz_image* image, const fz_matrix& matrix, const Paint& paint);
    void clipImageMask(fz_image* image, const fz_matrix& matrix);

    void popClip() { layers.pop(); }

    void beginMask(const fz_rect& area, bool isLuminosity, const MoxColor* backdrop);

    void endMask() { layers.endMask(); }

    void beginGroup(const fz_rect& area, bool isKnockout, int blendMode, float alpha);

    void endGroup();

    /// Returns: whether what comes is part of a picture that is drawn already.
    bool isSkipping() const { return skippedGroups > 0; }

    /// Leaves out something that opens.
    void skipOpening() { layers.skipFacts(); }

    void beginTile(const fz_rect& area, const fz_rect& cell, float xStep, float yStep,
                   const fz_matrix& matrix);

    void endTile() { layers.endTile(); }

    /// For a page that is not all of its document.
    void clipToPage() { layers.clipToPage(); }

    /// Draws what waits; to be called at the end of the page.
    void finish() { layers.finish(); }

    Canvas canvas;
    PaintColors colors;
    PathPainter paths;
    TextPainter texts;
    std::exception_ptr failure; ///< what ended the drawing, null as long as all is well

private:
    /// Puts the outline of a small mask into `current`. Returns: false for one that has none.
    bool traceMask(fz_image* image, const fz_matrix& matrix);
    /// Draws a group with a blend mode as a picture. Returns: false for one to be drawn otherwise.
    bool drawBlended(std::size_t number, const fz_rect& area);
    void fillBackground(const fz_shade& shade, const fz_rect& area, float alpha);

    /// A group that is open.
    struct OpenGroup {
        bool isKnockout = false;
        std::int64_t firstElement = 0;
    };

    fz_context* ctx;
    PageReport& report;
    const ConvertOptions& options;
    ImageWriter images;
    ShadingWriter shadings;
    Layers layers;
    BlendedGroups blended;
    std::size_t blendedCount = 0; // of groups with a blend mode up to now
    std::size_t pictureCount = 0;
    std::int64_t pictureWork = 0;
    int skippedGroups = 0; // open, of which the outermost is drawn as a picture
    std::vector<OpenGroup> groups;
    PathData current; // kept for its memory
};

} // namespace DrawmereConvert
