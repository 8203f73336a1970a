/// Copying a few bytes without a call.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace MoxCommonNS {

/// The most bytes that `copyFewBytes` copies.
constexpr std::size_t maxFewBytes = 16;

/// Copies up to `maxFewBytes` bytes, by two moves that may overlap.
inline void copyFewBytes(char* out, const char* bytes, std::size_t count) {
    const auto copyBothEnds = [=](auto word) {
        auto last = word;
        std::memcpy(&word, bytes, sizeof(word));
        std::memcpy(&last, bytes + count - sizeof(last), sizeof(last));
        std::memcpy(out, &word, sizeof(word));
        std::memcpy(out + count - sizeof(last), &last, sizeof(last));
    };
    if (count >= sizeof(std::uint64_t)) {
        copyBothEnds(std::uint64_t{});
    } else if (count >= sizeof(std::uint32_t)) {
        copyBothEnds(std::uint32_t{});
    } else {
        for (std::size_t i = 0; i < count; ++i) {
            out[i] = bytes[i];
        }
    }
}

} // namespace MoxCommonNS
