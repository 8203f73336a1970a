/// The inner loop of base64: whole lines, by the fastest instructions that the machine has.
#pragma once

#include <cstddef>
#include <span>

namespace DrawmereNS {

/// Encodes whole lines: 57 bytes become 76 characters and a line feed. All variants write the same.
class SVGBase64Lines {
public:
    static constexpr std::size_t lineBytes = 57;
    static constexpr std::size_t lineCharacters = 76;
    static constexpr std::size_t lineSize = lineCharacters + 1; ///< with its line feed

    /// Shape: `in[lines * lineBytes]`, `out[lines * lineSize]`; neither is touched beyond that.
    using Encoder = void (*)(const char* in, std::size_t lines, char* out);

    struct Variant {
        const char* name;
        Encoder encode;
        bool (*isSupported)(); ///< whether this machine can run it
    };

    SVGBase64Lines() = delete;

    /// Returns: all that were compiled, the fastest first; the last one runs everywhere.
    static std::span<const Variant> getVariants();

    /// Encodes by the first variant that the machine supports.
    static void encode(const char* in, std::size_t lines, char* out);
};

} // namespace DrawmereNS
