#include "foundation/graphicservice/GS_JpegWriter.h"

#include "foundation/graphicservice/GS_JpegError.h"

#include <algorithm>
#include <cmath>
#include <memory>

#include <jerror.h>

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t blockSize = 65536;
constexpr std::size_t mostKept = 64U << 20;

/// One writing. libjpeg reports errors by jumping out of its calls, so the function that calls it
/// behind `setjmp` has no local objects; what needs a destructor lives here, in a frame outside.
struct JpegSession {
    JpegSession(const GS_Bitmap& source, const GS_WriteOptions& wishes, GS_Output& file)
        : bitmap(source), options(wishes), output(file), row(source.getRowSize()) {
        object.err = prepareJpegError(error);
    }

    JpegSession(const JpegSession&) = delete;
    JpegSession& operator=(const JpegSession&) = delete;

    ~JpegSession() { jpeg_destroy_compress(&object); }

    const GS_Bitmap& bitmap;
    const GS_WriteOptions& options;
    GS_Output& output;
    jpeg_compress_struct object = {};
    GS_JpegError error = {};
    jpeg_destination_mgr target = {};
    JOCTET block[blockSize] = {};
    std::vector<std::uint8_t> row; // on white
};

void resetBlock(JpegSession& session) {
    session.target.next_output_byte = session.block;
    session.target.free_in_buffer = blockSize;
}

void writeBytes(j_compress_ptr object, std::size_t count) {
    auto* session = static_cast<JpegSession*>(object->client_data);
    if (!session->output.write(session->block, count)) {
        ERREXIT(object, JERR_FILE_WRITE);
    }
    resetBlock(*session);
}

void startBlocks(j_compress_ptr object) {
    resetBlock(*static_cast<JpegSession*>(object->client_data));
}

boolean emptyBlock(j_compress_ptr object) {
    writeBytes(object, blockSize);
    return TRUE;
}

void endBlocks(j_compress_ptr object) {
    writeBytes(object, blockSize - object->dest->free_in_buffer);
}

void setTarget(JpegSession& session) {
    session.target.init_destination = startBlocks;
    session.target.empty_output_buffer = emptyBlock;
    session.target.term_destination = endBlocks;
    session.object.dest = &session.target;
    session.object.client_data = &session;
}

void setResolution(JpegSession& session) {
    constexpr double highest = 65535.0;
    const GS_WriteOptions& options = session.options;
    if (options.xResolution >= 1.0 && options.yResolution >= 1.0 &&
        options.xResolution <= highest && options.yResolution <= highest) {
        session.object.density_unit = 1; // inch
        session.object.X_density = static_cast<UINT16>(std::lround(options.xResolution));
        session.object.Y_density = static_cast<UINT16>(std::lround(options.yResolution));
    }
}

void setHeader(JpegSession& session) {
    const bool isGrey = session.bitmap.channels < 3;
    session.object.image_width = static_cast<JDIMENSION>(session.bitmap.columns);
    session.object.image_height = static_cast<JDIMENSION>(session.bitmap.rows);
    session.object.input_components = isGrey ? 1 : 3;
    session.object.in_color_space = isGrey ? JCS_GRAYSCALE : JCS_RGB;
    jpeg_set_defaults(&session.object);
    jpeg_set_quality(&session.object, session.options.quality, TRUE);
    // Smaller by some percent, but all coefficients are kept meanwhile.
    session.object.optimize_coding =
        session.bitmap.getRowSize() * static_cast<unsigned>(session.bitmap.rows) <= mostKept;
    setResolution(session);
}

/// Lays a row on white.
void layOnWhite(const GS_Bitmap& bitmap, int y, std::uint8_t* target) {
    constexpr unsigned full = 255;
    const std::uint8_t* pixel = bitmap.getRow(y);
    const int colors = bitmap.channels - 1;
    for (int x = 0; x < bitmap.columns; ++x, pixel += bitmap.channels) {
        const unsigned alpha = pixel[colors];
        for (int i = 0; i < colors; ++i) {
            const unsigned sum = pixel[i] * alpha + full * (full - alpha);
            *target++ = static_cast<std::uint8_t>((sum + full / 2) / full);
        }
    }
}

void writeRow(JpegSession& session) {
    const auto y = static_cast<int>(session.object.next_scanline);
    if (session.bitmap.hasAlpha()) {
        layOnWhite(session.bitmap, y, session.row.data());
    } else {
        std::copy_n(session.bitmap.getRow(y), session.bitmap.getRowSize(), session.row.data());
    }
    JSAMPROW row = session.row.data();
    jpeg_write_scanlines(&session.object, &row, 1);
}

bool writeFile(JpegSession& session) {
    if (setjmp(session.error.place)) {
        return false;
    }
    jpeg_create_compress(&session.object);
    setTarget(session);
    setHeader(session);
    jpeg_start_compress(&session.object, TRUE);
    if (!session.bitmap.profile.empty()) {
        jpeg_write_icc_profile(&session.object, session.bitmap.profile.data(),
                               static_cast<unsigned>(session.bitmap.profile.size()));
    }
    while (session.object.next_scanline < session.object.image_height) {
        writeRow(session);
    }
    jpeg_finish_compress(&session.object);
    return true;
}

} // namespace

bool writeJpeg(const GS_Bitmap& bitmap, const GS_WriteOptions& options, GS_Output& output) {
    const auto session = std::make_unique<JpegSession>(bitmap, options, output);
    return writeFile(*session) && output.flush();
}

} // namespace MoxGraphicService_NS
