/// A set of code points.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

namespace DrawmereNS {

/// Remembers the characters that a font has dealt with: a bit for each, in pages of neighbours, as
/// texts keep to a few alphabets. It is asked for every character that is drawn.
class SVGCodePointSet {
public:
    /// Returns: whether `codePoint`, any number up to U+10FFFF, is there.
    bool contains(std::uint32_t codePoint) const {
        const std::size_t place = codePoint >> pageBits;
        return place < pageNumbers.size() &&
               (pages[pageNumbers[place]] >> (codePoint & pageMask) & 1) != 0;
    }

    /// Returns: the place of the first unit of `text` from `place` on that is not there, taken as
    /// a character by itself; the end of the text when there is none.
    std::size_t skipKnown(std::u16string_view text, std::size_t place) const {
        const std::uint16_t* const numbers = pageNumbers.data();
        const std::uint64_t* const known = pages.data();
        const std::size_t reach = pageNumbers.size() << pageBits;
        while (place < text.size() && text[place] < reach &&
               (known[numbers[text[place] >> pageBits]] >> (text[place] & pageMask) & 1) != 0) {
            ++place;
        }
        return place;
    }

    /// Adds `codePoint`.
    void insert(std::uint32_t codePoint);

    /// Forgets all.
    void clear();

private:
    static constexpr std::uint32_t pageBits = 6;
    static constexpr std::uint32_t pageMask = (1U << pageBits) - 1;

    std::vector<std::uint16_t> pageNumbers; // by the leading bits of a code point
    std::vector<std::uint64_t> pages;       // the first one is that of all that has none, and empty
};

} // namespace DrawmereNS
