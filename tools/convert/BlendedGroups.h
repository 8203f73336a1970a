/// Pictures of groups that are mixed with what lies under them, for which SVG 1.1 has no words.
#pragma once

#include "tools/convert/ImagePixels.h"

#include <mupdf/fitz.h>

#include <cstddef>
#include <cstdint>

namespace DrawmereConvert {

/// A page that can be run again, all of it borrowed.
struct PageRun {
    fz_page* page = nullptr;
    fz_matrix matrix = fz_identity; ///< from the page to the document
    fz_cookie* cookie = nullptr;    ///< by which it can be ended
};

/// What a blend mode does to a group where it stands.
enum BLENDING : std::int8_t {
    BLENDING_NONE,    ///< nothing that can be seen
    BLENDING_PICTURE, ///< something that a picture shows
    BLENDING_UNKNOWN, ///< the group couldn't be drawn
};

/// Draws the page with MuPDF's own renderer up to a group, with and without it.
class BlendedGroups {
public:
    BlendedGroups(fz_context* context, const PageRun& pageRun) : ctx(context), run(pageRun) {}

    /// Draws the group `number`, counted from 0 among those of the page that have a blend mode.
    /// Shape: `area`, as the group was begun with, by which it is known again; `visible`, the part
    /// to draw; `picture`, all that the group changes there, opaque.
    BLENDING draw(std::size_t number, const fz_rect& area, const fz_rect& visible, int dpi,
                  PlacedPixels& picture);

private:
    /// How far the page is drawn.
    enum CUT : std::int8_t {
        CUT_BEFORE,      ///< up to the group
        CUT_BEHIND,      ///< up to its end
        CUT_BEHIND_PLAIN ///< the same, as if the group had no blend mode
    };

    struct Cut;

    static void beginGroup(fz_context* ctx, fz_device* device, fz_rect area, fz_colorspace* space,
                           int isolated, int knockout, int blendMode, float alpha);
    static void endGroup(fz_context* ctx, fz_device* device);

    fz_pixmap* drawPage(CUT kind) const;
    BLENDING compare(fz_pixmap* before, fz_pixmap* behind, PlacedPixels& picture) const;

    static thread_local Cut* active; // MuPDF's own device has no room for one

    fz_context* ctx;
    PageRun run;
    std::size_t wanted = 0; // number of the group
    fz_rect wantedArea{};
    fz_irect box{}; // of the picture, in pixels
    float scale = 1;
};

} // namespace DrawmereConvert
