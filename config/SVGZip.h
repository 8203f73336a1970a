/// Output streams that write a gzip file (RFC 1952).
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

#include <cstddef>
#include <memory>
#include <ostream>
#include <streambuf>

struct z_stream_s; // zlib's, which only the source includes

namespace DrawmereNS {

/// The buffer of a `SVGZipStream`: deflates all it receives and hands the result to its target.
/// Write errors show in the state of the target, and as failures of `overflow` and `sync`. The
/// compressed data is complete only when the buffer is destroyed.
class DRAWMERE_API SVGZipStreamBuf : public std::streambuf {
public:
    static constexpr std::size_t bufferSize = 15360; ///< of each buffer, in bytes

    /// Writes to `target`. Borrows: `target`, until destruction, which flushes it and leaves it
    /// open.
    explicit SVGZipStreamBuf(std::ostream& target);

    /// Writes to the file with this local path, emptied or newly made. One that can't be opened
    /// swallows everything, and shows as a write error.
    explicit SVGZipStreamBuf(const UnicodeString& fileName);

    SVGZipStreamBuf(const SVGZipStreamBuf&) = delete;
    SVGZipStreamBuf& operator=(const SVGZipStreamBuf&) = delete;

    /// Finishes the compressed data.
    ~SVGZipStreamBuf() override;

    /// Starts the compression, at the highest level; the constructors have done it.
    void initZStream();

    /// Deflates `in[size]`, and writes the output buffer out each time it is full. What can't be
    /// deflated is lost and shows as a write error.
    /// Shape: `outSize`, the size of the output buffer. Ignores: `out`, as that buffer is a member.
    /// Returns: how many bytes wait in the output buffer.
    unsigned long EncodeBuffer(unsigned char* in, unsigned char* out, unsigned long size,
                               unsigned long outSize);

    /// Ends the compression and writes out what waits; nothing can be deflated afterwards.
    /// Returns: 0.
    int FinishEncodeBuf();

    /// Deflates what the put area holds and empties it. Returns: 0.
    int gzOut();

    /// Makes room by deflating the full put area, and stores `c` as a byte.
    /// Returns: the byte, or the end-of-file value after a write error.
    int overflow(int c) override;

    /// Deflates what the put area holds; neither the compression nor the target is flushed.
    /// Returns: 0, or -1 after a write error.
    int sync() override;

    char inputBuffer[bufferSize] = {};      ///< the put area, what isn't deflated yet
    unsigned char outputBuffer[bufferSize]; ///< what deflate made and isn't written yet
    std::ostream* target;                   ///< owned if `ownsTarget`, otherwise borrowed
    bool ownsTarget;                        ///< set by the constructor that takes a file name
    std::unique_ptr<z_stream_s> zstream;    ///< the state of deflate

private:
    void writeOutput(std::size_t count);
    bool deflateInput();
};

/// An output stream whose bytes arrive compressed. It is made, written and destroyed; only its
/// destruction makes the file complete. A write error shows in the state of the stream when it is
/// flushed, and in that of the target at all times, destruction included.
class DRAWMERE_API SVGZipStream : public std::ostream {
public:
    /// Writes to the file with this local path, emptied or newly made. The fail bit is set when it
    /// can't be opened.
    explicit SVGZipStream(const UnicodeString& fileName);

    /// Writes to `target`. Borrows: `target`, until destruction, which flushes it and leaves it
    /// open.
    explicit SVGZipStream(std::ostream& target);

    SVGZipStream(const SVGZipStream&) = delete;
    SVGZipStream& operator=(const SVGZipStream&) = delete;
    ~SVGZipStream() override;

    SVGZipStreamBuf buffer; ///< what compresses and writes
};

} // namespace DrawmereNS
