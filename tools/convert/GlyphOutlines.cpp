#include "tools/convert/GlyphOutlines.h"

#include "tools/convert/FitzCall.h"
#include "tools/convert/OutlineFitter.h"
#include "tools/convert/Type3Outline.h"

#include <bit>
#include <cmath>
#include <new>

namespace DrawmereConvert {
namespace {

constexpr int maxGlyph = 0xFFFF;
constexpr std::size_t maxKeptPoints = 4'000'000;

/// Takes the segments of an outline as they come, in units of the em.
struct OutlineReading {
    std::vector<PATHSTEP>& steps;
    std::vector<fz_point>& points;
    bool isOutOfMemory = false;

    void add(PATHSTEP step, std::initializer_list<fz_point> newPoints) noexcept {
        try {
            steps.push_back(step);
            points.insert(points.end(), newPoints);
        } catch (...) {
            isOutOfMemory = true;
        }
    }
};

OutlineReading& readingOf(void* arg) { return *static_cast<OutlineReading*>(arg); }

void moveTo(fz_context* /*ctx*/, void* arg, float x, float y) {
    readingOf(arg).add(PATHSTEP_MOVE, {{x, y}});
}

void lineTo(fz_context* /*ctx*/, void* arg, float x, float y) {
    readingOf(arg).add(PATHSTEP_LINE, {{x, y}});
}

void curveTo(fz_context* /*ctx*/, void* arg, float x1, float y1, float x2, float y2, float x3,
             float y3) {
    readingOf(arg).add(PATHSTEP_CURVE, {{x1, y1}, {x2, y2}, {x3, y3}});
}

void closePath(fz_context* /*ctx*/, void* arg) { readingOf(arg).add(PATHSTEP_CLOSE, {}); }

constexpr fz_path_walker walker = {&moveTo, &lineTo, &curveTo, &closePath,
                                   nullptr, nullptr, nullptr,  nullptr};

} // namespace

GlyphOutlines::~GlyphOutlines() {
    for (const auto& font : fonts) {
        fz_drop_font(ctx, font.first);
    }
}

void GlyphOutlines::trim() {
    std::size_t kept = 0;
    for (const auto& font : fonts) {
        kept += font.second->data.points.size();
    }
    for (const auto& grid : grids) {
        kept += grid.second.countPoints();
    }
    if (kept < maxKeptPoints) {
        return;
    }
    grids.clear();
    nextNumber = 0;
    for (const auto& font : fonts) {
        fz_drop_font(ctx, font.first);
    }
    fonts.clear();
    lastFont = nullptr;
}

GlyphOutlines::FontOutlines& GlyphOutlines::findFont(fz_font* font) {
    if (font == lastFont) {
        return *lastOutlines;
    }
    std::unique_ptr<FontOutlines>& outlines = fonts[font];
    if (!outlines) {
        outlines = std::make_unique<FontOutlines>();
        fz_keep_font(ctx, font);
    }
    lastFont = font;
    lastOutlines = outlines.get();
    return *outlines;
}

GlyphOutline GlyphOutlines::find(fz_font* font, int glyph) {
    if (glyph < 0 || glyph > maxGlyph) {
        return {};
    }
    FontOutlines& outlines = findFont(font);
    const auto index = static_cast<std::size_t>(glyph);
    if (index >= outlines.entries.size()) {
        outlines.entries.resize(index + 1);
    }
    Entry& entry = outlines.entries[index];
    if (!entry.isRead) {
        read(font, glyph, outlines, entry);
    }
    return outlines.get(entry);
}

GlyphOutline GlyphOutlines::findFitted(fz_font* font, int glyph, int toleranceSteps) {
    FontOutlines& outlines = findFont(font);
    const std::int64_t key = std::int64_t{toleranceSteps} * (maxGlyph + 1) + glyph;
    const auto known = outlines.fitted.find(key);
    if (known != outlines.fitted.end()) {
        return outlines.get(known->second);
    }
    const GlyphOutline outline = find(font, glyph);
    LooseOutline fitted;
    fitOutline(outline, std::exp2(static_cast<float>(toleranceSteps) / 8), fitted);
    Entry entry;
    entry.firstStep = static_cast<std::uint32_t>(outlines.data.steps.size());
    entry.firstPoint = static_cast<std::uint32_t>(outlines.data.points.size());
    entry.stepCount = static_cast<std::uint32_t>(fitted.steps.size());
    entry.isDrawing = outline.isDrawing;
    outlines.data.steps.insert(outlines.data.steps.end(), fitted.steps.begin(), fitted.steps.end());
    outlines.data.points.insert(outlines.data.points.end(), fitted.points.begin(),
                                fitted.points.end());
    outlines.fitted.emplace(key, entry);
    return outlines.get(entry);
}

GridFont& GlyphOutlines::findGrid(fz_font* font, const fz_matrix& matrix) {
    const GridKey key = {
        font,
        {std::bit_cast<std::uint32_t>(matrix.a), std::bit_cast<std::uint32_t>(matrix.b),
         std::bit_cast<std::uint32_t>(matrix.c), std::bit_cast<std::uint32_t>(matrix.d)}};
    const auto known = grids.find(key);
    if (known != grids.end()) {
        return known->second;
    }
    findFont(font); // keeps it
    return grids.try_emplace(key, *this, font, matrix, precision).first->second;
}

void GlyphOutlines::read(fz_font* font, int glyph, FontOutlines& outlines, Entry& entry) {
    entry.isRead = true;
    entry.firstStep = static_cast<std::uint32_t>(outlines.data.steps.size());
    entry.firstPoint = static_cast<std::uint32_t>(outlines.data.points.size());
    if (fz_font_t3_procs(ctx, font)) {
        entry.isDrawing = !readType3Outline(ctx, font, glyph, outlines.data);
    } else {
        readFile(font, glyph, outlines.data);
    }
    entry.stepCount = static_cast<std::uint32_t>(outlines.data.steps.size()) - entry.firstStep;
}

void GlyphOutlines::readFile(fz_font* font, int glyph, LooseOutline& data) {
    OutlineReading reading{data.steps, data.points};
    callFitz(ctx, [&] {
        fz_path* path = fz_outline_glyph(ctx, font, glyph, fz_identity);
        if (path) {
            fz_walk_path(ctx, path, &walker, &reading); // the callbacks never fail
            fz_drop_path(ctx, path);
        }
    });
    if (reading.isOutOfMemory) {
        throw std::bad_alloc();
    }
}

bool GlyphOutlines::append(fz_font* font, int glyph, const fz_matrix& matrix, PathData& path) {
    const GlyphOutline outline = find(font, glyph);
    const fz_point* point = outline.points;
    const auto next = [&] { return fz_transform_point(*point++, matrix); };
    for (const PATHSTEP* step = outline.steps; step != outline.steps + outline.stepCount; ++step) {
        switch (*step) {
        case PATHSTEP_MOVE: {
            const fz_point at = next();
            path.moveTo(at.x, at.y);
            break;
        }
        case PATHSTEP_LINE: {
            const fz_point at = next();
            path.lineTo(at.x, at.y);
            break;
        }
        case PATHSTEP_CURVE: {
            const fz_point first = next();
            const fz_point second = next();
            const fz_point at = next();
            path.curveTo(first.x, first.y, second.x, second.y, at.x, at.y);
            break;
        }
        case PATHSTEP_QUADRATIC: // fonts are read without
            break;
        case PATHSTEP_CLOSE:
            path.close();
            break;
        }
    }
    return !outline.isDrawing;
}

} // namespace DrawmereConvert
