#include "tests/support/Picture.h"

#include "tests/support/Command.h"
#include "tests/support/TempDir.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <stdexcept>

#include <cairo.h>

namespace DrawmereTest {
namespace {

struct SurfaceDeleter {
    void operator()(cairo_surface_t* surface) const { cairo_surface_destroy(surface); }
};

using Surface = std::unique_ptr<cairo_surface_t, SurfaceDeleter>;

constexpr unsigned int channelBits = 8;
constexpr unsigned int channelMask = 0xFF;

/// One of the fifteen rows in which the renderer samples a pixel.
constexpr int sampleStep = 17;

/// One pixel in so many may differ by a sample.
constexpr std::size_t oddPixelShare = 200;

Surface renderFile(const std::string& svg) {
    const TempDir directory;
    directory.write("page.svg", svg);
    const CommandResult result =
        runCommand({"rsvg-convert", "--format", "png", "--unlimited", "--background-color", "white",
                    "--dpi-x", "72", "--dpi-y", "72", "--output", directory.path("page.png"),
                    directory.path("page.svg")});
    if (result.status != 0) {
        throw std::runtime_error("rsvg-convert: " + result.output);
    }
    Surface surface(cairo_image_surface_create_from_png(directory.path("page.png").c_str()));
    if (cairo_surface_status(surface.get()) != CAIRO_STATUS_SUCCESS) {
        throw std::runtime_error("no picture was made");
    }
    return surface;
}

int channelDifference(std::uint32_t one, std::uint32_t other) {
    int largest = 0;
    for (unsigned int shift = 0; shift < 32; shift += channelBits) {
        const auto first = static_cast<int>(one >> shift & channelMask);
        const auto second = static_cast<int>(other >> shift & channelMask);
        largest = std::max(largest, std::abs(first - second));
    }
    return largest;
}

} // namespace

Picture::Picture(const std::string& svg) { readPixels(renderFile(svg).get()); }

Picture::Picture(cairo_surface_t* surface) { readPixels(surface); }

void Picture::readPixels(cairo_surface_t* surface) {
    width = cairo_image_surface_get_width(surface);
    height = cairo_image_surface_get_height(surface);
    const int stride = cairo_image_surface_get_stride(surface);
    const unsigned char* rows = cairo_image_surface_get_data(surface);
    pixels.resize(static_cast<std::size_t>(width) * static_cast<std::size_t>(height));
    for (int row = 0; row < height; ++row) {
        std::memcpy(pixels.data() + static_cast<std::size_t>(row) * static_cast<std::size_t>(width),
                    rows + static_cast<std::ptrdiff_t>(row) * stride,
                    static_cast<std::size_t>(width) * sizeof(std::uint32_t));
    }
    const std::uint32_t opaque = channelMask << 24U; // a file without alpha leaves that byte open
    for (std::uint32_t& pixel : pixels) {
        pixel |= opaque;
    }
}

testing::AssertionResult Picture::looksLike(const Picture& other) const {
    if (width != other.width || height != other.height) {
        return testing::AssertionFailure() << "the sizes differ";
    }
    std::size_t oddPixels = 0;
    for (std::size_t i = 0; i < pixels.size(); ++i) {
        const int difference = channelDifference(pixels[i], other.pixels[i]);
        oddPixels += difference != 0 ? 1 : 0;
        if (difference > sampleStep || oddPixels * oddPixelShare > pixels.size()) {
            const auto row = static_cast<std::size_t>(width);
            return testing::AssertionFailure()
                   << "they differ by " << difference << " at " << i % row << ", " << i / row;
        }
    }
    return testing::AssertionSuccess();
}

int Picture::countInk() const {
    return static_cast<int>(std::count_if(pixels.begin(), pixels.end(),
                                          [](std::uint32_t pixel) { return pixel != white; }));
}

double Picture::differenceShare(const Picture& other, const PixelBox& box, int tolerance) const {
    int count = 0;
    for (int y = box.y; y < box.y + box.height; ++y) {
        for (int x = box.x; x < box.x + box.width; ++x) {
            const auto one = static_cast<std::size_t>(y) * static_cast<std::size_t>(width);
            const auto two = static_cast<std::size_t>(y) * static_cast<std::size_t>(other.width);
            const auto column = static_cast<std::size_t>(x);
            const int difference =
                channelDifference(pixels.at(one + column), other.pixels.at(two + column));
            count += difference > tolerance ? 1 : 0;
        }
    }
    return static_cast<double>(count) / (box.width * box.height);
}

} // namespace DrawmereTest
