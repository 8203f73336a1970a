#include "foundation/common/MoxMemStreamBuf.h"

#include <algorithm>
#include <climits>
#include <cstring>
#include <limits>
#include <new>
#include <utility>

namespace MoxCommonNS {
namespace {

constexpr std::size_t smallestBlock = 64;
// A larger block would waste memory, or ask for more than there is at the first byte.
constexpr std::size_t largestBlock = std::size_t(1) << 26;
// Every position must fit an offset of the stream.
constexpr std::size_t largestSize =
    static_cast<std::size_t>(std::numeric_limits<std::ptrdiff_t>::max());

const std::streambuf::pos_type noPosition(std::streambuf::off_type(-1));

} // namespace

MoxMemStreamBuf::MoxMemStreamBuf(unsigned long blockSize)
    : block(std::clamp<std::size_t>(blockSize, smallestBlock, largestBlock)) {}

MoxMemStreamBuf::~MoxMemStreamBuf() = default;

bool MoxMemStreamBuf::readFrom(std::streambuf& source) {
    for (;;) {
        if (!reserve(block)) {
            return false;
        }
        const std::size_t position = writePosition();
        const std::streamsize count =
            source.sgetn(pptr(), static_cast<std::streamsize>(capacity - position));
        if (count <= 0) {
            return true;
        }
        setPositions(readPosition(), position + static_cast<std::size_t>(count));
    }
}

MoxMemBytes MoxMemStreamBuf::remove() {
    noteSize();
    MoxMemBytes result{std::move(bytes), std::exchange(size, 0)};
    capacity = 0;
    setPositions(0, 0);
    return result;
}

std::size_t MoxMemStreamBuf::getSize() const { return std::max(size, writePosition()); }

const char* MoxMemStreamBuf::getData() const { return bytes.get(); }

MoxMemStreamBuf::int_type MoxMemStreamBuf::underflow() {
    const std::size_t position = readPosition();
    setPositions(position, writePosition());
    return position < size ? traits_type::to_int_type(*gptr()) : traits_type::eof();
}

MoxMemStreamBuf::int_type MoxMemStreamBuf::overflow(int_type character) {
    if (traits_type::eq_int_type(character, traits_type::eof())) {
        return traits_type::not_eof(character);
    }
    if (!reserve(1)) {
        return traits_type::eof();
    }
    *pptr() = traits_type::to_char_type(character);
    pbump(1);
    return character;
}

std::streamsize MoxMemStreamBuf::showmanyc() {
    const std::size_t rest = getSize() - readPosition();
    return rest > 0 ? static_cast<std::streamsize>(rest) : -1;
}

std::streamsize MoxMemStreamBuf::xsputn(const char* text, std::streamsize count) {
    if (count <= 0 || !reserve(static_cast<std::size_t>(count))) {
        return 0;
    }
    const std::size_t position = writePosition();
    std::memcpy(pptr(), text, static_cast<std::size_t>(count));
    setPositions(readPosition(), position + static_cast<std::size_t>(count));
    return count;
}

MoxMemStreamBuf::pos_type MoxMemStreamBuf::seekoff(off_type offset, std::ios_base::seekdir from,
                                                   std::ios_base::openmode which) {
    const bool reading = (which & std::ios_base::in) != 0;
    const bool writing = (which & std::ios_base::out) != 0;
    if ((!reading && !writing) || (reading && writing && from == std::ios_base::cur)) {
        return noPosition;
    }
    noteSize();
    const auto end = static_cast<off_type>(size);
    off_type origin = from == std::ios_base::end ? end : 0;
    if (from == std::ios_base::cur) {
        origin = static_cast<off_type>(reading ? readPosition() : writePosition());
    }
    if (offset < -origin || offset > end - origin) {
        return noPosition;
    }
    const auto target = static_cast<std::size_t>(origin + offset);
    setPositions(reading ? target : readPosition(), writing ? target : writePosition());
    return pos_type(origin + offset);
}

MoxMemStreamBuf::pos_type MoxMemStreamBuf::seekpos(pos_type position,
                                                   std::ios_base::openmode which) {
    return seekoff(off_type(position), std::ios_base::beg, which);
}

std::size_t MoxMemStreamBuf::readPosition() const {
    return static_cast<std::size_t>(gptr() - eback());
}

std::size_t MoxMemStreamBuf::writePosition() const {
    return static_cast<std::size_t>(pptr() - pbase());
}

/// Sets both areas anew over the bytes: the one of writing up to the capacity, the one of reading
/// up to the size, which covers all that was written.
void MoxMemStreamBuf::setPositions(std::size_t reading, std::size_t writing) {
    size = std::max(size, writing);
    char* const begin = bytes.get();
    setg(begin, begin + reading, begin + size);
    setp(begin, begin + capacity);
    // The position moves by an int at a time.
    for (; writing > INT_MAX; writing -= INT_MAX) {
        pbump(INT_MAX);
    }
    pbump(static_cast<int>(writing));
}

void MoxMemStreamBuf::noteSize() { size = getSize(); }

/// Makes room for `more` bytes from the position of writing on.
bool MoxMemStreamBuf::reserve(std::size_t more) {
    const std::size_t position = writePosition();
    if (more <= capacity - position) {
        return true;
    }
    if (more > largestSize - position) {
        return false;
    }
    const std::size_t needed = position + more;
    const std::size_t step = std::max(block, std::min(capacity, largestSize - capacity));
    // Doubling keeps large writes linear; when there is no memory for that, what is needed may
    // still fit.
    return reallocate(std::max(needed, std::min(capacity + step, largestSize))) ||
           reallocate(needed);
}

bool MoxMemStreamBuf::reallocate(std::size_t newCapacity) {
    noteSize();
    std::unique_ptr<char[]> fresh(new (std::nothrow) char[newCapacity]);
    if (!fresh) {
        return false;
    }
    if (size > 0) {
        std::memcpy(fresh.get(), bytes.get(), size);
    }
    const std::size_t reading = readPosition();
    const std::size_t writing = writePosition();
    bytes = std::move(fresh);
    capacity = newCapacity;
    setPositions(reading, writing);
    return true;
}

} // namespace MoxCommonNS
