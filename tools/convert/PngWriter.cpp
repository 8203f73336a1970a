#include "tools/convert/PngWriter.h"

#include <cstdlib>
#include <cstring>
#include <string_view>

#include <zlib.h>

namespace DrawmereConvert {
namespace {

using Bytes = std::vector<unsigned char>;

constexpr std::string_view signature = "\x89PNG\r\n\x1a\n";

int countSamples(PNGCOLORS colors) {
    return colors == PNGCOLORS_RGB ? 3 : colors == PNGCOLORS_RGBA ? 4 : 1;
}

void appendNumber(std::string& file, std::uint32_t number) {
    for (int shift = 24; shift >= 0; shift -= 8) {
        file.push_back(static_cast<char>(number >> shift & 0xFFU));
    }
}

void appendChunk(std::string& file, std::string_view type, std::string_view data) {
    appendNumber(file, static_cast<std::uint32_t>(data.size()));
    const std::size_t start = file.size();
    file += type;
    file += data;
    const auto* bytes = reinterpret_cast<const Bytef*>(file.data() + start);
    appendNumber(file, static_cast<std::uint32_t>(crc32_z(0, bytes, file.size() - start)));
}

void appendHeaders(std::string& file, const PngHeader& header) {
    std::string fields;
    appendNumber(fields, header.width);
    appendNumber(fields, header.height);
    fields.push_back(static_cast<char>(header.depth));
    fields.push_back(static_cast<char>(header.colors));
    fields.append(3, '\0'); // the only methods there are, and no interlacing
    appendChunk(file, "IHDR", fields);
    if (!header.palette.empty()) {
        appendChunk(file, "PLTE", header.palette);
    }
    if (!header.alphas.empty()) {
        appendChunk(file, "tRNS", header.alphas);
    }
}

unsigned char predict(int left, int above, int aboveLeft) {
    const int guess = left + above - aboveLeft;
    const int toLeft = std::abs(guess - left);
    const int toAbove = std::abs(guess - above);
    const int toCorner = std::abs(guess - aboveLeft);
    const int nearest = toLeft <= toAbove && toLeft <= toCorner ? left
                        : toAbove <= toCorner                   ? above
                                                                : aboveLeft;
    return static_cast<unsigned char>(nearest);
}

/// Filters by the guess from three neighbours, the best single choice for what is not flat.
void appendFilteredRow(Bytes& out, const unsigned char* row, const unsigned char* above,
                       std::size_t rowBytes, std::size_t step) {
    out.push_back(4);
    for (std::size_t i = 0; i < rowBytes; ++i) {
        const int left = i < step ? 0 : row[i - step];
        const int up = above ? above[i] : 0;
        const int corner = above && i >= step ? above[i - step] : 0;
        out.push_back(static_cast<unsigned char>(row[i] - predict(left, up, corner)));
    }
}

Bytes filterRows(const PngHeader& header, const unsigned char* rows, std::size_t rowBytes) {
    const bool isFlat = header.colors == PNGCOLORS_PALETTE || header.depth < 8;
    const auto step = static_cast<std::size_t>(countSamples(header.colors));
    Bytes filtered;
    filtered.reserve((rowBytes + 1) * header.height);
    const unsigned char* above = nullptr;
    for (std::uint32_t y = 0; y < header.height; ++y, above = rows, rows += rowBytes) {
        if (isFlat) {
            filtered.push_back(0);
            filtered.insert(filtered.end(), rows, rows + rowBytes);
        } else {
            appendFilteredRow(filtered, rows, above, rowBytes, step);
        }
    }
    return filtered;
}

} // namespace

std::string writePng(const PngHeader& header, const unsigned char* rows, std::size_t rowBytes) {
    const Bytes filtered = filterRows(header, rows, rowBytes);
    uLongf size = compressBound(filtered.size());
    Bytes packed(size);
    if (compress2(packed.data(), &size, filtered.data(), filtered.size(), Z_DEFAULT_COMPRESSION) !=
        Z_OK) {
        return {};
    }
    return wrapPng(header, packed.data(), size);
}

std::string wrapPng(const PngHeader& header, const unsigned char* data, std::size_t size) {
    std::string file(signature);
    appendHeaders(file, header);
    appendChunk(file, "IDAT", {reinterpret_cast<const char*>(data), size});
    appendChunk(file, "IEND", {});
    return file;
}

} // namespace DrawmereConvert
