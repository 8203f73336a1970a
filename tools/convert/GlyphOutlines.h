/// The outlines of glyphs, read once a font.
#pragma once

#include "tools/convert/GlyphOutline.h"
#include "tools/convert/GridFont.h"

#include <mupdf/fitz.h>

#include <array>
#include <cstdint>
#include <map>
#include <memory>
#include <unordered_map>
#include <vector>

namespace DrawmereConvert {

class PathData;

/// Reads outlines from fonts and keeps them, and the fonts, until `trim`.
class GlyphOutlines {
public:
    /// Shape: `largestError`, of `findGrid`, in points.
    GlyphOutlines(fz_context* context, float largestError)
        : ctx(context), precision(largestError) {}

    GlyphOutlines(const GlyphOutlines&) = delete;
    GlyphOutlines& operator=(const GlyphOutlines&) = delete;
    ~GlyphOutlines();

    /// Returns: the outline of a glyph, without steps for one that is blank or can't be read; good
    /// until the next call.
    GlyphOutline find(fz_font* font, int glyph);

    /// Returns: the same, fitted so that nothing is farther off than `tolerance`, in units of the
    /// em. Shape: the tolerance is 2 to the power of `toleranceSteps` eighths.
    GlyphOutline findFitted(fz_font* font, int glyph, int toleranceSteps);

    /// Returns: the font with outlines on a grid, for text drawn with `matrix`, whatever its shift;
    /// good until `trim`.
    GridFont& findGrid(fz_font* font, const fz_matrix& matrix);

    /// Returns: the number of the next outline on a grid.
    std::uint32_t takeNumber() { return nextNumber++; }

    /// Appends the outline of a glyph, with `matrix` applied, to `path`.
    /// Returns: false for a glyph that is a drawing.
    bool append(fz_font* font, int glyph, const fz_matrix& matrix, PathData& path);

    /// Forgets everything when it has become too much to keep; to be called between pages.
    void trim();

private:
    struct Entry {
        std::uint32_t firstStep = 0;
        std::uint32_t stepCount = 0;
        std::uint32_t firstPoint = 0;
        bool isRead = false;
        bool isDrawing = false;
    };

    struct FontOutlines {
        std::vector<Entry> entries; // by glyph
        std::unordered_map<std::int64_t, Entry> fitted;
        LooseOutline data;

        GlyphOutline get(const Entry& entry) const {
            return {data.steps.data() + entry.firstStep, entry.stepCount,
                    data.points.data() + entry.firstPoint, entry.isDrawing};
        }
    };

    /// A font, and the four numbers of a matrix without its shift, as bits: so they have an order.
    struct GridKey {
        auto operator<=>(const GridKey&) const = default;

        fz_font* font;
        std::array<std::uint32_t, 4> matrix;
    };

    FontOutlines& findFont(fz_font* font);
    void read(fz_font* font, int glyph, FontOutlines& outlines, Entry& entry);
    void readFile(fz_font* font, int glyph, LooseOutline& data);

    fz_context* ctx;
    float precision;
    std::unordered_map<fz_font*, std::unique_ptr<FontOutlines>> fonts; // the fonts are kept
    fz_font* lastFont = nullptr;
    FontOutlines* lastOutlines = nullptr; // borrowed from `fonts`
    std::map<GridKey, GridFont> grids;
    std::uint32_t nextNumber = 0;
};

} // namespace DrawmereConvert
