#include "tests/support/TinyImages.h"

#include <cstddef>

#include <zlib.h>

namespace DrawmereTest {
namespace {

void appendBig(std::string& bytes, unsigned long number) {
    for (int shift = 24; shift >= 0; shift -= 8) {
        bytes += static_cast<char>(number >> static_cast<unsigned int>(shift) & 0xFFU);
    }
}

void appendLittle(std::string& bytes, unsigned long number, int size) {
    for (int i = 0; i < size; ++i) {
        bytes += static_cast<char>(number >> static_cast<unsigned int>(8 * i) & 0xFFU);
    }
}

void appendChunk(std::string& file, const std::string& name, const std::string& content) {
    const std::string body = name + content;
    appendBig(file, content.size());
    file += body;
    appendBig(file, crc32(0, reinterpret_cast<const Bytef*>(body.data()),
                          static_cast<uInt>(body.size())));
}

std::string deflate(const std::string& bytes) {
    uLongf size = compressBound(bytes.size());
    std::string packed(size, '\0');
    compress(reinterpret_cast<Bytef*>(packed.data()), &size,
             reinterpret_cast<const Bytef*>(bytes.data()), bytes.size());
    packed.resize(size);
    return packed;
}

char shade(int part, int whole) { return static_cast<char>(255 * part / whole); }

} // namespace

std::string makePng(int width, int height, bool hasAlpha) {
    std::string rows;
    for (int y = 0; y < height; ++y) {
        rows += '\0'; // no filter
        for (int x = 0; x < width; ++x) {
            rows += {shade(x, width), shade(y, height), shade(x + y, width + height)};
            rows += hasAlpha ? std::string(1, shade(x, width)) : std::string();
        }
    }
    std::string header;
    appendBig(header, width);
    appendBig(header, height);
    header += {8, static_cast<char>(hasAlpha ? 6 : 2), 0, 0, 0};
    std::string file = "\x89PNG\r\n\x1A\n";
    appendChunk(file, "IHDR", header);
    appendChunk(file, "IDAT", deflate(rows));
    appendChunk(file, "IEND", "");
    return file;
}

std::string makeBmp(int width, int height) {
    const std::size_t rowSize = (static_cast<std::size_t>(width) * 3 + 3) / 4 * 4;
    const std::size_t pixels = rowSize * height;
    std::string file = "BM";
    appendLittle(file, 54 + pixels, 4);
    appendLittle(file, 0, 4);
    appendLittle(file, 54, 4); // where the pixels begin
    appendLittle(file, 40, 4); // the size of what follows
    appendLittle(file, width, 4);
    appendLittle(file, height, 4);
    appendLittle(file, 1, 2);  // planes
    appendLittle(file, 24, 2); // bits a pixel
    appendLittle(file, 0, 4);  // no compression
    appendLittle(file, pixels, 4);
    file.append(16, '\0');
    for (int y = 0; y < height; ++y) {
        file.append(rowSize, y * 2 < height ? '\x20' : '\xE0');
    }
    return file;
}

} // namespace DrawmereTest
