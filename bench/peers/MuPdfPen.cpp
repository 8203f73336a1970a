// MuPDF's SVG device. What MuPDF throws ends the program.
#include "bench/BenchScripts.h"
#include "bench/peers/Pen.h"

#include <map>
#include <vector>

extern "C" {
#include <mupdf/fitz.h>
}

namespace DrawmereNS {
namespace {

using Color = std::array<float, 3>;

Color makeColor(std::uint32_t rgb) {
    constexpr float full = 255.0F;
    return {static_cast<float>(rgb >> 16U & 0xFFU) / full,
            static_cast<float>(rgb >> 8U & 0xFFU) / full, static_cast<float>(rgb & 0xFFU) / full};
}

class MuPdfPen : public Pen {
public:
    explicit MuPdfPen(const std::string& directory)
        : Pen(directory), context(fz_new_context(nullptr, nullptr, FZ_STORE_DEFAULT)),
          colors(fz_device_rgb(context)), stroke(fz_new_stroke_state(context)) {
        stroke->miterlimit = penMiterLimit;
    }

    ~MuPdfPen() override {
        fz_drop_stroke_state(context, stroke);
        fz_drop_context(context);
    }

    void startDocument(int number) override {
        output = fz_new_output_with_path(context, makePath(number).c_str(), /*append=*/0);
        device = fz_new_svg_device(context, output, benchPageWidth, benchPageHeight,
                                   FZ_SVG_TEXT_AS_PATH, /*reuse_images=*/1);
    }

    void finishDocument() override {
        fz_close_device(context, device);
        fz_drop_device(context, device);
        fz_close_output(context, output);
        fz_drop_output(context, output);
    }

    void finishRun() override {
        for (const auto& [family, one] : fonts) {
            fz_drop_font(context, one);
        }
        for (const auto& [file, image] : images) {
            fz_drop_image(context, image);
        }
    }

    void pushState() override { saved.push_back({matrix, stroke->linewidth, isClipped}); }

    void popState() override {
        if (isClipped) {
            fz_pop_clip(context, device);
        }
        matrix = saved.back().matrix;
        stroke->linewidth = saved.back().strokeWidth;
        isClipped = saved.back().isClipped;
        saved.pop_back();
    }

    void setMatrix(const PenMatrix& change) override {
        matrix = fz_concat({change.a, change.b, change.c, change.d, change.e, change.f}, matrix);
    }

    void setFillColor(std::uint32_t rgb) override { fillColor = makeColor(rgb); }

    void setStrokeColor(std::uint32_t rgb) override { strokeColor = makeColor(rgb); }

    void setStrokeWidth(float width) override { stroke->linewidth = width; }

    void setFont(std::size_t family, int size) override {
        font = findFont(family);
        fontSize = static_cast<float>(size);
    }

    void clip(const PenBox& box) override {
        fz_path* const area = makeBox(box);
        fz_clip_path(context, device, area, /*even_odd=*/0, matrix, fz_infinite_rect);
        fz_drop_path(context, area);
        isClipped = true;
    }

    void drawRect(const PenBox& box, PenPaint paint) override {
        path = makeBox(box);
        if (paint.fill) {
            fz_fill_path(context, device, path, /*even_odd=*/0, matrix, colors, fillColor.data(),
                         1.0F, fz_default_color_params);
        }
        strokePath();
    }

    void drawGradient(const PenBox& box, std::uint32_t left, std::uint32_t right) override {
        pushState();
        isClipped = false;
        clip(box);
        fz_shade* const shade = makeShade(box, makeColor(left), makeColor(right));
        fz_fill_shade(context, device, shade, matrix, 1.0F, fz_default_color_params);
        fz_drop_shade(context, shade);
        popState();
    }

    void startPath(const BenchPoint& point) override {
        path = fz_new_path(context);
        fz_moveto(context, path, point.x, point.y);
    }

    void lineTo(const BenchPoint& point) override { fz_lineto(context, path, point.x, point.y); }

    void curveTo(const BenchSegment& segment) override {
        fz_curveto(context, path, segment.control1.x, segment.control1.y, segment.control2.x,
                   segment.control2.y, segment.target.x, segment.target.y);
    }

    void strokePath() override {
        fz_stroke_path(context, device, path, stroke, matrix, colors, strokeColor.data(), 1.0F,
                       fz_default_color_params);
        fz_drop_path(context, path);
    }

    void drawText(const PenText& run, float x, float y) override {
        fz_text* const text = fz_new_text(context);
        const fz_matrix place = {fontSize, 0, 0, -fontSize, x, y};
        fz_show_string(context, text, font, place, run.bytes.c_str(), /*wmode=*/0,
                       /*bidi_level=*/0, FZ_BIDI_LTR, FZ_LANG_UNSET);
        fz_fill_text(context, device, text, matrix, colors, fillColor.data(), 1.0F,
                     fz_default_color_params);
        fz_drop_text(context, text);
    }

    void drawImage(const std::string& file, const PenBox& box) override {
        fz_image*& image = images[file];
        if (!image) {
            image = fz_new_image_from_file(context, file.c_str());
        }
        const fz_matrix place = {box.width, 0, 0, box.height, box.x, box.y};
        fz_fill_image(context, device, image, fz_concat(place, matrix), 1.0F,
                      fz_default_color_params);
    }

private:
    struct State {
        fz_matrix matrix;
        float strokeWidth;
        bool isClipped;
    };

    fz_font* findFont(std::size_t family) {
        fz_font*& found = fonts[family];
        if (!found) {
            const UnicodeString name = UnicodeString::fromUTF8(penFamilies[family]);
            const BenchFontFile file = findBenchFont(name.getBuffer());
            found = fz_new_font_from_file(context, nullptr, file.path.c_str(),
                                          static_cast<int>(file.face),
                                          /*use_glyph_bbox=*/0);
        }
        return found;
    }

    fz_path* makeBox(const PenBox& box) {
        fz_path* const made = fz_new_path(context);
        fz_rectto(context, made, box.x, box.y, box.x + box.width, box.y + box.height);
        return made;
    }

    /// A shade is a document's; there is no call that makes one of an outsider's numbers.
    fz_shade* makeShade(const PenBox& box, const Color& left, const Color& right) {
        constexpr std::size_t steps = 256;
        auto* const shade = static_cast<fz_shade*>(fz_calloc(context, 1, sizeof(fz_shade)));
        FZ_INIT_STORABLE(shade, 1, fz_drop_shade_imp);
        shade->type = FZ_LINEAR;
        shade->colorspace = fz_keep_colorspace(context, colors);
        shade->bbox = fz_infinite_rect;
        shade->matrix = fz_identity;
        shade->use_function = 1;
        shade->u.l_or_r.coords[0][0] = box.x;
        shade->u.l_or_r.coords[1][0] = box.x + box.width;
        for (std::size_t i = 0; i < steps; ++i) {
            const float part = static_cast<float>(i) / (steps - 1);
            for (std::size_t c = 0; c < left.size(); ++c) {
                shade->function[i][c] = left[c] + (right[c] - left[c]) * part;
            }
            shade->function[i][left.size()] = 1.0F;
        }
        return shade;
    }

    fz_context* context;         // owned
    fz_colorspace* colors;       // borrowed from the context
    fz_stroke_state* stroke;     // owned
    fz_output* output = nullptr; // owned, while a document is open
    fz_device* device = nullptr; // owned, while a document is open
    fz_path* path = nullptr;     // owned, until it is stroked
    fz_font* font = nullptr;     // borrowed from `fonts`
    float fontSize = 0.0F;
    fz_matrix matrix = fz_identity;
    bool isClipped = false;
    Color fillColor = {};
    Color strokeColor = {};
    std::vector<State> saved;
    std::map<std::size_t, fz_font*> fonts;   // owned
    std::map<std::string, fz_image*> images; // owned
};

} // namespace

std::unique_ptr<Pen> makePen(const std::string& directory) {
    return std::make_unique<MuPdfPen>(directory);
}

} // namespace DrawmereNS
