#include "foundation/graphicservice/GS_Exif.h"

#include "foundation/graphicservice/GS_Bytes.h"

#include <cstring>

namespace MoxGraphicService_NS {
namespace {

constexpr std::uint32_t orientationTag = 0x0112;
constexpr std::uint32_t shortType = 3;
constexpr std::size_t headerSize = 8;
constexpr std::size_t entrySize = 12;

/// The two ways in which a TIFF file writes its numbers.
struct ByteOrder {
    const char* mark; // borrowed: a literal
    std::uint32_t (*read16)(const std::uint8_t*);
    std::uint32_t (*read32)(const std::uint8_t*);
};

constexpr ByteOrder byteOrders[] = {
    {"II*", readLittle16, readLittle32},
    {"MM\0*", readBig16, readBig32},
};

/// Returns: the orientation in the directory at `offset`.
int findOrientation(const ByteOrder& order, const std::uint8_t* bytes, std::size_t size) {
    const std::size_t offset = order.read32(bytes + 4);
    if (offset > size - 2) {
        return 1;
    }
    const std::size_t count = order.read16(bytes + offset);
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t entry = offset + 2 + i * entrySize;
        if (entry + entrySize > size) {
            return 1;
        }
        if (order.read16(bytes + entry) == orientationTag &&
            order.read16(bytes + entry + 2) == shortType) {
            return checkOrientation(order.read16(bytes + entry + 8));
        }
    }
    return 1;
}

} // namespace

int readExifOrientation(const std::uint8_t* bytes, std::size_t size) {
    constexpr std::size_t markSize = 4; // the third or fourth byte is a null in either order
    if (size < headerSize) {
        return 1;
    }
    for (const ByteOrder& order : byteOrders) {
        if (std::memcmp(bytes, order.mark, markSize) == 0) {
            return findOrientation(order, bytes, size);
        }
    }
    return 1;
}

int checkOrientation(std::uint32_t orientation) {
    constexpr std::uint32_t last = 8;
    return orientation >= 1 && orientation <= last ? static_cast<int>(orientation) : 1;
}

} // namespace MoxGraphicService_NS
