/// Choices that a seed or a string of bytes makes.
#pragma once

#include <cstddef>
#include <cstdint>
#include <random>
#include <string_view>

namespace DrawmereTest {

/// A row of choices, the same for the same seed or the same bytes. It makes a test random, and
/// lets a fuzzer steer it.
class Choices {
public:
    explicit Choices(unsigned seed) : generator(seed) {}

    /// Each choice takes as many bytes as it needs; when they are used up, all others are 0.
    /// Borrows: `text`, for the life of the object.
    explicit Choices(std::string_view text) : generator(0), bytes(text), areBytes(true) {}

    /// Returns: whether all bytes are used up; never with a seed.
    bool isUsedUp() const { return areBytes && bytes.empty(); }

    /// Returns: any number.
    std::uint32_t number() { return areBytes ? take(4) : static_cast<std::uint32_t>(generator()); }

    /// Returns: a number from 0 to `limit` - 1.
    unsigned below(unsigned limit) {
        return (areBytes ? take(limit <= 0x100 ? 1 : limit <= 0x10000 ? 2 : 4) : number()) % limit;
    }

    bool flag() { return below(2) == 0; }

    /// Returns: a row of the table.
    template <typename T, std::size_t count> T pick(const T (&table)[count]) {
        return table[below(count)];
    }

    /// Returns: up to `most` of the bytes that no choice has taken yet; none with a seed.
    std::string_view takeBytes(std::size_t most) {
        const std::string_view taken = bytes.substr(0, most);
        bytes.remove_prefix(taken.size());
        return taken;
    }

private:
    std::uint32_t take(std::size_t size) {
        std::uint32_t value = 0;
        for (; size > 0 && !bytes.empty(); --size) {
            value = value << 8 | static_cast<unsigned char>(bytes.front());
            bytes.remove_prefix(1);
        }
        return value;
    }

    std::mt19937 generator;
    std::string_view bytes;
    bool areBytes = false;
};

} // namespace DrawmereTest
