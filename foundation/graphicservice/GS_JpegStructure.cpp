#include "foundation/graphicservice/GS_JpegStructure.h"

#include "foundation/graphicservice/GS_Bytes.h"
#include "foundation/graphicservice/GS_Exif.h"

#include <algorithm>
#include <cstring>
#include <vector>

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t blockSize = 65536;
constexpr int mostScans = 100; // progressive files have some ten

constexpr std::uint8_t markerByte = 0xFF;
constexpr std::uint8_t startOfImage = 0xD8;
constexpr std::uint8_t endOfImage = 0xD9;
constexpr std::uint8_t startOfScan = 0xDA;
constexpr std::uint8_t firstRestart = 0xD0;
constexpr std::uint8_t lastRestart = 0xD7;
constexpr std::uint8_t application0 = 0xE0;
constexpr std::uint8_t application1 = 0xE1;

/// Goes through the file byte by byte, out of blocks.
class Scanner {
public:
    explicit Scanner(GS_Input& source) : input(source), block(blockSize) {}

    /// Returns: the next byte, -1 at the end.
    int next() {
        if (index == count && !refill()) {
            return -1;
        }
        return block[index++];
    }

    /// Takes `size` bytes.
    bool take(std::vector<std::uint8_t>& target, std::size_t size) {
        target.clear();
        while (target.size() < size) {
            if (index == count && !refill()) {
                return false;
            }
            const std::size_t part = std::min(size - target.size(), count - index);
            const std::uint8_t* from = block.data() + index;
            target.insert(target.end(), from, from + part);
            index += part;
        }
        return true;
    }

    /// Goes on to just behind the next 0xFF. Returns: false when there is none.
    bool skipToMarkerByte() {
        while (index < count || refill()) {
            const std::uint8_t* from = block.data() + index;
            const void* found = std::memchr(from, markerByte, count - index);
            if (found) {
                const auto distance = static_cast<const std::uint8_t*>(found) - from;
                index += static_cast<std::size_t>(distance) + 1;
                return true;
            }
            index = count;
        }
        return false;
    }

    /// Returns: how many bytes were taken so far.
    std::uint64_t getPosition() const { return input.getPosition() - (count - index); }

private:
    bool refill() {
        count = input.read(block.data(), block.size());
        index = 0;
        return count > 0;
    }

    GS_Input& input;
    std::vector<std::uint8_t> block;
    std::size_t index = 0;
    std::size_t count = 0;
};

/// What the segments so far have come to.
struct Walk {
    explicit Walk(GS_Input& input, GS_ImageInfo& target) : scanner(input), info(target) {}

    Scanner scanner;
    GS_ImageInfo& info;
    std::vector<std::uint8_t> body; // of the present segment
    bool hasFrame = false;
    bool isHuffman = false;
    int scans = 0;
    std::uint64_t blocks = 0;   // of 8 by 8 samples, in all components
    std::uint64_t dataSize = 0; // of all scans
};

/// Returns: the marker behind any count of 0xFF, -1 when something else comes.
int readMarker(Scanner& scanner) {
    if (scanner.next() != markerByte) {
        return -1;
    }
    int byte = markerByte;
    while (byte == markerByte) {
        byte = scanner.next();
    }
    return byte;
}

/// Goes over the data of a scan. Returns: the marker that ends it, -1 when none does.
int skipScan(Walk& walk) {
    const std::uint64_t start = walk.scanner.getPosition();
    while (walk.scanner.skipToMarkerByte()) {
        int byte = markerByte;
        while (byte == markerByte) {
            byte = walk.scanner.next();
        }
        if (byte != 0 && (byte < firstRestart || byte > lastRestart)) {
            walk.dataSize += walk.scanner.getPosition() - start;
            return byte;
        }
    }
    return -1;
}

std::uint64_t divideUp(std::uint64_t value, std::uint64_t by) { return (value + by - 1) / by; }

/// Sets how many blocks the components have at least.
bool countBlocks(Walk& walk, const std::uint8_t* components, std::size_t count) {
    constexpr std::size_t componentSize = 3;
    constexpr unsigned mostSamples = 4;
    unsigned widest = 1;
    unsigned highest = 1;
    for (std::size_t i = 0; i < count; ++i) {
        widest = std::max<unsigned>(widest, components[i * componentSize + 1] >> 4U);
        highest = std::max<unsigned>(highest, components[i * componentSize + 1] & 15U);
    }
    for (std::size_t i = 0; i < count; ++i) {
        const unsigned across = components[i * componentSize + 1] >> 4U;
        const unsigned down = components[i * componentSize + 1] & 15U;
        if (across < 1 || across > mostSamples || down < 1 || down > mostSamples) {
            return false;
        }
        const auto columns = static_cast<std::uint64_t>(walk.info.columns);
        const auto rows = static_cast<std::uint64_t>(walk.info.rows);
        walk.blocks +=
            divideUp(columns * across, widest * 8ULL) * divideUp(rows * down, highest * 8ULL);
    }
    return true;
}

/// Takes the header of the frame, of which there has to be one.
bool takeFrame(Walk& walk, int marker) {
    constexpr std::size_t fixedSize = 6;
    constexpr std::size_t componentSize = 3;
    constexpr int lastHuffman = 0xC2;
    const std::uint8_t* body = walk.body.data();
    if (walk.hasFrame || walk.body.size() < fixedSize || body[0] != 8) {
        return false;
    }
    const std::size_t components = body[5];
    if ((components != 1 && components != 3 && components != 4) ||
        walk.body.size() != fixedSize + components * componentSize) {
        return false;
    }
    walk.hasFrame = true;
    walk.isHuffman = marker <= lastHuffman;
    return walk.info.setSize(readBig16(body + 3), readBig16(body + 1)) &&
           countBlocks(walk, body + fixedSize, components);
}

bool refuse(Walk&, int) { return false; }

bool takeJfif(Walk& walk, int) {
    constexpr std::size_t size = 12;
    constexpr double inchesPerUnit[] = {0.0, 1.0, 1.0 / 2.54};
    const std::uint8_t* body = walk.body.data();
    if (walk.body.size() >= size && std::memcmp(body, "JFIF", 5) == 0 &&
        (body[7] == 1 || body[7] == 2)) {
        walk.info.setResolution(readBig16(body + 8), readBig16(body + 10), inchesPerUnit[body[7]]);
    }
    return true;
}

bool takeExif(Walk& walk, int) {
    constexpr std::size_t nameSize = 6;
    const std::uint8_t* body = walk.body.data();
    if (walk.body.size() > nameSize && std::memcmp(body, "Exif\0", nameSize) == 0) {
        walk.info.orientation = readExifOrientation(body + nameSize, walk.body.size() - nameSize);
    }
    return true;
}

/// What is done about a segment.
struct SegmentStep {
    int first;
    int last; // of a range of markers
    bool (*take)(Walk&, int);
};

constexpr SegmentStep segmentSteps[] = {
    {0x00, 0xBF, refuse},    // none of these is a marker with a segment
    {0xC0, 0xC2, takeFrame}, // baseline, extended and progressive, Huffman
    {0xC3, 0xC3, refuse},    // lossless
    {0xC5, 0xC8, refuse},    // hierarchical, and a reserved one
    {0xC9, 0xCA, takeFrame}, // extended and progressive, arithmetic
    {0xCB, 0xCB, refuse},    // lossless
    {0xCD, 0xCF, refuse},    // hierarchical
    {0xD0, 0xD9, refuse},    // stand alone, and have no place between segments
    {0xDC, 0xDC, refuse},    // the height comes after the first scan
    {application0, application0, takeJfif},
    {application1, application1, takeExif},
};

bool readBody(Walk& walk) {
    const int high = walk.scanner.next();
    const int low = walk.scanner.next();
    if (high < 0 || low < 0) {
        return false;
    }
    const int size = high * 256 + low;
    return size >= 2 && walk.scanner.take(walk.body, static_cast<std::size_t>(size - 2));
}

bool takeSegment(Walk& walk, int marker) {
    const auto* step = std::ranges::find_if(segmentSteps, [marker](const SegmentStep& row) {
        return marker >= row.first && marker <= row.last;
    });
    if (step != std::end(segmentSteps) && step->take == refuse) {
        return false;
    }
    return readBody(walk) && (step == std::end(segmentSteps) || step->take(walk, marker));
}

/// Goes over one segment and, behind the header of a scan, its data.
/// Returns: the next marker, -1 for a break.
int takeMarker(Walk& walk, int marker) {
    if (!takeSegment(walk, marker)) {
        return -1;
    }
    if (marker != startOfScan) {
        return readMarker(walk.scanner);
    }
    ++walk.scans;
    return walk.hasFrame && walk.scans <= mostScans ? skipScan(walk) : -1;
}

bool hasEnoughData(const Walk& walk) {
    return walk.scans > 0 && (!walk.isHuffman || walk.dataSize >= walk.blocks / 8);
}

} // namespace

bool readJpegInfo(GS_Input& input, GS_ImageInfo& info) {
    if (!input.seek(0)) {
        return false;
    }
    Walk walk(input, info);
    if (readMarker(walk.scanner) != startOfImage) {
        return false;
    }
    int marker = readMarker(walk.scanner);
    while (marker >= 0 && marker != endOfImage) {
        marker = takeMarker(walk, marker);
    }
    return marker == endOfImage && hasEnoughData(walk);
}

} // namespace MoxGraphicService_NS
