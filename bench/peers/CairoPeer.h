/// The work of the benches done by cairo's SVG surface.
#pragma once

#include <array>
#include <cstdint>
#include <map>
#include <string>

#include <cairo.h>

namespace DrawmereNS {

/// Draws through cairo's own calls into an SVG file. Lengths are points.
class CairoPeer {
public:
    /// Makes the file `path` for a page of this size.
    CairoPeer(const std::string& path, float width, float height);
    CairoPeer(const CairoPeer&) = delete;
    CairoPeer& operator=(const CairoPeer&) = delete;
    ~CairoPeer();

    void save() { cairo_save(context); }

    void restore() { cairo_restore(context); }

    void translate(float x, float y);
    /// Multiplies the coordinate system by a matrix of six numbers as SVG 1.1 orders them.
    void transform(const std::array<float, 6>& matrix);

    void setFillColor(std::uint32_t rgb) { fillColor = rgb; }

    void setStrokeColor(std::uint32_t rgb) { strokeColor = rgb; }

    void setStrokeWidth(float width);
    void setMiterLimit(int limit);

    void strokeRect(float x, float y, float width, float height);
    void fillAndStrokeRect(float x, float y, float width, float height);

    /// Clips what follows, up to the next `restore`.
    void clipRect(float x, float y, float width, float height);

    /// Fills a rectangle with a gradient from its left edge to its right one.
    void fillRect(float x, float y, float width, float height, std::uint32_t left,
                  std::uint32_t right);

    // A path: started with a move and stroked.
    void moveTo(float x, float y);
    void lineTo(float x, float y);
    void curveTo(float x1, float y1, float x2, float y2, float x3, float y3);
    void strokePath();

    /// Takes a face by cairo's own short way.
    void setFont(const char* family, float size);

    /// Draws `text`, without a kerning of its own.
    void drawText(const char* text, float x, float y);

    /// Draws `text` with one x for each glyph. Shape: `x` has as many numbers as `text` glyphs.
    void drawText(const char* text, const float* x, float y);

    /// Places the bytes of a PNG file, as they are, instead of pixels. The same file again is the
    /// same image.
    void drawPng(const std::string& imagePath, float x, float y, float width, float height);

    /// Ends the document. Returns: whether all went well.
    bool finish();

private:
    void setSource(std::uint32_t rgb);
    void addRect(float x, float y, float width, float height);

    cairo_surface_t* surface;        // owned
    cairo_t* context;                // owned
    cairo_glyph_t* glyphs = nullptr; // owned
    int glyphCount = 0;
    std::map<std::string, cairo_surface_t*> images; // owned
    std::uint32_t fillColor = 0;
    std::uint32_t strokeColor = 0;
};

} // namespace DrawmereNS
