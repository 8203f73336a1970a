/// Texts that consist of numbers, two characters in a byte.
#pragma once

#include <cstddef>
#include <string_view>

namespace MoxCommonNS {

/// Packs path data, lists of numbers and the like. Sixteen characters, digits and what stands
/// between them, need half a byte each; a pair that holds any other takes three bytes. A text that
/// holds XML markup is not packed, so nobody has to look for markup in one that was.
class MoxDigitPairs {
public:
    MoxDigitPairs() = delete;

    /// Packs `text`, which is ASCII. Shape: `out[text.size()]`, of which less is used.
    /// Returns: the bytes used; 0 when they would not be a quarter fewer than those of the text, or
    /// the text holds markup (`mayBeXmlMarkup`).
    static std::size_t pack(std::string_view text, char* out);

    /// Writes `length` characters, one more when that is odd. Pieces of an even length can be
    /// unpacked one after the other. Shape: `out[length + length % 2]`.
    /// Returns: the place behind the bytes that were read.
    static const char* unpack(const char* packed, std::size_t length, char* out);
};

} // namespace MoxCommonNS
