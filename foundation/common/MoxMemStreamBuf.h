/// A stream buffer that keeps its bytes in memory.
#pragma once

#include "DrawmereExport.h"

#include <cstddef>
#include <memory>
#include <streambuf>

namespace MoxCommonNS {

/// The bytes a memory stream gave up.
struct MoxMemBytes {
    std::unique_ptr<char[]> data; ///< null when there are none
    std::size_t size = 0;         ///< in bytes; what may lie behind them is of no meaning
};

/// Keeps all that is written to it; the same bytes are there to be read.
/// Reading and writing have a position each, as in a string stream. Both lie between 0 and the
/// size, so a seek outside fails, and so does a seek from the current position that doesn't say
/// which of the two.
class DRAWMERE_API MoxMemStreamBuf : public std::streambuf {
public:
    /// Makes an empty buffer that will begin with room for `blockSize` bytes and grows by that much
    /// at least. Nothing is allocated before the first write; a size of no use is brought into
    /// bounds.
    explicit MoxMemStreamBuf(unsigned long blockSize);

    MoxMemStreamBuf(const MoxMemStreamBuf&) = delete;
    MoxMemStreamBuf& operator=(const MoxMemStreamBuf&) = delete;
    ~MoxMemStreamBuf() override;

    /// Appends what `source` has left, up to its end, at the position of writing.
    /// Returns: false when memory ran out; what was read so far stays.
    bool readFrom(std::streambuf& source);

    /// Gives the bytes away and leaves the buffer empty, as it was when new.
    MoxMemBytes remove();

    /// Returns: the count of bytes held.
    std::size_t getSize() const;

    /// Returns: the bytes held, valid until the next write, `remove` or the end; null before the
    /// first write.
    const char* getData() const;

protected:
    // What std::streambuf asks for.
    /// Makes the next byte readable. Returns: it, or the end-of-file value.
    int_type underflow() override;
    /// Makes room and stores a byte. Returns: it, or the end-of-file value without memory.
    int_type overflow(int_type character) override;
    /// Returns: how many bytes can be read, -1 for none.
    std::streamsize showmanyc() override;
    /// Stores `count` bytes. Returns: how many found room.
    std::streamsize xsputn(const char* text, std::streamsize count) override;
    /// Moves the places of reading and writing. Returns: the new one, -1 beyond the bytes.
    pos_type seekoff(off_type offset, std::ios_base::seekdir from,
                     std::ios_base::openmode which) override;
    /// The same from the beginning.
    pos_type seekpos(pos_type position, std::ios_base::openmode which) override;

private:
    std::size_t readPosition() const;
    std::size_t writePosition() const;
    void setPositions(std::size_t reading, std::size_t writing);
    void noteSize();
    bool reserve(std::size_t more);
    bool reallocate(std::size_t newCapacity);

    std::unique_ptr<char[]> bytes; // `capacity` of them
    std::size_t capacity = 0;
    std::size_t size = 0; // as of the last `noteSize`; writing may have gone on since
    std::size_t block;
};

} // namespace MoxCommonNS
