#include "foundation/graphicservice/GS_BmpHeader.h"

#include "foundation/graphicservice/GS_Bytes.h"

#include <algorithm>
#include <bit>
#include <cstring>

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t fileHeaderSize = 14;
constexpr std::uint32_t coreSize = 12; // of OS/2, with sizes of two bytes
constexpr std::uint32_t infoSize = 40;
constexpr std::uint32_t maskedSize = 52;
constexpr std::uint32_t alphaMaskedSize = 56;
constexpr std::uint32_t secondCoreSize = 64; // of OS/2 again
constexpr std::uint32_t fourthSize = 108;
constexpr std::uint32_t fifthSize = 124;
constexpr std::uint32_t longestSize = fifthSize + 16; // room for masks behind a header

constexpr std::uint32_t headerSizes[] = {coreSize,       infoSize,   maskedSize, alphaMaskedSize,
                                         secondCoreSize, fourthSize, fifthSize};

constexpr std::uint32_t bitFields = 3;
constexpr std::uint32_t alphaBitFields = 6;

/// The bytes of the headers, null where the file has none.
struct RawHeader {
    std::uint8_t file[fileHeaderSize] = {};
    std::uint8_t bytes[longestSize] = {};
    std::uint32_t size = 0;
};

bool readRaw(GS_Input& input, RawHeader& raw) {
    if (!input.seek(0) || !input.readAll(raw.file, fileHeaderSize) ||
        !input.readAll(raw.bytes, 4)) {
        return false;
    }
    raw.size = readLittle32(raw.bytes);
    if (std::ranges::find(headerSizes, raw.size) == std::end(headerSizes) ||
        !input.readAll(raw.bytes + 4, raw.size - 4)) {
        return false;
    }
    input.read(raw.bytes + raw.size, longestSize - raw.size);
    return true;
}

/// Takes a height that is negative for rows from the top.
bool setSize(GS_BmpHeader& header, std::uint32_t columns, std::int64_t rows) {
    header.isTopDown = rows < 0;
    return header.info.setSize(columns, static_cast<std::uint64_t>(rows < 0 ? -rows : rows));
}

bool takeSize(const RawHeader& raw, GS_BmpHeader& header) {
    const std::uint8_t* bytes = raw.bytes;
    if (raw.size == coreSize) {
        header.depth = static_cast<int>(readLittle16(bytes + 10));
        return readLittle16(bytes + 8) == 1 &&
               setSize(header, readLittle16(bytes + 4), readLittle16(bytes + 6));
    }
    header.depth = static_cast<int>(readLittle16(bytes + 14));
    return readLittle16(bytes + 12) == 1 &&
           setSize(header, readLittle32(bytes + 4),
                   static_cast<std::int32_t>(readLittle32(bytes + 8)));
}

/// Which number of compression goes with which depths.
struct Form {
    std::uint32_t compression;
    int depth;
    GS_BmpCompression result;
    bool hasMasks;
};

constexpr Form forms[] = {
    {0, 1, GS_BmpCompression::plain, false},
    {0, 4, GS_BmpCompression::plain, false},
    {0, 8, GS_BmpCompression::plain, false},
    {0, 16, GS_BmpCompression::plain, false},
    {0, 24, GS_BmpCompression::plain, false},
    {0, 32, GS_BmpCompression::plain, false},
    {1, 8, GS_BmpCompression::runs8, false},
    {2, 4, GS_BmpCompression::runs4, false},
    {bitFields, 16, GS_BmpCompression::plain, true},
    {bitFields, 32, GS_BmpCompression::plain, true},
    {alphaBitFields, 16, GS_BmpCompression::plain, true},
    {alphaBitFields, 32, GS_BmpCompression::plain, true},
};

/// The masks of files that state none. At 32 bits the fourth byte has no meaning.
void setUsualMasks(GS_BmpHeader& header) {
    constexpr std::uint32_t masks16[] = {0x7C00, 0x03E0, 0x001F};
    constexpr std::uint32_t masks32[] = {0xFF0000, 0x00FF00, 0x0000FF};
    std::copy_n(header.depth == 16 ? masks16 : masks32, 3, header.masks);
}

/// Returns: whether a mask of `depth` bits can be decoded: it has 8 bits at most, all in one row.
bool isMask(std::uint32_t mask, int depth) {
    constexpr int mostBits = 8;
    const std::uint32_t lowest = mask & (~mask + 1);
    const bool isOneRow = mask == 0 || std::has_single_bit(std::uint64_t{mask} + lowest);
    return isOneRow && std::popcount(mask) <= mostBits && mask >> (depth - 1) <= 1;
}

/// Takes the masks, which lie behind the fields of a plain header, inside a longer one or not.
bool takeMasks(const RawHeader& raw, std::uint32_t compression, GS_BmpHeader& header) {
    const bool hasAlpha = compression == alphaBitFields || raw.size >= alphaMaskedSize;
    for (std::size_t i = 0; i < (hasAlpha ? 4U : 3U); ++i) {
        header.masks[i] = readLittle32(raw.bytes + infoSize + i * 4);
    }
    const bool hasColors = header.masks[0] != 0 && header.masks[1] != 0 && header.masks[2] != 0;
    return hasColors && std::ranges::all_of(header.masks, [&header](std::uint32_t mask) {
               return isMask(mask, header.depth);
           });
}

bool takeForm(const RawHeader& raw, GS_BmpHeader& header) {
    const std::uint32_t compression = raw.size == coreSize ? 0 : readLittle32(raw.bytes + 16);
    const auto* form = std::ranges::find_if(forms, [&](const Form& row) {
        return row.compression == compression && row.depth == header.depth;
    });
    const bool isOs2 = raw.size == secondCoreSize;
    if (form == std::end(forms) || (isOs2 && form->hasMasks)) {
        return false;
    }
    header.compression = form->result;
    if (form->result != GS_BmpCompression::plain && header.isTopDown) {
        return false;
    }
    if (form->hasMasks) {
        return takeMasks(raw, compression, header);
    }
    setUsualMasks(header);
    return true;
}

void takeResolution(const RawHeader& raw, GS_BmpHeader& header) {
    constexpr double inchesPerMeter = 1.0 / 0.0254;
    if (raw.size != coreSize) {
        header.info.setResolution(readLittle32(raw.bytes + 24), readLittle32(raw.bytes + 28),
                                  inchesPerMeter);
    }
}

/// Notes where the profile of the longest header lies, when the file has it.
void takeProfile(const RawHeader& raw, std::uint64_t fileSize, GS_BmpHeader& header) {
    constexpr std::uint32_t embedded = 0x4D424544; // "MBED", the last letter first
    constexpr std::uint32_t longest = 16U << 20;
    if (raw.size != fifthSize || readLittle32(raw.bytes + 56) != embedded) {
        return;
    }
    const std::uint64_t offset = std::uint64_t{readLittle32(raw.bytes + 112)} + fileHeaderSize;
    const std::uint32_t size = readLittle32(raw.bytes + 116);
    if (size <= longest && offset + size <= fileSize) {
        header.profileOffset = static_cast<std::uint32_t>(offset);
        header.profileSize = size;
    }
}

/// Reads the palette; what the file leaves out of it is black.
bool takePalette(GS_Input& input, const RawHeader& raw, GS_BmpHeader& header) {
    constexpr int lastPaletteDepth = 8;
    constexpr std::size_t entrySize = 4;
    if (header.depth > lastPaletteDepth) {
        return true;
    }
    const std::uint64_t start = fileHeaderSize + raw.size;
    if (header.pixelOffset < start || !input.seek(start)) {
        return false;
    }
    const std::size_t inFile = raw.size == coreSize ? entrySize - 1 : entrySize;
    const std::uint32_t stated = raw.size == coreSize ? 0 : readLittle32(raw.bytes + 32);
    const std::size_t all = std::size_t{1} << header.depth;
    std::size_t count = (header.pixelOffset - start) / inFile;
    count = std::min({count, all, stated == 0 ? all : std::size_t{stated}});
    header.palette.assign(all * entrySize, 0);
    for (std::size_t i = 0; i < count; ++i) {
        if (!input.readAll(header.palette.data() + i * entrySize, inFile)) {
            return false;
        }
        header.palette[i * entrySize + entrySize - 1] = 0;
    }
    return true;
}

/// Returns: whether the file holds all rows of a plain form.
bool hasAllRows(const GS_BmpHeader& header, std::uint64_t fileSize) {
    constexpr std::uint64_t rowUnit = 32; // rows end at four bytes
    const auto columns = static_cast<std::uint64_t>(header.info.columns);
    const std::uint64_t bits = columns * static_cast<unsigned>(header.depth);
    const std::uint64_t rowSize = (bits + rowUnit - 1) / rowUnit * 4;
    const auto rows = static_cast<std::uint64_t>(header.info.rows);
    return header.pixelOffset + rowSize * rows <= fileSize;
}

} // namespace

bool readBmpHeader(GS_Input& input, GS_BmpHeader& header) {
    RawHeader raw;
    if (!readRaw(input, raw) || !takeSize(raw, header) || !takeForm(raw, header)) {
        return false;
    }
    header.pixelOffset = readLittle32(raw.file + 10);
    header.info.mayBeTransparent = header.masks[3] != 0;
    takeResolution(raw, header);
    takeProfile(raw, input.getSize(), header);
    const bool isPlain = header.compression == GS_BmpCompression::plain;
    return header.pixelOffset >= fileHeaderSize + raw.size &&
           header.pixelOffset < input.getSize() && takePalette(input, raw, header) &&
           (!isPlain || hasAllRows(header, input.getSize()));
}

} // namespace MoxGraphicService_NS
