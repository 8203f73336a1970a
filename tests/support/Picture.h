/// Pictures of documents, for comparing what a viewer shows.
#pragma once

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include <cairo.h>

namespace DrawmereTest {

/// A part of a picture, in pixels.
struct PixelBox {
    int x;
    int y;
    int width;
    int height;
};

/// The pixels that a renderer made of a document, on white.
class Picture {
public:
    /// Draws the document `svg`, complete with its root, at one pixel a point.
    /// Throws: std::runtime_error when the renderer finds fault with it.
    explicit Picture(const std::string& svg);

    /// Takes the pixels of an image surface that nothing can be seen through.
    /// Borrows: `surface`, for the call.
    explicit Picture(cairo_surface_t* surface);

    /// Returns: whether a viewer sees the same in both. Rounding in the last bit of a matrix may
    /// move an edge over one of the rows in which the renderer samples a pixel; all else counts.
    testing::AssertionResult looksLike(const Picture& other) const;

    /// Returns: the count of pixels that are not white.
    int countInk() const;

    /// Returns: the part of the pixels of `box`, which lies in both, in which some channel differs
    /// by more than `tolerance`.
    double differenceShare(const Picture& other, const PixelBox& box, int tolerance) const;

private:
    void readPixels(cairo_surface_t* surface);

    static constexpr std::uint32_t white = 0xFFFFFFFF;

    int width = 0;
    int height = 0;
    std::vector<std::uint32_t> pixels; // 0xAARRGGBB, row by row
};

} // namespace DrawmereTest
