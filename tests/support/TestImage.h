/// Images for the tests of the graphic service.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_Crc32.h"
#include "foundation/graphicservice/GS_Format.h"
#include "foundation/graphicservice/GS_Graphic.h"
#include "foundation/graphicservice/GS_Output.h"
#include "foundation/graphicservice/GS_WriteOptions.h"

#include <algorithm>
#include <cstdint>
#include <fstream>
#include <initializer_list>
#include <iterator>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

namespace DrawmereTest {

/// Returns: the bytes of tests/data/images/<name>.
inline std::string readTestImage(const std::string& name) {
    std::ifstream file(std::string(TEST_SOURCE_DIR) + "/data/images/" + name, std::ios::binary);
    if (!file) {
        throw std::runtime_error("no image " + name);
    }
    return std::string(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
}

/// The pixels of a file, with what its header tells.
struct DecodedImage {
    MoxGraphicService_NS::GS_ImageInfo info;
    MoxGraphicService_NS::GS_Bitmap bitmap;
    bool hasInfo = false;
    bool hasPixels = false;
};

/// Decodes a file of any form, at `columns` by `rows` or the next size that is easy to decode.
inline DecodedImage decodeImage(const std::string& bytes, int columns = 1 << 24,
                                int rows = 1 << 24) {
    DecodedImage image;
    std::istringstream stream(bytes);
    MoxGraphicService_NS::GS_Input input(stream);
    const MoxGraphicService_NS::GS_Format* format = MoxGraphicService_NS::findFormat(bytes);
    image.hasInfo = format && format->readInfo(input, image.info);
    image.hasPixels = image.hasInfo && format->readPixels(input, image.info,
                                                          {std::min(columns, image.info.columns),
                                                           std::min(rows, image.info.rows)},
                                                          image.bitmap);
    return image;
}

/// Returns: the bytes of all pixels.
inline std::vector<int> listPixels(const MoxGraphicService_NS::GS_Bitmap& bitmap) {
    const std::uint8_t* first = bitmap.pixels.get();
    return std::vector<int>(first,
                            first + bitmap.getRowSize() * static_cast<std::size_t>(bitmap.rows));
}

/// Makes a bitmap of these bytes.
inline MoxGraphicService_NS::GS_Bitmap makeBitmap(int columns, int rows, int channels,
                                                  const std::vector<int>& bytes) {
    MoxGraphicService_NS::GS_Bitmap bitmap;
    if (!bitmap.allocate(columns, rows, channels)) {
        throw std::runtime_error("no memory");
    }
    std::ranges::transform(bytes, bitmap.pixels.get(),
                           [](int byte) { return static_cast<std::uint8_t>(byte); });
    return bitmap;
}

/// Returns: a checksum of all pixels.
inline std::uint32_t sumPixels(const MoxGraphicService_NS::GS_Bitmap& bitmap) {
    MoxGraphicService_NS::GS_Crc32 checksum;
    checksum.add(bitmap.pixels.get(), bitmap.getRowSize() * static_cast<std::size_t>(bitmap.rows));
    return checksum.getValue();
}

/// Returns: these numbers as bytes.
inline std::string bytesOf(std::initializer_list<int> numbers) {
    std::string bytes;
    for (const int number : numbers) {
        bytes += static_cast<char>(number);
    }
    return bytes;
}

/// Returns: `count` bytes of `value`, the low one first.
inline std::string little(std::uint64_t value, int count) {
    std::string bytes;
    for (int i = 0; i < count; ++i) {
        bytes += static_cast<char>(value >> i * 8);
    }
    return bytes;
}

/// Returns: `count` bytes of `value`, the high one first.
inline std::string big(std::uint64_t value, int count) {
    const std::string bytes = little(value, count);
    return std::string(bytes.rbegin(), bytes.rend());
}

/// Returns: a PNG chunk with its checksum.
inline std::string pngChunk(const std::string& name, const std::string& body) {
    MoxGraphicService_NS::GS_Crc32 checksum;
    const std::string sum = name + body;
    const std::vector<std::uint8_t> summed(sum.begin(), sum.end());
    checksum.add(summed.data(), summed.size());
    return big(static_cast<std::uint32_t>(body.size()), 4) + sum + big(checksum.getValue(), 4);
}

/// Returns: `file`, a PNG file, with `chunk` behind its header.
inline std::string insertPngChunk(std::string file, const std::string& chunk) {
    constexpr std::size_t headerEnd = 33;
    return file.insert(headerEnd, chunk);
}

constexpr std::uint32_t testProfileSize = 344;

/// Returns: an ICC profile with nothing in it, of the colours `space`, "RGB " or "GRAY" or "CMYK".
inline std::string makeProfile(const std::string& space) {
    std::string profile(testProfileSize, '\0');
    profile.replace(0, 4, big(testProfileSize, 4));
    profile.replace(8, 4, big(0x02400000, 4));
    profile.replace(12, 4, "mntr");
    profile.replace(16, 4, space);
    profile.replace(20, 4, "XYZ ");
    profile.replace(36, 4, "acsp");
    profile.replace(68, 12, big(0xF6D6, 4) + big(0x10000, 4) + big(0xD32D, 4));
    profile.replace(128, 16, big(1, 4) + "desc" + big(144, 4) + big(200, 4));
    for (std::size_t i = 144; i < profile.size(); ++i) {
        profile[i] = static_cast<char>(i * i); // libpng refuses a profile that is very short
    }
    return profile;
}

/// Returns: a BMP file of Windows with a palette of `palette` and pixels as given.
inline std::string makeBmp(int columns, int rows, int depth, int compression,
                           const std::string& palette, const std::string& pixels) {
    constexpr std::uint32_t headSize = 54;
    const auto offset = headSize + static_cast<std::uint32_t>(palette.size());
    return "BM" + little(offset + static_cast<std::uint32_t>(pixels.size()), 4) + little(0, 4) +
           little(offset, 4) + little(40, 4) + little(static_cast<std::uint32_t>(columns), 4) +
           little(static_cast<std::uint32_t>(rows), 4) + little(1, 2) +
           little(static_cast<std::uint32_t>(depth), 2) +
           little(static_cast<std::uint32_t>(compression), 4) + little(0, 4) + little(3937, 4) +
           little(3937, 4) + little(0, 8) + palette + pixels;
}

/// Returns: `bitmap` as a file of the writer.
template <typename Writer>
std::string writeImage(Writer writer, const MoxGraphicService_NS::GS_Bitmap& bitmap,
                       const MoxGraphicService_NS::GS_WriteOptions& options) {
    std::ostringstream stream;
    MoxGraphicService_NS::GS_Output output(stream);
    return writer(bitmap, options, output) ? stream.str() : std::string();
}

} // namespace DrawmereTest
