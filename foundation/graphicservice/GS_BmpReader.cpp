#include "foundation/graphicservice/GS_BmpReader.h"

#include "foundation/graphicservice/GS_BmpHeader.h"
#include "foundation/graphicservice/GS_BmpRuns.h"

#include <algorithm>
#include <cstring>

#define STB_IMAGE_IMPLEMENTATION
#define STB_IMAGE_STATIC
#define STBI_ONLY_BMP
#define STBI_NO_STDIO
#define STBI_NO_FAILURE_STRINGS
#include <stb_image.h>

namespace MoxGraphicService_NS {
namespace {

constexpr std::uint32_t fileHeaderSize = 14;
constexpr std::uint32_t fourthSize = 108; // of the header that states all masks

/// What the decoder gets: a header of the one form that it reads without doubt, made from the
/// checked facts, and behind it the pixels out of the file.
struct BmpSource {
    GS_Input& input;
    std::vector<std::uint8_t> head;
    std::size_t headTaken = 0;
};

void put(std::vector<std::uint8_t>& head, std::size_t offset, std::uint32_t value, int size) {
    for (int i = 0; i < size; ++i) {
        head[offset + static_cast<std::size_t>(i)] = static_cast<std::uint8_t>(value >> i * 8);
    }
}

std::vector<std::uint8_t> makeHead(const GS_BmpHeader& header) {
    constexpr std::uint32_t bitFields = 3;
    const auto size = static_cast<std::uint32_t>(header.palette.size());
    const bool hasMasks = header.depth == 16 || header.depth == 32;
    const int rows = header.isTopDown ? -header.info.rows : header.info.rows;
    std::vector<std::uint8_t> head(fileHeaderSize + fourthSize, 0);
    head[0] = 'B';
    head[1] = 'M';
    put(head, 10, fileHeaderSize + fourthSize + size, 4);
    put(head, 14, fourthSize, 4);
    put(head, 18, static_cast<std::uint32_t>(header.info.columns), 4);
    put(head, 22, static_cast<std::uint32_t>(rows), 4);
    put(head, 26, 1, 2);
    put(head, 28, static_cast<std::uint32_t>(header.depth), 2);
    put(head, 30, hasMasks ? bitFields : 0, 4);
    for (std::size_t i = 0; hasMasks && i < 4; ++i) {
        put(head, 54 + i * 4, header.masks[i], 4);
    }
    head.insert(head.end(), header.palette.begin(), header.palette.end());
    return head;
}

int readBytes(void* user, char* target, int count) {
    auto* source = static_cast<BmpSource*>(user);
    const auto wanted = static_cast<std::size_t>(std::max(count, 0));
    const std::size_t fromHead = std::min(wanted, source->head.size() - source->headTaken);
    std::copy_n(source->head.data() + source->headTaken, fromHead, target);
    source->headTaken += fromHead;
    return static_cast<int>(fromHead + source->input.read(target + fromHead, wanted - fromHead));
}

/// stb_image skips nothing but the few bytes behind a row.
void skipBytes(void* user, int count) {
    char dropped[16];
    for (int rest = count; rest > 0;) {
        const int part = readBytes(user, dropped, std::min<int>(rest, sizeof dropped));
        if (part == 0) {
            return;
        }
        rest -= part;
    }
}

int isAtEnd(void* user) {
    const auto* source = static_cast<BmpSource*>(user);
    return source->headTaken == source->head.size() && source->input.getRest() == 0 ? 1 : 0;
}

bool readPlain(GS_Input& input, const GS_BmpHeader& header, GS_Bitmap& bitmap) {
    constexpr stbi_io_callbacks callbacks = {readBytes, skipBytes, isAtEnd};
    if (!input.seek(header.pixelOffset)) {
        return false;
    }
    BmpSource source = {input, makeHead(header)};
    int columns = 0;
    int rows = 0;
    int channels = 0;
    bitmap.pixels.reset(
        stbi_load_from_callbacks(&callbacks, &source, &columns, &rows, &channels, 0));
    bitmap.columns = columns;
    bitmap.rows = rows;
    bitmap.channels = channels;
    return bitmap.pixels && columns == header.info.columns && rows == header.info.rows;
}

void takeProfile(GS_Input& input, const GS_BmpHeader& header, GS_Bitmap& bitmap) {
    std::vector<std::uint8_t> profile(header.profileSize);
    if (header.profileSize > 0 && input.seek(header.profileOffset) &&
        input.readAll(profile.data(), profile.size())) {
        bitmap.setProfile(profile.data(), profile.size());
    }
}

} // namespace

bool readBmpInfo(GS_Input& input, GS_ImageInfo& info) {
    GS_BmpHeader header;
    const bool isRead = readBmpHeader(input, header);
    info = header.info;
    return isRead;
}

bool readBmpPixels(GS_Input& input, const GS_ImageInfo& /*info*/, GS_WantedSize /*wanted*/,
                   GS_Bitmap& bitmap) {
    GS_BmpHeader header;
    if (!readBmpHeader(input, header)) {
        return false;
    }
    const bool isPlain = header.compression == GS_BmpCompression::plain;
    const bool isRead = isPlain ? readPlain(input, header, bitmap)
                                : bitmap.allocate(header.info.columns, header.info.rows, 3) &&
                                      readBmpRuns(input, header, bitmap);
    takeProfile(input, header, bitmap);
    return isRead;
}

} // namespace MoxGraphicService_NS
