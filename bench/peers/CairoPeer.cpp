#include "bench/peers/CairoPeer.h"

#include <cairo-svg.h>
#include <fstream>
#include <iterator>

namespace DrawmereNS {
namespace {

double wide(float number) { return static_cast<double>(number); }

double channel(std::uint32_t rgb, unsigned int shift) {
    return static_cast<double>(rgb >> shift & 0xFFU) / 255.0;
}

void addStop(cairo_pattern_t* pattern, double offset, std::uint32_t rgb) {
    cairo_pattern_add_color_stop_rgb(pattern, offset, channel(rgb, 16), channel(rgb, 8),
                                     channel(rgb, 0));
}

/// Returns: the number that a PNG file has at this place.
int readInt(const std::string& bytes, std::size_t place) {
    int number = 0;
    for (std::size_t i = 0; i < 4 && place + i < bytes.size(); ++i) {
        number = number * 256 + static_cast<unsigned char>(bytes[place + i]);
    }
    return number;
}

/// Returns: an image with the bytes of the file, and pixels that nobody looks at.
cairo_surface_t* openPng(const std::string& path) {
    constexpr std::size_t widthPlace = 16;
    constexpr std::size_t heightPlace = 20;
    std::ifstream file(path, std::ios::binary);
    auto* const bytes = new std::string(std::istreambuf_iterator<char>(file), {});
    cairo_surface_t* const image = cairo_image_surface_create(
        CAIRO_FORMAT_RGB24, readInt(*bytes, widthPlace), readInt(*bytes, heightPlace));
    cairo_surface_set_mime_data(
        image, CAIRO_MIME_TYPE_PNG, reinterpret_cast<const unsigned char*>(bytes->data()),
        bytes->size(), [](void* owned) { delete static_cast<std::string*>(owned); }, bytes);
    return image;
}

} // namespace

CairoPeer::CairoPeer(const std::string& path, float width, float height)
    : surface(cairo_svg_surface_create(path.c_str(), wide(width), wide(height))),
      context(cairo_create(surface)) {}

CairoPeer::~CairoPeer() {
    for (const auto& [path, image] : images) {
        cairo_surface_destroy(image);
    }
    cairo_glyph_free(glyphs);
    cairo_destroy(context);
    cairo_surface_destroy(surface);
}

void CairoPeer::translate(float x, float y) { cairo_translate(context, wide(x), wide(y)); }

void CairoPeer::transform(const std::array<float, 6>& matrix) {
    const cairo_matrix_t wideMatrix = {wide(matrix[0]), wide(matrix[1]), wide(matrix[2]),
                                       wide(matrix[3]), wide(matrix[4]), wide(matrix[5])};
    cairo_transform(context, &wideMatrix);
}

void CairoPeer::setStrokeWidth(float width) { cairo_set_line_width(context, wide(width)); }

void CairoPeer::setMiterLimit(int limit) { cairo_set_miter_limit(context, limit); }

void CairoPeer::strokeRect(float x, float y, float width, float height) {
    addRect(x, y, width, height);
    setSource(strokeColor);
    cairo_stroke(context);
}

void CairoPeer::fillAndStrokeRect(float x, float y, float width, float height) {
    addRect(x, y, width, height);
    setSource(fillColor);
    cairo_fill_preserve(context);
    setSource(strokeColor);
    cairo_stroke(context);
}

void CairoPeer::clipRect(float x, float y, float width, float height) {
    addRect(x, y, width, height);
    cairo_clip(context);
}

void CairoPeer::fillRect(float x, float y, float width, float height, std::uint32_t left,
                         std::uint32_t right) {
    cairo_pattern_t* pattern = cairo_pattern_create_linear(wide(x), 0.0, wide(x + width), 0.0);
    addStop(pattern, 0.0, left);
    addStop(pattern, 1.0, right);
    addRect(x, y, width, height);
    cairo_set_source(context, pattern);
    cairo_pattern_destroy(pattern);
    cairo_fill(context);
}

void CairoPeer::moveTo(float x, float y) { cairo_move_to(context, wide(x), wide(y)); }

void CairoPeer::lineTo(float x, float y) { cairo_line_to(context, wide(x), wide(y)); }

void CairoPeer::curveTo(float x1, float y1, float x2, float y2, float x3, float y3) {
    cairo_curve_to(context, wide(x1), wide(y1), wide(x2), wide(y2), wide(x3), wide(y3));
}

void CairoPeer::strokePath() {
    setSource(strokeColor);
    cairo_stroke(context);
}

void CairoPeer::setFont(const char* family, float size) {
    cairo_select_font_face(context, family, CAIRO_FONT_SLANT_NORMAL, CAIRO_FONT_WEIGHT_NORMAL);
    cairo_set_font_size(context, wide(size));
}

void CairoPeer::drawText(const char* text, float x, float y) {
    setSource(fillColor);
    cairo_move_to(context, wide(x), wide(y));
    cairo_show_text(context, text);
}

void CairoPeer::drawText(const char* text, const float* x, float y) {
    setSource(fillColor);
    cairo_scaled_font_text_to_glyphs(cairo_get_scaled_font(context), 0.0, wide(y), text, -1,
                                     &glyphs, &glyphCount, nullptr, nullptr, nullptr);
    for (int i = 0; i < glyphCount; ++i) {
        glyphs[i].x = wide(x[i]);
    }
    cairo_show_glyphs(context, glyphs, glyphCount);
}

void CairoPeer::drawPng(const std::string& imagePath, float x, float y, float width, float height) {
    cairo_surface_t*& image = images[imagePath];
    if (!image) {
        image = openPng(imagePath);
    }
    cairo_save(context);
    cairo_translate(context, wide(x), wide(y));
    cairo_scale(context, wide(width) / cairo_image_surface_get_width(image),
                wide(height) / cairo_image_surface_get_height(image));
    cairo_set_source_surface(context, image, 0.0, 0.0);
    cairo_paint(context);
    cairo_restore(context);
}

bool CairoPeer::finish() {
    const bool drawn = cairo_status(context) == CAIRO_STATUS_SUCCESS;
    cairo_surface_finish(surface);
    return drawn && cairo_surface_status(surface) == CAIRO_STATUS_SUCCESS;
}

void CairoPeer::setSource(std::uint32_t rgb) {
    cairo_set_source_rgb(context, channel(rgb, 16), channel(rgb, 8), channel(rgb, 0));
}

void CairoPeer::addRect(float x, float y, float width, float height) {
    cairo_rectangle(context, wide(x), wide(y), wide(width), wide(height));
}

} // namespace DrawmereNS
