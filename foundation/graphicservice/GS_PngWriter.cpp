#include "foundation/graphicservice/GS_PngWriter.h"

#include "foundation/graphicservice/GS_PixelForm.h"

#include <cmath>
#include <csetjmp>
#include <png.h>

namespace MoxGraphicService_NS {
namespace {

/// One writing. libpng reports errors by jumping out of its calls, so the function that calls it
/// behind `setjmp` has no local objects; what needs a destructor lives here, in a frame outside.
struct PngSession {
    PngSession(const GS_Bitmap& source, const GS_WriteOptions& wishes, GS_Output& target)
        : bitmap(source), options(wishes), output(target), form(source), row(source.getRowSize()) {}

    PngSession(const PngSession&) = delete;
    PngSession& operator=(const PngSession&) = delete;

    ~PngSession() { png_destroy_write_struct(&png, &header); }

    const GS_Bitmap& bitmap;
    const GS_WriteOptions& options;
    GS_Output& output;
    GS_PixelForm form;
    std::vector<std::uint8_t> row;
    std::vector<png_color> palette;
    std::vector<png_byte> alphas; // of the first entries of the palette
    png_structp png = nullptr;
    png_infop header = nullptr;
};

void writeBytes(png_structp png, png_bytep bytes, std::size_t count) {
    auto* session = static_cast<PngSession*>(png_get_io_ptr(png));
    if (!session->output.write(bytes, count)) {
        png_error(png, "no room");
    }
}

void flushNothing(png_structp /*png*/) {}

[[noreturn]] void jumpOut(png_structp png, png_const_charp /*message*/) { png_longjmp(png, 1); }

void ignoreWarning(png_structp /*png*/, png_const_charp /*message*/) {}

bool start(PngSession& session) {
    session.png = png_create_write_struct(PNG_LIBPNG_VER_STRING, &session, jumpOut, ignoreWarning);
    session.header = session.png ? png_create_info_struct(session.png) : nullptr;
    if (!session.header) {
        return false;
    }
    png_set_write_fn(session.png, &session, writeBytes, flushNothing);
    return true;
}

void makePalette(PngSession& session) {
    for (const std::uint32_t color : session.form.colors) {
        session.palette.push_back({static_cast<png_byte>(color >> 16),
                                   static_cast<png_byte>(color >> 8),
                                   static_cast<png_byte>(color)});
        const auto alpha = static_cast<png_byte>(color >> 24);
        if (alpha != UINT8_MAX) {
            session.alphas.push_back(alpha);
        }
    }
}

constexpr int colorTypes[] = {PNG_COLOR_TYPE_GRAY, PNG_COLOR_TYPE_GRAY_ALPHA, PNG_COLOR_TYPE_RGB,
                              PNG_COLOR_TYPE_RGB_ALPHA};

void setPalette(PngSession& session) {
    png_set_PLTE(session.png, session.header, session.palette.data(),
                 static_cast<int>(session.palette.size()));
    if (!session.alphas.empty()) {
        png_set_tRNS(session.png, session.header, session.alphas.data(),
                     static_cast<int>(session.alphas.size()), nullptr);
    }
    png_set_filter(session.png, PNG_FILTER_TYPE_BASE, PNG_FILTER_NONE); // indices are no slopes
}

void setResolution(PngSession& session) {
    constexpr double inchesPerMeter = 1.0 / 0.0254;
    const GS_WriteOptions& options = session.options;
    if (options.xResolution > 0.0 && options.yResolution > 0.0) {
        png_set_pHYs(session.png, session.header,
                     static_cast<png_uint_32>(std::lround(options.xResolution * inchesPerMeter)),
                     static_cast<png_uint_32>(std::lround(options.yResolution * inchesPerMeter)),
                     PNG_RESOLUTION_METER);
    }
}

void setHeader(PngSession& session) {
    const bool hasPalette = !session.palette.empty();
    const int type = hasPalette ? PNG_COLOR_TYPE_PALETTE : colorTypes[session.form.channels - 1];
    png_set_IHDR(session.png, session.header, static_cast<png_uint_32>(session.bitmap.columns),
                 static_cast<png_uint_32>(session.bitmap.rows), session.form.depth, type,
                 PNG_INTERLACE_NONE, PNG_COMPRESSION_TYPE_DEFAULT, PNG_FILTER_TYPE_DEFAULT);
    if (hasPalette) {
        setPalette(session);
    }
    if (!session.bitmap.profile.empty()) {
        png_set_iCCP(session.png, session.header, "ICC profile", PNG_COMPRESSION_TYPE_BASE,
                     session.bitmap.profile.data(),
                     static_cast<png_uint_32>(session.bitmap.profile.size()));
    }
    setResolution(session);
}

bool writeFile(PngSession& session) {
    if (setjmp(png_jmpbuf(session.png))) {
        return false;
    }
    png_set_user_limits(session.png, PNG_UINT_31_MAX, PNG_UINT_31_MAX);
    png_set_benign_errors(session.png, 1); // a profile that libpng refuses is left out
    setHeader(session);
    png_write_info(session.png, session.header);
    png_set_packing(session.png);
    for (int y = 0; y < session.bitmap.rows; ++y) {
        session.form.convertRow(session.bitmap, y, session.row.data());
        png_write_row(session.png, session.row.data());
    }
    png_write_end(session.png, session.header);
    return true;
}

} // namespace

bool writePng(const GS_Bitmap& bitmap, const GS_WriteOptions& options, GS_Output& output) {
    PngSession session(bitmap, options, output);
    makePalette(session);
    return start(session) && writeFile(session) && output.flush();
}

} // namespace MoxGraphicService_NS
