#include "foundation/graphicservice/GS_WebpReader.h"

#include "foundation/graphicservice/GS_Bytes.h"
#include "foundation/graphicservice/GS_Exif.h"
#include "foundation/graphicservice/GS_Graphic.h"

#include <algorithm>
#include <cstring>
#include <memory>
#include <webp/decode.h>
#include <webp/demux.h>

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t fileHeaderSize = 12;
constexpr std::size_t chunkHeaderSize = 8;
constexpr std::size_t longestExif = 65536;

struct Chunk {
    std::uint8_t name[4];
    std::uint64_t start; // of its body
    std::uint64_t size;
};

/// Returns: the position behind the file, as its header states it; 0 when that can't be.
std::uint64_t readEnd(GS_Input& input) {
    std::uint8_t head[fileHeaderSize];
    if (!input.seek(0) || !input.readAll(head, sizeof head)) {
        return 0;
    }
    const std::uint64_t end = std::uint64_t{readLittle32(head + 4)} + chunkHeaderSize;
    return end <= input.getSize() ? end : 0;
}

bool readChunk(GS_Input& input, std::uint64_t end, Chunk& chunk) {
    std::uint8_t head[chunkHeaderSize];
    if (!input.readAll(head, sizeof head)) {
        return false;
    }
    std::copy_n(head, sizeof chunk.name, chunk.name);
    chunk.start = input.getPosition();
    chunk.size = readLittle32(head + 4);
    return chunk.start + chunk.size <= end;
}

bool isNamed(const Chunk& chunk, const char (&text)[5]) {
    return std::memcmp(chunk.name, text, sizeof chunk.name) == 0;
}

void readExif(GS_Input& input, const Chunk& chunk, GS_ImageInfo& info) {
    std::vector<std::uint8_t> body(std::min<std::uint64_t>(chunk.size, longestExif));
    if (!input.readAll(body.data(), body.size())) {
        return;
    }
    constexpr std::size_t nameSize = 6; // some programs keep the name that stands in JPEG files
    const bool isLong = body.size() > nameSize;
    const bool hasName = isLong && std::memcmp(body.data(), "Exif\0", nameSize) == 0;
    const std::size_t skipped = hasName ? nameSize : 0;
    info.orientation = readExifOrientation(body.data() + skipped, body.size() - skipped);
}

/// Goes over all chunks, looking for the orientation. Returns: whether there are pixels.
bool walkChunks(GS_Input& input, std::uint64_t end, GS_ImageInfo& info) {
    bool hasPixels = false;
    while (input.getPosition() + chunkHeaderSize <= end) {
        Chunk chunk = {};
        if (!readChunk(input, end, chunk)) {
            return false;
        }
        hasPixels =
            hasPixels || isNamed(chunk, "VP8 ") || isNamed(chunk, "VP8L") || isNamed(chunk, "ANMF");
        if (isNamed(chunk, "EXIF")) {
            readExif(input, chunk, info);
        }
        const std::uint64_t next = chunk.start + chunk.size + chunk.size % 2;
        if (!input.seek(std::min(next, end))) {
            return false;
        }
    }
    return hasPixels;
}

bool readFeatures(GS_Input& input, GS_ImageInfo& info) {
    constexpr std::size_t mostNeeded = 4096;
    std::uint8_t head[mostNeeded];
    const std::size_t count = input.seek(0) ? input.read(head, mostNeeded) : 0;
    WebPBitstreamFeatures features;
    if (WebPGetFeatures(head, count, &features) != VP8_STATUS_OK ||
        !info.setSize(static_cast<std::uint64_t>(features.width),
                      static_cast<std::uint64_t>(features.height))) {
        return false;
    }
    // The first frame of an animation may leave a part of the canvas as it is.
    info.mayBeTransparent = features.has_alpha != 0 || features.has_animation != 0;
    return true;
}

struct DemuxerEnd {
    void operator()(WebPDemuxer* demuxer) const { WebPDemuxDelete(demuxer); }
};

/// The whole file, and what is in it.
struct WebpFile {
    std::vector<std::uint8_t> bytes;
    std::unique_ptr<WebPDemuxer, DemuxerEnd> demuxer;
};

bool readFile(GS_Input& input, WebpFile& file) {
    // A limit of its own: more bytes than pixels in memory make no sense.
    const std::uint64_t end = readEnd(input);
    const auto limit = static_cast<std::uint64_t>(GS_Graphic::getPixelLimit());
    if (end == 0 || end / 4 > limit || !input.seek(0)) {
        return false;
    }
    file.bytes.resize(end);
    if (!input.readAll(file.bytes.data(), file.bytes.size())) {
        return false;
    }
    const WebPData data = {file.bytes.data(), file.bytes.size()};
    file.demuxer.reset(WebPDemux(&data));
    return file.demuxer != nullptr;
}

/// Decodes `frame` into its place on the bitmap.
bool decodeFrame(const WebPIterator& frame, GS_Bitmap& bitmap) {
    if (frame.x_offset < 0 || frame.y_offset < 0 || frame.width < 1 || frame.height < 1 ||
        frame.x_offset + frame.width > bitmap.columns ||
        frame.y_offset + frame.height > bitmap.rows) {
        return false;
    }
    std::uint8_t* target =
        bitmap.getRow(frame.y_offset) + std::ptrdiff_t{frame.x_offset} * bitmap.channels;
    const std::uint8_t* end = bitmap.getRow(bitmap.rows);
    const auto room = static_cast<std::size_t>(end - target);
    const auto stride = static_cast<int>(bitmap.getRowSize());
    const auto decode = bitmap.hasAlpha() ? WebPDecodeRGBAInto : WebPDecodeRGBInto;
    WebPBitstreamFeatures features;
    const WebPData& data = frame.fragment;
    // A frame that is larger than it says would be written beside its place.
    return WebPGetFeatures(data.bytes, data.size, &features) == VP8_STATUS_OK &&
           features.width == frame.width && features.height == frame.height &&
           decode(data.bytes, data.size, target, room, stride) != nullptr;
}

void takeProfile(const WebpFile& file, GS_Bitmap& bitmap) {
    WebPChunkIterator chunk;
    if (WebPDemuxGetChunk(file.demuxer.get(), "ICCP", 1, &chunk) != 0) {
        bitmap.setProfile(chunk.chunk.bytes, chunk.chunk.size);
    }
    WebPDemuxReleaseChunkIterator(&chunk);
}

} // namespace

bool readWebpInfo(GS_Input& input, GS_ImageInfo& info) {
    const std::uint64_t end = readEnd(input);
    return end > 0 && walkChunks(input, end, info) && readFeatures(input, info);
}

bool readWebpPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize /*wanted*/,
                    GS_Bitmap& bitmap) {
    WebpFile file;
    if (!readFile(input, file) ||
        !bitmap.allocate(info.columns, info.rows, info.mayBeTransparent ? 4 : 3)) {
        return false;
    }
    takeProfile(file, bitmap);
    WebPIterator frame;
    const bool isDecoded =
        WebPDemuxGetFrame(file.demuxer.get(), 1, &frame) != 0 && decodeFrame(frame, bitmap);
    WebPDemuxReleaseIterator(&frame);
    return isDecoded;
}

} // namespace MoxGraphicService_NS
