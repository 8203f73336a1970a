/// The outlines of glyphs, read once a font.
#pragma once

#include "tools/convert/PathData.h"
#include "tools/convert/Type3Outline.h"

#include <mupdf/fitz.h>

#include <cstdint>
#include <memory>
#include <unordered_map>
#include <vector>

namespace DrawmereConvert {

/// The shape of one glyph, in units of the em. Borrowed from `GlyphOutlines`.
struct GlyphOutline {
    const PATHSTEP* steps = nullptr;
    std::size_t stepCount = 0;
    const fz_point* points = nullptr;
    bool isDrawing = false; ///< it has no outline, as a Type 3 font draws it in other ways
};

/// Reads outlines from fonts and keeps them, and the fonts, until `trim`.
class GlyphOutlines {
public:
    explicit GlyphOutlines(fz_context* context) : ctx(context) {}

    GlyphOutlines(const GlyphOutlines&) = delete;
    GlyphOutlines& operator=(const GlyphOutlines&) = delete;
    ~GlyphOutlines();

    /// Returns: the outline of a glyph, without steps for one that is blank or can't be read; good
    /// until the next call.
    GlyphOutline find(fz_font* font, int glyph);

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
        LooseOutline data;
    };

    FontOutlines& findFont(fz_font* font);
    void read(fz_font* font, int glyph, FontOutlines& outlines, Entry& entry);
    void readFile(fz_font* font, int glyph, LooseOutline& data);

    fz_context* ctx;
    std::unordered_map<fz_font*, std::unique_ptr<FontOutlines>> fonts; // the fonts are kept
    fz_font* lastFont = nullptr;
    FontOutlines* lastOutlines = nullptr; // borrowed from `fonts`
};

} // namespace DrawmereConvert
