#include "foundation/graphicservice/GS_PngStructure.h"

#include "foundation/graphicservice/GS_Bytes.h"
#include "foundation/graphicservice/GS_Crc32.h"
#include "foundation/graphicservice/GS_Exif.h"

#include <algorithm>
#include <vector>

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t signatureSize = 8;
constexpr std::size_t blockSize = 65536;
constexpr std::uint32_t longestChunk = 0x7FFFFFFF;
constexpr std::uint32_t longestKept = 65536; // no chunk that is looked into needs more
constexpr int palettedType = 3;
constexpr int alphaBit = 4;

constexpr std::uint32_t name(const char (&text)[5]) {
    std::uint32_t value = 0;
    for (int i = 0; i < 4; ++i) {
        value = value << 8 | static_cast<std::uint8_t>(text[i]);
    }
    return value;
}

/// Which depths a colour type has, and how many samples a pixel.
struct ColorType {
    std::uint8_t type;
    std::uint8_t samples;
    std::uint32_t depths; // a sum of depths, each a bit of its own
};

constexpr ColorType colorTypes[] = {
    {0, 1, 1 | 2 | 4 | 8 | 16}, // grey
    {2, 3, 8 | 16},             // red, green, blue
    {3, 1, 1 | 2 | 4 | 8},      // palette
    {4, 2, 8 | 16},             // grey and alpha
    {6, 4, 8 | 16},             // red, green, blue and alpha
};

struct Chunk {
    std::uint32_t length = 0;
    std::uint32_t type = 0;
    std::vector<std::uint8_t> body; // of short chunks
    bool isSound = true;            // the checksum is right
};

/// What the chunks so far have come to.
struct Walk {
    GS_ImageInfo& info;
    std::uint8_t colorType = 0;
    std::uint64_t rawSize = 0; // of the pixels, filter bytes left out
    std::uint64_t dataSize = 0;
    std::uint32_t lastType = 0;
    bool hasPalette = false;
};

bool isLetter(std::uint8_t byte) {
    return (byte >= 'A' && byte <= 'Z') || (byte >= 'a' && byte <= 'z');
}

/// Returns: whether a reader that doesn't know the chunk must refuse the file.
bool isCritical(std::uint32_t type) { return (type >> 24 & 0x20) == 0; }

/// Takes the body of `chunk` from the input, block by block, into its checksum.
bool readBody(GS_Input& input, Chunk& chunk, GS_Crc32& checksum) {
    std::uint8_t block[blockSize];
    for (std::uint32_t rest = chunk.length; rest > 0;) {
        const std::size_t count = std::min<std::size_t>(rest, blockSize);
        if (!input.readAll(block, count)) {
            return false;
        }
        checksum.add(block, count);
        if (chunk.length <= longestKept && chunk.type != name("IDAT")) {
            chunk.body.insert(chunk.body.end(), block, block + count);
        }
        rest -= static_cast<std::uint32_t>(count);
    }
    return true;
}

bool readChunk(GS_Input& input, Chunk& chunk) {
    std::uint8_t head[8];
    if (!input.readAll(head, sizeof head) || !std::all_of(head + 4, head + 8, isLetter)) {
        return false;
    }
    chunk.length = readBig32(head);
    chunk.type = readBig32(head + 4);
    if (chunk.length > longestChunk || chunk.length > input.getRest()) {
        return false;
    }
    GS_Crc32 checksum;
    checksum.add(head + 4, 4);
    std::uint8_t tail[4];
    if (!readBody(input, chunk, checksum) || !input.readAll(tail, sizeof tail)) {
        return false;
    }
    chunk.isSound = readBig32(tail) == checksum.getValue();
    return chunk.isSound || !isCritical(chunk.type);
}

bool takeHeader(Walk& walk, const Chunk& chunk) {
    constexpr std::size_t headerSize = 13;
    if (walk.lastType != 0 || chunk.body.size() != headerSize) {
        return false;
    }
    const std::uint8_t* body = chunk.body.data();
    const std::uint8_t depth = body[8];
    const auto* found = std::ranges::find(colorTypes, body[9], &ColorType::type);
    const bool isDepth = depth != 0 && (depth & (depth - 1)) == 0;
    if (found == std::end(colorTypes) || !isDepth || (found->depths & depth) == 0 ||
        body[10] != 0 || body[11] != 0 || body[12] > 1) {
        return false;
    }
    if (!walk.info.setSize(readBig32(body), readBig32(body + 4))) {
        return false;
    }
    const std::uint64_t bits = std::uint64_t{depth} * found->samples;
    const auto columns = static_cast<std::uint64_t>(walk.info.columns);
    walk.rawSize = (columns * bits + 7) / 8 * static_cast<std::uint64_t>(walk.info.rows);
    walk.colorType = found->type;
    walk.info.mayBeTransparent = (found->type & alphaBit) != 0;
    return true;
}

bool takePalette(Walk& walk, const Chunk& chunk) {
    constexpr std::uint32_t entrySize = 3;
    constexpr std::uint32_t longest = 256 * entrySize;
    const bool isRepeated = walk.hasPalette;
    walk.hasPalette = true;
    return !isRepeated && walk.dataSize == 0 && (walk.colorType & 2) != 0 && chunk.length > 0 &&
           chunk.length <= longest && chunk.length % entrySize == 0;
}

bool takeData(Walk& walk, const Chunk& chunk) {
    const bool isFirst = walk.dataSize == 0;
    walk.dataSize += chunk.length;
    const bool isInPlace = walk.lastType == name("IDAT") || isFirst;
    return isInPlace && (walk.hasPalette || walk.colorType != palettedType);
}

bool takeEnd(Walk& walk, const Chunk& chunk) {
    constexpr std::uint64_t highestRatio = 1040; // Deflate makes at most 1032 bytes of one
    return chunk.length == 0 && walk.dataSize > 0 && walk.dataSize * highestRatio >= walk.rawSize;
}

bool takeTransparency(Walk& walk, const Chunk&) {
    walk.info.mayBeTransparent = true;
    return true;
}

bool takeResolution(Walk& walk, const Chunk& chunk) {
    constexpr std::size_t size = 9;
    constexpr double inchesPerMeter = 1.0 / 0.0254;
    if (chunk.body.size() == size && chunk.body[8] == 1) {
        walk.info.setResolution(readBig32(chunk.body.data()), readBig32(chunk.body.data() + 4),
                                inchesPerMeter);
    }
    return true;
}

bool takeExif(Walk& walk, const Chunk& chunk) {
    walk.info.orientation = readExifOrientation(chunk.body.data(), chunk.body.size());
    return true;
}

struct ChunkStep {
    std::uint32_t type;
    bool (*take)(Walk&, const Chunk&);
};

constexpr ChunkStep chunkSteps[] = {
    {name("IHDR"), takeHeader}, {name("PLTE"), takePalette},      {name("IDAT"), takeData},
    {name("IEND"), takeEnd},    {name("tRNS"), takeTransparency}, {name("pHYs"), takeResolution},
    {name("eXIf"), takeExif},
};

bool takeChunk(Walk& walk, const Chunk& chunk) {
    if (walk.lastType == 0 && chunk.type != name("IHDR")) {
        return false;
    }
    const auto* step = std::ranges::find(chunkSteps, chunk.type, &ChunkStep::type);
    const bool isKnown = step != std::end(chunkSteps);
    const bool isTaken =
        !isKnown ? !isCritical(chunk.type) : !chunk.isSound || step->take(walk, chunk);
    walk.lastType = chunk.type;
    return isTaken;
}

} // namespace

bool readPngInfo(GS_Input& input, GS_ImageInfo& info) {
    Walk walk = {.info = info};
    if (!input.seek(signatureSize)) {
        return false;
    }
    while (walk.lastType != name("IEND")) {
        Chunk chunk;
        if (!readChunk(input, chunk) || !takeChunk(walk, chunk)) {
            return false;
        }
    }
    return true;
}

} // namespace MoxGraphicService_NS
