/// Pictures of documents, for comparing what a viewer shows.
#pragma once

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

namespace DrawmereTest {

/// The pixels that a renderer made of a document, on white.
class Picture {
public:
    /// Draws the document `svg`, complete with its root, at one pixel a point.
    /// Throws: std::runtime_error when the renderer finds fault with it.
    explicit Picture(const std::string& svg);

    /// Returns: whether a viewer sees the same in both. Rounding in the last bit of a matrix may
    /// move an edge over one of the rows in which the renderer samples a pixel; all else counts.
    testing::AssertionResult looksLike(const Picture& other) const;

    /// Returns: the count of pixels that are not white.
    int countInk() const;

private:
    static constexpr std::uint32_t white = 0xFFFFFFFF;

    int width = 0;
    int height = 0;
    std::vector<std::uint32_t> pixels; // 0xAARRGGBB, row by row
};

} // namespace DrawmereTest
