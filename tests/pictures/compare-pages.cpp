// compare-pages [-d DIRECTORY] [-a SCALE] EXPECTED.png PAGE.png...: for each pair prints a line
// with the share of pixels that differ visibly, in percent. Pictures are blurred by one pixel
// before, so that what renderers make of an edge doesn't count. With -d, pictures of both beside
// each other and of the difference go to the directory, named like the page. With -a the pictures
// are SCALE times as large as they are to be, and each square of that many pixels becomes their
// average.

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <filesystem>
#include <iterator>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include <cairo.h>

namespace {

constexpr int visible = 32; // of 255, in the channel that differs most
constexpr int channelCount = 3;
constexpr std::uint32_t white = 0xFFFFFF;

struct SurfaceDeleter {
    void operator()(cairo_surface_t* surface) const { cairo_surface_destroy(surface); }
};

using Surface = std::unique_ptr<cairo_surface_t, SurfaceDeleter>;

/// A picture on white, whatever lies outside of it white, too.
struct Pixels {
    int width = 0;
    int height = 0;
    std::vector<std::uint32_t> values; // 0x00RRGGBB

    std::uint32_t at(int x, int y) const {
        const bool isInside = x >= 0 && y >= 0 && x < width && y < height;
        return isInside ? values[static_cast<std::size_t>(y) * width + x] : white;
    }
};

int channel(std::uint32_t pixel, int index) {
    constexpr unsigned int bits = 8;
    return static_cast<int>(pixel >> (bits * static_cast<unsigned int>(index)) & 0xFFU);
}

std::uint32_t onWhite(std::uint32_t pixel) { // the channels carry their share of alpha already
    const auto rest = 255 - (pixel >> 24U);
    return (pixel & white) + rest * 0x010101U;
}

Pixels readPixels(const char* path) {
    const Surface file(cairo_image_surface_create_from_png(path));
    if (cairo_surface_status(file.get()) != CAIRO_STATUS_SUCCESS) {
        throw std::runtime_error(std::string(path) + ": no picture");
    }
    Pixels pixels;
    pixels.width = cairo_image_surface_get_width(file.get());
    pixels.height = cairo_image_surface_get_height(file.get());
    const Surface image(
        cairo_image_surface_create(CAIRO_FORMAT_ARGB32, pixels.width, pixels.height));
    const std::unique_ptr<cairo_t, decltype(&cairo_destroy)> context(cairo_create(image.get()),
                                                                     &cairo_destroy);
    cairo_set_source_surface(context.get(), file.get(), 0, 0);
    cairo_paint(context.get());
    cairo_surface_flush(image.get());
    const auto* const bytes = cairo_image_surface_get_data(image.get());
    const int stride = cairo_image_surface_get_stride(image.get());
    for (int y = 0; y < pixels.height; ++y) {
        const void* const row = bytes + static_cast<std::ptrdiff_t>(y) * stride;
        const auto* const line = static_cast<const std::uint32_t*>(row);
        std::transform(line, line + pixels.width, std::back_inserter(pixels.values), onWhite);
    }
    return pixels;
}

std::uint32_t average(const Pixels& pixels, int left, int top, int scale) {
    std::array<int, channelCount> sum{};
    for (int y = top; y < top + scale; ++y) {
        for (int x = left; x < left + scale; ++x) {
            const std::uint32_t pixel = pixels.at(x, y);
            for (int i = 0; i < channelCount; ++i) {
                sum[static_cast<std::size_t>(i)] += channel(pixel, i);
            }
        }
    }
    const int count = scale * scale;
    const auto part = [&](int value) {
        return static_cast<std::uint32_t>((value + count / 2) / count);
    };
    return part(sum[0]) | part(sum[1]) << 8U | part(sum[2]) << 16U;
}

Pixels shrink(Pixels pixels, int scale) {
    if (scale == 1) {
        return pixels;
    }
    Pixels result;
    result.width = (pixels.width + scale / 2) / scale;
    result.height = (pixels.height + scale / 2) / scale;
    for (int y = 0; y < result.height; ++y) {
        for (int x = 0; x < result.width; ++x) {
            result.values.push_back(average(pixels, x * scale, y * scale, scale));
        }
    }
    return result;
}

using Color = std::array<int, channelCount>;

using Colors = std::vector<Color>;

Color getColor(std::uint32_t pixel) {
    return {channel(pixel, 0), channel(pixel, 1), channel(pixel, 2)};
}

void add(Color& sum, const Color& color) {
    for (std::size_t i = 0; i < sum.size(); ++i) {
        sum[i] += color[i];
    }
}

/// Returns: for each pixel the sum of it and its neighbours in the row.
Colors sumRows(const Pixels& pixels, int width, int height) {
    Colors sums;
    sums.reserve(static_cast<std::size_t>(width) * height);
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            Color sum = getColor(pixels.at(x, y));
            add(sum, getColor(pixels.at(x - 1, y)));
            add(sum, getColor(pixels.at(x + 1, y)));
            sums.push_back(sum);
        }
    }
    return sums;
}

/// Returns: for each pixel the mean of it and its neighbours, times nine.
Colors blur(const Pixels& pixels, int width, int height) {
    const Colors rows = sumRows(pixels, width, height);
    const Color edge = {3 * 255, 3 * 255, 3 * 255};
    Colors sums = rows;
    for (std::size_t i = 0; i < sums.size(); ++i) {
        const std::size_t below = i + static_cast<std::size_t>(width);
        add(sums[i], i >= static_cast<std::size_t>(width) ? rows[i - width] : edge);
        add(sums[i], below < rows.size() ? rows[below] : edge);
    }
    return sums;
}

/// Returns: whether a viewer sees a difference between these colours, times nine.
bool differs(const Color& one, const Color& other) {
    constexpr int neighbours = 9;
    int largest = 0;
    for (std::size_t i = 0; i < one.size(); ++i) {
        largest = std::max(largest, std::abs(one[i] - other[i]));
    }
    return largest > visible * neighbours;
}

struct Comparison {
    int width = 0;
    int height = 0;
    std::vector<bool> isDifferent;

    double percent() const {
        const auto count = std::count(isDifferent.begin(), isDifferent.end(), true);
        return isDifferent.empty()
                   ? 100.0
                   : 100.0 * static_cast<double>(count) / static_cast<double>(isDifferent.size());
    }
};

// Renderers round the size of a page up or down, so the last row or column of one may be missing.
int commonExtent(int one, int other) {
    return std::abs(one - other) <= 1 ? std::min(one, other) : std::max(one, other);
}

Comparison compare(const Pixels& expected, const Pixels& page) {
    Comparison result;
    result.width = commonExtent(expected.width, page.width);
    result.height = commonExtent(expected.height, page.height);
    const Colors first = blur(expected, result.width, result.height);
    const Colors second = blur(page, result.width, result.height);
    for (int y = 0; y < result.height; ++y) {
        for (int x = 0; x < result.width; ++x) {
            const std::size_t index = static_cast<std::size_t>(y) * result.width + x;
            const bool isOutside = x >= std::min(expected.width, page.width) ||
                                   y >= std::min(expected.height, page.height);
            result.isDifferent.push_back(isOutside || differs(first[index], second[index]));
        }
    }
    return result;
}

/// Writes the expected picture, the page and their difference beside each other.
void writeTriple(const Pixels& expected, const Pixels& page, const Comparison& result,
                 const std::string& path) {
    const Surface image(
        cairo_image_surface_create(CAIRO_FORMAT_RGB24, channelCount * result.width, result.height));
    cairo_surface_flush(image.get());
    auto* const bytes = cairo_image_surface_get_data(image.get());
    const int stride = cairo_image_surface_get_stride(image.get());
    for (int y = 0; y < result.height; ++y) {
        void* const row = bytes + static_cast<std::ptrdiff_t>(y) * stride;
        auto* const line = static_cast<std::uint32_t*>(row);
        for (int x = 0; x < result.width; ++x) {
            const std::size_t index = static_cast<std::size_t>(y) * result.width + x;
            line[x] = expected.at(x, y);
            line[result.width + x] = page.at(x, y);
            line[2 * result.width + x] = result.isDifferent[index] ? 0xC00000U : white;
        }
    }
    cairo_surface_mark_dirty(image.get());
    cairo_surface_write_to_png(image.get(), path.c_str());
}

struct Options {
    std::string directory; ///< of pictures of the differences, if any
    int scale = 1;         ///< of the pictures
};

/// Takes the options off of the front of `files`.
Options takeOptions(std::vector<const char*>& files) {
    Options options;
    while (files.size() > 1 && files.front()[0] == '-') {
        if (std::string(files.front()) == "-d") {
            options.directory = files[1];
        } else {
            options.scale = std::max(1, std::atoi(files[1]));
        }
        files.erase(files.begin(), files.begin() + 2);
    }
    return options;
}

void compareFiles(const char* expectedPath, const char* pagePath, const Options& options) {
    const Pixels expected = shrink(readPixels(expectedPath), options.scale);
    const Pixels page = shrink(readPixels(pagePath), options.scale);
    const Comparison result = compare(expected, page);
    std::printf("%.3f\n", result.percent());
    if (!options.directory.empty()) {
        const std::filesystem::path name = std::filesystem::path(pagePath).filename();
        writeTriple(expected, page, result,
                    (std::filesystem::path(options.directory) / name).string());
    }
}

} // namespace

int main(int argc, char** argv) {
    std::vector<const char*> files(argv + 1, argv + argc);
    const Options options = takeOptions(files);
    int status = 0;
    for (std::size_t i = 0; i + 1 < files.size(); i += 2) {
        try {
            compareFiles(files[i], files[i + 1], options);
        } catch (const std::exception& error) {
            std::printf("100.000\n");
            std::fprintf(stderr, "compare-pages: %s\n", error.what());
            status = 1;
        }
    }
    return status;
}
