#include "foundation/graphicservice/GS_BmpRuns.h"

#include <algorithm>

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t blockSize = 65536;

/// What the second byte behind a null byte means when it is no count.
constexpr int endOfLine = 0;
constexpr int endOfImage = 1;
constexpr int jump = 2;

class RunReader {
public:
    RunReader(GS_Input& source, const GS_BmpHeader& facts, GS_Bitmap& target)
        : input(source), header(facts), bitmap(target), block(blockSize),
          isHalf(facts.compression == GS_BmpCompression::runs4) {}

    bool read() {
        fillWithFirstColor();
        for (;;) {
            const int length = next();
            const int value = next();
            if (value < 0) {
                return isComplete();
            }
            if (length == 0 && value == endOfImage) {
                return true;
            }
            const bool isTaken = length == 0 ? takeEscape(value) : takeRun(length, value);
            if (!isTaken) {
                return false;
            }
        }
    }

private:
    /// Some programs end the file with the last row instead of the mark.
    bool isComplete() const {
        return y >= bitmap.rows || (y == bitmap.rows - 1 && x >= bitmap.columns);
    }

    int next() {
        if (index == count) {
            count = input.read(block.data(), block.size());
            index = 0;
        }
        return index < count ? block[index++] : -1;
    }

    bool takeEscape(int value) {
        if (value == endOfLine) {
            x = 0;
            return ++y <= bitmap.rows;
        }
        return value == jump ? takeJump() : takePixels(value);
    }

    bool takeJump() {
        const int right = next();
        const int up = next();
        x += std::max(right, 0);
        y += std::max(up, 0);
        return up >= 0 && x < bitmap.columns && y < bitmap.rows;
    }

    bool takeRun(int length, int value) {
        for (int i = 0; i < length; ++i) {
            put(isHalf ? half(value, i) : value);
        }
        return y < bitmap.rows;
    }

    /// Takes `length` pixels as they are, padded to two bytes.
    bool takePixels(int length) {
        const int bytes = isHalf ? (length + 1) / 2 : length;
        int value = 0;
        for (int i = 0; i < length; ++i) {
            const bool isNew = !isHalf || i % 2 == 0;
            value = isNew ? next() : value;
            if (value < 0) {
                return false;
            }
            put(isHalf ? half(value, i) : value);
        }
        return y < bitmap.rows && (bytes % 2 == 0 || next() >= 0);
    }

    static int half(int value, int i) { return i % 2 == 0 ? value >> 4 : value & 0xF; }

    /// Sets a pixel; rows come from the bottom.
    /// On purpose: what lies beyond the end of a row is dropped. Some programs encode rows with the
    /// padding that rows without runs have.
    void put(int value) {
        if (x < bitmap.columns && y < bitmap.rows) {
            const std::ptrdiff_t offset = std::ptrdiff_t{x} * bitmap.channels;
            setColor(bitmap.getRow(bitmap.rows - 1 - y) + offset, value);
            ++x;
        }
    }

    void setColor(std::uint8_t* pixel, int value) const {
        const std::uint8_t* entry = header.palette.data() + std::ptrdiff_t{value} * 4;
        pixel[0] = entry[2];
        pixel[1] = entry[1];
        pixel[2] = entry[0];
    }

    void fillWithFirstColor() {
        for (int row = 0; row < bitmap.rows; ++row) {
            std::uint8_t* pixel = bitmap.getRow(row);
            for (int i = 0; i < bitmap.columns; ++i, pixel += bitmap.channels) {
                setColor(pixel, 0);
            }
        }
    }

    GS_Input& input;
    const GS_BmpHeader& header;
    GS_Bitmap& bitmap;
    std::vector<std::uint8_t> block;
    std::size_t index = 0;
    std::size_t count = 0;
    bool isHalf; // two pixels a byte
    int x = 0;
    int y = 0; // from the bottom
};

} // namespace

bool readBmpRuns(GS_Input& input, const GS_BmpHeader& header, GS_Bitmap& bitmap) {
    return input.seek(header.pixelOffset) && RunReader(input, header, bitmap).read();
}

} // namespace MoxGraphicService_NS
