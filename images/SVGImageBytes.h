/// Reading the bytes of an image, whatever state its stream is in.
#pragma once

#include <cstddef>
#include <ios>

namespace DrawmereNS {

/// Reads streams by their buffers: an earlier reader may have met the end and left its mark in the
/// state of the stream. A stream or a buffer that throws on failure must not end the run.
class SVGImageBytes {
public:
    SVGImageBytes() = delete;

    /// Goes to the first byte. Returns: the count of bytes, -1 when the stream can't tell.
    static std::streamoff start(std::istream& source);

    /// Returns: how many of the next `count` bytes there were; they stand in `bytes`. 0 when
    /// the buffer throws.
    static std::size_t read(std::istream& source, char* bytes, std::size_t count);
};

} // namespace DrawmereNS
