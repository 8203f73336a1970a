/// Clips, masks, groups and patterns around what is drawn.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/ClipStack.h"
#include "tools/convert/GroupScan.h"
#include "tools/convert/ImageWriter.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/PaintColors.h"
#include "tools/convert/Strokes.h"

#include <mupdf/fitz.h>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace DrawmereConvert {

/// A path that is stroked.
struct StrokedPath {
    PathData path;
    StrokeMatrices matrices;
    Pen pen;

    fz_rect getBounds() const {
        return fz_transform_rect(fz_expand_rect(path.getBounds(), getReach(pen)),
                                 matrices.document);
    }
};

/// Keeps what is open around the next object, and opens in the document what that needs.
///
/// The effect of a mask or an opacity goes to the objects one by one where that looks the same.
/// Elsewhere the content becomes a pattern of one cell, with which a rectangle is filled that has
/// the effect: the library knows no other container that has one.
class Layers {
public:
    /// Shape: `area`, that of the page in the document; `scanPage` looks ahead at the page.
    Layers(Canvas& target, PaintColors& paintColors, ImageWriter& imageWriter,
           PageReport& pageReport, const fz_rect& area, int maxDepth,
           std::function<void(GroupScan&)> scanPage);

    // What opens, in pairs with `pop`.

    void pushClip(const PathData& path, bool isEvenOdd);
    void pushStrokeClip(StrokedPath stroked);
    void pushImageMask(fz_image* image, const fz_matrix& matrix);
    /// The same for a mask that has become a path.
    void pushTracedMask(const PathData& path);
    void beginMask(const fz_rect& area, bool isLuminosity, const std::optional<MoxColor>& backdrop);
    /// Goes on from the content of the mask to what is masked, up to `pop`.
    void endMask();
    void beginGroup(const fz_rect& area, float alpha);
    void pop();

    /// Opens a pattern; draws it at `endTile` where `area` and the clip around are.
    void beginTile(const fz_rect& area, const fz_rect& cell, float xStep, float yStep,
                   const fz_matrix& matrix);
    void endTile();

    // What draws.

    /// Makes the document ready for an object. Returns: whether it shows.
    bool enter(const fz_rect& bounds);

    /// Has `draw` draw inside `bounds`, which the document is ready for, what has a matrix of its
    /// own.
    void drawMoved(const fz_rect& bounds, const std::function<void()>& draw);

    /// The same as `enter` for the image that `findMaskOf` gave its mask to.
    bool enterMasked(const fz_rect& bounds) {
        return !scopes.back()->isHidden && clips().enter(bounds);
    }

    /// Fills what the innermost clip shows inside `bounds`.
    void fillClip(const fz_rect& bounds, const Paint& paint);

    /// Returns: the mask that was opened last, when nothing has been drawn through it and it lies
    /// where `matrix` puts an image; null otherwise. The image then takes care of it.
    fz_image* findMaskOf(const fz_matrix& matrix);

    /// Cuts off of the rectangle `path` what no clip can be written for.
    void cutByHand(PathData& path);

    /// Returns: the part of the page that shows.
    fz_rect getVisible() { return clips().getVisible(); }

    /// Returns: `matrix` in the coordinates in which is drawn.
    fz_matrix place(const fz_matrix& matrix) const {
        return fz_concat(matrix, scopes.back()->matrix);
    }

    fz_rect placeArea(const fz_rect& area) const {
        return fz_transform_rect(area, scopes.back()->matrix);
    }

    /// Cuts everything off at the edges of the page.
    void clipToPage();

    /// Closes everything.
    void finish();

    /// Returns: whether drawing goes to the page itself.
    bool isOnPage() const { return scopes.size() == 1 && !isReplaying; }

    /// Leaves out one of what opens, which looking ahead has counted.
    void skipFacts() { nextGroup += isReplaying ? 0 : 1; }

    bool isReplaying = false; ///< what comes now was not seen when looking ahead

private:
    enum OPENING : std::int8_t {
        OPENING_CLIP,      ///< a clip of the scope
        OPENING_STROKE,    ///< a stroke that nothing has been drawn through
        OPENING_IMAGEMASK, ///< an image likewise
        OPENING_EFFECT,    ///< effects of the canvas, given back at the end
        OPENING_CONTAINER, ///< a pattern that is drawn at the end
        OPENING_NOTHING,
    };

    /// Where drawing goes: the page, a pattern or a mask.
    struct Scope {
        Scope(Canvas& canvas, PageReport& report, const fz_rect& area, int room)
            : clips(canvas, report, area, room) {}

        ClipStack clips;
        fz_matrix matrix = fz_identity; ///< from the page's coordinates to those here
        UnicodeString id;               ///< of the definition
        std::size_t firstOpening = 0;   ///< of those inside
        bool isHidden = false;          ///< what the profile has no definition for
    };

    struct Opening {
        OPENING kind = OPENING_NOTHING;
        GroupFacts facts{};
        Effects effects{}; ///< those before, or those of the container
        fz_rect area{};
        std::shared_ptr<StrokedPath> stroke{};
        fz_image* image = nullptr; // borrowed: MuPDF holds it as long as the clip
        fz_matrix matrix = fz_identity;
    };

    struct OpenMask {
        fz_rect area{};
        COLORUSE useBefore = COLORUSE_PICTURE;
    };

    ClipStack& clips() { return scopes.back()->clips; }

    Opening* getTop();
    GroupFacts takeFacts();
    void openEffect(Opening& opening, const Effects& effects, const fz_rect& area);
    void openContainer(Opening& opening, const Effects& effects, const fz_rect& area);
    void closeContainer(const Opening& opening);
    /// Puts the mask that only the innermost opening says into the document.
    void realize();
    void realizeStroke(Opening& opening);
    /// Goes on without a mask that the profile has none of.
    void skipMask(Opening& opening);
    void realizeImage(Opening& opening);
    Scope& enterScope(const fz_rect& area);
    UnicodeString leaveScope();

    Canvas& canvas;
    PaintColors& colors;
    ImageWriter& images;
    PageReport& report;
    int depth;
    std::function<void(GroupScan&)> scanPage;
    GroupScan scan;
    std::size_t nextGroup = 0;
    std::vector<std::unique_ptr<Scope>> scopes;
    std::vector<Opening> openings;
    std::vector<fz_rect> tiles; // where open patterns are to be seen
    std::vector<OpenMask> masks;
};

} // namespace DrawmereConvert
