/// A stream in memory, to be written and read.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxMemStreamBuf.h"

#include <istream>

namespace MoxCommonNS {

/// An input and output stream over a `MoxMemStreamBuf`, which it holds.
/// Writing begins at the end of what the stream was made with, reading at its start.
class DRAWMERE_API MoxMemStream : public std::iostream {
public:
    /// Makes a stream with the bytes that `source` has left from its present position to its end; a
    /// null `source` gives an empty stream. The bad bit is set when memory ran out.
    /// Shape: `size`, the room in bytes to begin with and the least to grow by.
    /// Owns: `source` when `ownsSource` is true, and deletes it once it is read.
    /// Borrows: `source` for the call otherwise; its buffer stands at the end then, its state bits
    /// are left alone.
    MoxMemStream(std::istream* source, unsigned long size, bool ownsSource);

    MoxMemStream(const MoxMemStream&) = delete;
    MoxMemStream& operator=(const MoxMemStream&) = delete;
    ~MoxMemStream() override;

    /// Returns: the stream's own buffer, whose `remove` takes the bytes out of the stream.
    MoxMemStreamBuf* rdbuf();

private:
    MoxMemStreamBuf buffer;
};

} // namespace MoxCommonNS
