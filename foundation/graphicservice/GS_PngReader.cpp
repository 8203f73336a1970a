#include "foundation/graphicservice/GS_PngReader.h"

#include <cmath>
#include <csetjmp>
#include <png.h>

namespace MoxGraphicService_NS {
namespace {

/// One decoding. libpng reports errors by jumping out of its calls, so the functions that call it
/// behind `setjmp` have no local objects; what needs a destructor lives here, in a frame outside.
struct PngSession {
    explicit PngSession(GS_Input& source) : input(source) {}

    PngSession(const PngSession&) = delete;
    PngSession& operator=(const PngSession&) = delete;

    ~PngSession() { png_destroy_read_struct(&png, &header, nullptr); }

    GS_Input& input;
    png_structp png = nullptr;
    png_infop header = nullptr;
    int passes = 1;
};

void readBytes(png_structp png, png_bytep target, std::size_t count) {
    auto* session = static_cast<PngSession*>(png_get_io_ptr(png));
    if (!session->input.readAll(target, count)) {
        png_error(png, "end of file");
    }
}

[[noreturn]] void jumpOut(png_structp png, png_const_charp /*message*/) { png_longjmp(png, 1); }

void ignoreWarning(png_structp /*png*/, png_const_charp /*message*/) {}

/// Bounds what the parts of a file beside its pixels may take.
void setLimits(PngSession& session, const GS_ImageInfo& info) {
    constexpr png_alloc_size_t longestChunk = 16U << 20; // a large profile is of 4 MB
    constexpr png_uint_32 mostChunks = 100;
    png_set_user_limits(session.png, static_cast<png_uint_32>(info.columns),
                        static_cast<png_uint_32>(info.rows));
    png_set_chunk_malloc_max(session.png, longestChunk);
    png_set_chunk_cache_max(session.png, mostChunks);
}

bool start(PngSession& session, const GS_ImageInfo& info) {
    session.png = png_create_read_struct(PNG_LIBPNG_VER_STRING, &session, jumpOut, ignoreWarning);
    session.header = session.png ? png_create_info_struct(session.png) : nullptr;
    if (!session.header) {
        return false;
    }
    png_set_read_fn(session.png, &session, readBytes);
    setLimits(session, info);
    return true;
}

/// Lets libpng bring a file of another gamma to sRGB, while the samples still have all their bits.
void setGamma(PngSession& session) {
    constexpr double srgbGamma = 1.0 / 2.2;
    constexpr double tolerance = 0.02;
    double gamma = 0.0;
    const bool isNamed = png_get_valid(session.png, session.header, PNG_INFO_iCCP | PNG_INFO_sRGB);
    if (!isNamed && png_get_gAMA(session.png, session.header, &gamma) != 0 && gamma > 0.0 &&
        std::fabs(gamma - srgbGamma) > tolerance) {
        png_set_gamma(session.png, PNG_DEFAULT_sRGB, gamma);
    }
}

/// Reads all in front of the pixels, and has them made samples of 8 bits.
bool readHeader(PngSession& session) {
    if (setjmp(png_jmpbuf(session.png))) {
        return false;
    }
    png_read_info(session.png, session.header);
    png_set_expand(session.png);
    png_set_scale_16(session.png);
    setGamma(session);
    session.passes = png_set_interlace_handling(session.png);
    png_read_update_info(session.png, session.header);
    return true;
}

bool readRows(PngSession& session, GS_Bitmap& bitmap) {
    if (setjmp(png_jmpbuf(session.png))) {
        return false;
    }
    for (int pass = 0; pass < session.passes; ++pass) {
        for (int y = 0; y < bitmap.rows; ++y) {
            png_read_row(session.png, bitmap.getRow(y), nullptr);
        }
    }
    return true;
}

void takeProfile(PngSession& session, GS_Bitmap& bitmap) {
    png_charp name = nullptr;
    int compression = 0;
    png_bytep profile = nullptr;
    png_uint_32 size = 0;
    if (png_get_iCCP(session.png, session.header, &name, &compression, &profile, &size) != 0) {
        bitmap.setProfile(profile, size);
    }
}

} // namespace

bool readPngPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize /*wanted*/,
                   GS_Bitmap& bitmap) {
    PngSession session(input);
    if (!input.seek(0) || !start(session, info) || !readHeader(session)) {
        return false;
    }
    const int channels = png_get_channels(session.png, session.header);
    if (!bitmap.allocate(info.columns, info.rows, channels) ||
        png_get_rowbytes(session.png, session.header) != bitmap.getRowSize()) {
        return false;
    }
    takeProfile(session, bitmap);
    return readRows(session, bitmap);
}

} // namespace MoxGraphicService_NS
