/// The bytes of a stream, for decoders.
#pragma once

#include <cstddef>
#include <cstdint>
#include <istream>

namespace MoxGraphicService_NS {

/// Reads a stream from any position and never throws, so that the C libraries can call it. The
/// state bits of the stream are neither heeded nor set.
class GS_Input {
public:
    /// Borrows: `source`, for its own life.
    explicit GS_Input(std::istream& source) noexcept;

    /// Returns: the count of bytes in the stream, 0 when it can't tell.
    std::uint64_t getSize() const noexcept;

    /// Returns: the position from which the next byte is read.
    std::uint64_t getPosition() const noexcept;

    /// Returns: the count of bytes from there to the end.
    std::uint64_t getRest() const noexcept;

    /// Returns: false when there is no such position.
    bool seek(std::uint64_t newPosition) noexcept;

    /// Returns: the count of bytes read, less than `count` at the end or when reading fails.
    std::size_t read(void* target, std::size_t count) noexcept;

    /// Returns: whether all `count` bytes could be read.
    bool readAll(void* target, std::size_t count) noexcept;

private:
    std::streambuf* buffer; // borrowed
    std::uint64_t size = 0;
    std::uint64_t position = 0;
};

} // namespace MoxGraphicService_NS
