#include "foundation/graphicservice/GS_JpegReader.h"

#include "foundation/graphicservice/GS_JpegError.h"

#include <algorithm>
#include <memory>

#include <jerror.h>

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t blockSize = 65536;
constexpr unsigned fullScale = 8; // eighths
constexpr int cmykChannels = 4;

/// One decoding. libjpeg reports errors by jumping out of its calls, so the functions that call it
/// behind `setjmp` have no local objects; what needs a destructor lives here, in a frame outside.
struct JpegSession {
    JpegSession(GS_Input& file, GS_WantedSize size) : input(file), wanted(size) {
        object.err = prepareJpegError(error);
    }

    JpegSession(const JpegSession&) = delete;
    JpegSession& operator=(const JpegSession&) = delete;

    ~JpegSession() {
        jpeg_destroy_decompress(&object);
        std::free(profile);
    }

    GS_Input& input;
    GS_WantedSize wanted;
    jpeg_decompress_struct object = {};
    GS_JpegError error = {};
    jpeg_source_mgr source = {};
    JOCTET block[blockSize] = {};
    JOCTET* profile = nullptr; // owned: from malloc
    unsigned profileSize = 0;
    std::vector<std::uint8_t> line; // a row as libjpeg gives it, for CMYK
};

void doNothing(j_decompress_ptr /*object*/) {}

boolean fillBlock(j_decompress_ptr object) {
    auto* session = static_cast<JpegSession*>(object->client_data);
    const std::size_t count = session->input.read(session->block, blockSize);
    if (count == 0) {
        ERREXIT(object, JERR_INPUT_EOF);
    }
    session->source.next_input_byte = session->block;
    session->source.bytes_in_buffer = count;
    return TRUE;
}

void skipBytes(j_decompress_ptr object, long count) {
    auto rest = static_cast<std::size_t>(std::max(count, 0L));
    while (rest > object->src->bytes_in_buffer) {
        rest -= object->src->bytes_in_buffer;
        fillBlock(object);
    }
    object->src->next_input_byte += rest;
    object->src->bytes_in_buffer -= rest;
}

void setSource(JpegSession& session) {
    session.source.init_source = doNothing;
    session.source.fill_input_buffer = fillBlock;
    session.source.skip_input_data = skipBytes;
    session.source.resync_to_restart = jpeg_resync_to_restart;
    session.source.term_source = doNothing;
    session.object.src = &session.source;
    session.object.client_data = &session;
}

/// Chooses the scale: the smallest that leaves as many pixels as are wanted.
void setScale(JpegSession& session) {
    jpeg_decompress_struct& object = session.object;
    object.scale_denom = fullScale;
    for (object.scale_num = 1; object.scale_num < fullScale; ++object.scale_num) {
        jpeg_calc_output_dimensions(&object);
        if (object.output_width >= static_cast<unsigned>(session.wanted.columns) &&
            object.output_height >= static_cast<unsigned>(session.wanted.rows)) {
            return;
        }
    }
}

/// The colours in which the pixels of a file are asked for.
struct OutputColors {
    J_COLOR_SPACE file;
    J_COLOR_SPACE output;
};

constexpr OutputColors outputColors[] = {
    {JCS_GRAYSCALE, JCS_GRAYSCALE}, {JCS_YCbCr, JCS_RGB}, {JCS_RGB, JCS_RGB},
    {JCS_CMYK, JCS_CMYK},           {JCS_YCCK, JCS_CMYK},
};

bool setColors(JpegSession& session) {
    const auto* found =
        std::ranges::find(outputColors, session.object.jpeg_color_space, &OutputColors::file);
    if (found == std::end(outputColors)) {
        return false;
    }
    session.object.out_color_space = found->output;
    return true;
}

bool readHeader(JpegSession& session) {
    constexpr unsigned longestSegment = 0xFFFF;
    if (setjmp(session.error.place)) {
        return false;
    }
    jpeg_create_decompress(&session.object);
    setSource(session);
    jpeg_save_markers(&session.object, JPEG_APP0 + 2, longestSegment);
    jpeg_read_header(&session.object, TRUE);
    if (!setColors(session)) {
        return false;
    }
    setScale(session);
    jpeg_calc_output_dimensions(&session.object);
    jpeg_read_icc_profile(&session.object, &session.profile, &session.profileSize);
    return true;
}

/// Turns a row of CMYK into RGB, as far as that goes without profiles.
void convertCmyk(const std::uint8_t* from, std::uint8_t* to, int columns, bool isInverted) {
    constexpr unsigned full = 255;
    const unsigned flip = isInverted ? 0 : full;
    for (int x = 0; x < columns; ++x, from += cmykChannels) {
        const unsigned light = from[3] ^ flip;
        for (int i = 0; i < 3; ++i) {
            *to++ = static_cast<std::uint8_t>(((from[i] ^ flip) * light + full / 2) / full);
        }
    }
}

/// Decodes the next row into its place.
void readRow(JpegSession& session, GS_Bitmap& bitmap) {
    std::uint8_t* row = bitmap.getRow(static_cast<int>(session.object.output_scanline));
    const bool isCmyk = session.object.out_color_space == JCS_CMYK;
    JSAMPROW target = isCmyk ? session.line.data() : row;
    const bool isRead = jpeg_read_scanlines(&session.object, &target, 1) == 1;
    if (isCmyk && isRead) {
        convertCmyk(target, row, bitmap.columns, session.object.saw_Adobe_marker != 0);
    }
}

bool readRows(JpegSession& session, GS_Bitmap& bitmap) {
    if (setjmp(session.error.place)) {
        return false;
    }
    jpeg_start_decompress(&session.object);
    while (session.object.output_scanline < session.object.output_height) {
        readRow(session, bitmap);
    }
    jpeg_finish_decompress(&session.object);
    return true;
}

bool allocate(JpegSession& session, GS_Bitmap& bitmap) {
    const jpeg_decompress_struct& object = session.object;
    const bool isGrey = object.out_color_space == JCS_GRAYSCALE;
    if (object.out_color_space == JCS_CMYK) {
        session.line.resize(std::size_t{object.output_width} * cmykChannels);
    }
    return bitmap.allocate(static_cast<int>(object.output_width),
                           static_cast<int>(object.output_height), isGrey ? 1 : 3);
}

} // namespace

bool readJpegPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize wanted,
                    GS_Bitmap& bitmap) {
    const auto session = std::make_unique<JpegSession>(input, wanted);
    if (!input.seek(0) || !readHeader(*session) ||
        session->object.image_width != static_cast<unsigned>(info.columns) ||
        session->object.image_height != static_cast<unsigned>(info.rows) ||
        !allocate(*session, bitmap)) {
        return false;
    }
    if (session->profile) {
        bitmap.setProfile(session->profile, session->profileSize);
    }
    return readRows(*session, bitmap);
}

} // namespace MoxGraphicService_NS
