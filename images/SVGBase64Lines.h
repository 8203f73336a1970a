/// The inner loop of base64, by the fastest instructions that the machine has.
#pragma once

#include <cstddef>
#include <span>
#include <string_view>

namespace DrawmereNS {

/// Encodes lines: 57 bytes become 76 characters and a line end. All variants write the same.
class SVGBase64Lines {
public:
    static constexpr std::size_t lineBytes = 57;
    static constexpr std::size_t lineCharacters = 76;
    static constexpr std::size_t lineSize = lineCharacters + 1; ///< with a line feed

    /// Writes whole lines `distance` characters from each other, and nothing between them.
    /// Shape: `in[lines * lineBytes]`, `out[lines * distance]`; neither is touched beyond that.
    using Encoder = void (*)(const char* in, std::size_t lines, char* out, std::size_t distance);

    struct Variant {
        const char* name;
        Encoder encode;
        bool (*isSupported)(); ///< whether this machine can run it
    };

    SVGBase64Lines() = delete;

    /// Returns: all that were compiled, the fastest first; the last one runs everywhere.
    static std::span<const Variant> getVariants();

    /// Encodes whole lines by the first variant that the machine supports, each with `lineEnd`
    /// behind it.
    static void encode(const char* in, std::size_t lines, char* out,
                       std::string_view lineEnd = "\n");

    /// Encodes `size` bytes; a last line with fewer than 57 gets no line end.
    /// Returns: the end of the text, behind which nothing is touched.
    static char* encodeText(const char* in, std::size_t size, char* out,
                            std::string_view lineEnd = "\n");

    /// Returns: the length of the text of `bytes` bytes, with its line feeds.
    static std::size_t countText(std::size_t bytes);
};

} // namespace DrawmereNS
