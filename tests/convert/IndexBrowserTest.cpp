// The index page in a browser.
#include "tests/convert/Conversion.h"

#include <cstdint>
#include <memory>

#include <cairo.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

/// Returns: how many pixels of the picture are dark in the part where pages are shown.
int countInk(const std::string& path) {
    constexpr int outlineWidth = 310;
    constexpr int headerHeight = 50;
    constexpr std::uint32_t dark = 0x40;
    const std::unique_ptr<cairo_surface_t, decltype(&cairo_surface_destroy)> picture(
        cairo_image_surface_create_from_png(path.c_str()), &cairo_surface_destroy);
    cairo_surface_flush(picture.get());
    const unsigned char* const bytes = cairo_image_surface_get_data(picture.get());
    const int stride = cairo_image_surface_get_stride(picture.get());
    int count = 0;
    for (int y = headerHeight; bytes && y < cairo_image_surface_get_height(picture.get()); ++y) {
        const void* const row = bytes + static_cast<std::ptrdiff_t>(y) * stride;
        const auto* const line = static_cast<const std::uint32_t*>(row);
        for (int x = outlineWidth; x < cairo_image_surface_get_width(picture.get()); ++x) {
            count += (line[x] & 0xFFU) < dark ? 1 : 0;
        }
    }
    return count;
}

TEST(IndexBrowser, AReaderWalksThroughThePages) {
    const Conversion conversion;
    ASSERT_EQ(conversion.run({Conversion::document("pdflatex-outline.pdf"), "-o", "./"}).status, 0);
    const std::string picture = conversion.directory.path("window.png");
    const CommandResult result = runCommand({TEST_SOURCE_DIR "/convert/browse-index",
                                             conversion.directory.path("index.html"), picture});
    // Each line: what was done, then the page at the top, the fragment, the size, the outline.
    // The page is wider than its place, so all of its width is shown at first.
    EXPECT_EQ(result.output, "open 1 - 82 % outline\n"
                             "pages 4\n"
                             "read pdflatex-outline1.svg pdflatex-outline2.svg\n"
                             "right 2 - 82 % outline\n"
                             "right 3 - 82 % outline\n"
                             "left 2 - 82 % outline\n"
                             "+ 2 - 98 % outline\n"
                             "+ 2 - 118 % outline\n"
                             "- 2 - 98 % outline\n"
                             "0 2 - 100 % outline\n"
                             "o 2 - 100 % -\n"
                             "o 2 - 100 % outline\n"
                             "#next 3 - 100 % outline\n"
                             "#previous 2 - 100 % outline\n"
                             "#larger 2 - 120 % outline\n"
                             "#fit 2 - 82 % outline\n"
                             "#zoom 2 - 100 % outline\n"
                             "nav li:last-child a 4 #p4 100 % outline\n"
                             "section:nth-of-type(1) a 2 #p2.dest-2-125-126 100 % outline\n"
                             "#print 4\n" // pages that are there when the printer is asked for
                             "narrow 1 - 59 % -\n"
                             "o 1 - 59 % outline\n"
                             "nav li:last-child a 4 #p4 59 % -\n");
    EXPECT_GT(countInk(picture), 5000);
}

} // namespace
} // namespace DrawmereTest
