#include "foundation/records/TLMemoryImage.h"

#include <istream>
#include <streambuf>

namespace TalGraphic {
namespace {

/// Reads bytes where they are.
class BytesBuffer : public std::streambuf {
public:
    explicit BytesBuffer(std::string_view bytes) {
        // A stream buffer asks for bytes that can be changed; this one never changes them.
        char* const begin = const_cast<char*>(bytes.data()); // NOLINT(cppcoreguidelines-*)
        setg(begin, begin, begin + bytes.size());
    }

protected:
    pos_type seekoff(off_type offset, std::ios_base::seekdir from,
                     std::ios_base::openmode which) override {
        const off_type size = egptr() - eback();
        off_type origin = from == std::ios_base::end ? size : 0;
        if (from == std::ios_base::cur) {
            origin = gptr() - eback();
        }
        if ((which & std::ios_base::in) == 0 || offset < -origin || offset > size - origin) {
            return pos_type(off_type(-1));
        }
        setg(eback(), eback() + origin + offset, egptr());
        return pos_type(origin + offset);
    }

    pos_type seekpos(pos_type position, std::ios_base::openmode which) override {
        return seekoff(off_type(position), std::ios_base::beg, which);
    }
};

} // namespace

class TLMemoryImage::Stream : public std::istream {
public:
    explicit Stream(std::string_view bytes) : std::istream(nullptr), buffer(bytes) {
        rdbuf(&buffer); // only here does the buffer exist, as bases are made before members
    }

private:
    BytesBuffer buffer;
};

TLMemoryImage::TLMemoryImage(std::string_view bytes, const UnicodeString& name)
    : TLGraphicImage(name), stream(std::make_unique<Stream>(bytes)) {}

TLMemoryImage::~TLMemoryImage() = default;

TLGraphicType TLMemoryImage::getGraphicType() { return findGraphicType(*stream); }

std::istream* TLMemoryImage::getStream() { return stream.get(); }

} // namespace TalGraphic
