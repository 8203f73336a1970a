/// The work of the benches done by cairo's SVG surface.
#pragma once

#include <cstdint>
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

    void setFillColor(std::uint32_t rgb) { fillColor = rgb; }

    void setStrokeColor(std::uint32_t rgb) { strokeColor = rgb; }

    void setStrokeWidth(float width);

    void strokeRect(float x, float y, float width, float height);
    void fillAndStrokeRect(float x, float y, float width, float height);

    /// Ends the document. Returns: whether all went well.
    bool finish();

private:
    void setSource(std::uint32_t rgb);
    void addRect(float x, float y, float width, float height);

    cairo_surface_t* surface; // owned
    cairo_t* context;         // owned
    std::uint32_t fillColor = 0;
    std::uint32_t strokeColor = 0;
};

} // namespace DrawmereNS
