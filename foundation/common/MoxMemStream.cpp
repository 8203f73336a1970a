#include "foundation/common/MoxMemStream.h"

namespace MoxCommonNS {

MoxMemStream::MoxMemStream(std::istream* source, unsigned long size, bool ownsSource)
    : std::iostream(nullptr), buffer(size) {
    const std::unique_ptr<std::istream> owned(ownsSource ? source : nullptr);
    // Only here does the buffer exist, as bases are made before members; this clears the bad bit
    // too.
    std::ios::rdbuf(&buffer);
    if (source && source->rdbuf() && !buffer.readFrom(*source->rdbuf())) {
        setstate(std::ios::badbit);
    }
}

MoxMemStream::~MoxMemStream() = default;

MoxMemStreamBuf* MoxMemStream::rdbuf() { return &buffer; }

} // namespace MoxCommonNS
