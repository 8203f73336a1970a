#include "bench/peers/JpegPeer.h"

#include <cmath>
#include <cstdint>
#include <cstdio>
#include <memory>
#include <vector>

#include <jpeglib.h>

namespace DrawmereNS {
namespace {

constexpr int channels = 3;
constexpr int quality = 90;
constexpr unsigned fullScale = 8; // eighths

struct FileEnd {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

using File = std::unique_ptr<std::FILE, FileEnd>;

/// Sets a row of soft shapes with the noise of a sensor.
void fillRow(std::vector<JSAMPLE>& row, int y, std::uint32_t& noise) {
    constexpr double middle = 120.0;
    constexpr double height = 90.0;
    constexpr int noiseShift = 28; // leaves 0 to 15
    for (std::size_t i = 0; i < row.size(); ++i) {
        const std::size_t column = i / channels;
        const auto x = static_cast<double>(column);
        const auto channel = static_cast<double>(i % channels);
        const double wave = std::sin(x / (40.0 + channel * 9.0)) * std::cos(y / 70.0);
        noise = noise * 1664525 + 1013904223;
        row[i] = static_cast<JSAMPLE>(middle + height * wave + (noise >> noiseShift));
    }
}

void setScale(jpeg_decompress_struct& object, int columns) {
    object.scale_denom = fullScale;
    for (object.scale_num = 1; object.scale_num < fullScale; ++object.scale_num) {
        jpeg_calc_output_dimensions(&object);
        if (object.output_width >= static_cast<unsigned>(columns)) {
            return;
        }
    }
}

} // namespace

void writeJpegPhotograph(const std::string& path, int columns, int rows) {
    const File file(std::fopen(path.c_str(), "wb"));
    jpeg_error_mgr errors;
    jpeg_compress_struct object = {};
    object.err = jpeg_std_error(&errors);
    jpeg_create_compress(&object);
    jpeg_stdio_dest(&object, file.get());
    object.image_width = static_cast<JDIMENSION>(columns);
    object.image_height = static_cast<JDIMENSION>(rows);
    object.input_components = channels;
    object.in_color_space = JCS_RGB;
    jpeg_set_defaults(&object);
    jpeg_set_quality(&object, quality, TRUE);
    jpeg_start_compress(&object, TRUE);
    std::vector<JSAMPLE> row(static_cast<std::size_t>(columns) * channels);
    std::uint32_t noise = 1;
    for (int y = 0; y < rows; ++y) {
        fillRow(row, y, noise);
        JSAMPROW line = row.data();
        jpeg_write_scanlines(&object, &line, 1);
    }
    jpeg_finish_compress(&object);
    jpeg_destroy_compress(&object);
}

std::size_t decodeJpegScaled(const std::string& path, int columns) {
    const File file(std::fopen(path.c_str(), "rb"));
    jpeg_error_mgr errors;
    jpeg_decompress_struct object = {};
    object.err = jpeg_std_error(&errors);
    jpeg_create_decompress(&object);
    jpeg_stdio_src(&object, file.get());
    jpeg_read_header(&object, TRUE);
    setScale(object, columns);
    jpeg_start_decompress(&object);
    const std::size_t rowSize = std::size_t{object.output_width} * channels;
    std::vector<JSAMPLE> pixels(rowSize * object.output_height);
    while (object.output_scanline < object.output_height) {
        JSAMPROW line = pixels.data() + rowSize * object.output_scanline;
        jpeg_read_scanlines(&object, &line, 1);
    }
    jpeg_finish_decompress(&object);
    jpeg_destroy_decompress(&object);
    return pixels.size();
}

} // namespace DrawmereNS
