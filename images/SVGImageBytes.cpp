#include "images/SVGImageBytes.h"

#include <istream>

namespace DrawmereNS {

std::streamoff SVGImageBytes::start(std::istream& source) {
    std::streambuf* const buffer = source.rdbuf();
    if (!buffer) {
        return -1;
    }
    try {
        const std::streamoff length = buffer->pubseekoff(0, std::ios::end, std::ios::in);
        const std::streamoff begin = buffer->pubseekoff(0, std::ios::beg, std::ios::in);
        return begin == 0 ? length : -1;
    } catch (...) {
        return -1;
    }
}

std::size_t SVGImageBytes::read(std::istream& source, char* bytes, std::size_t count) {
    std::streambuf* const buffer = source.rdbuf();
    if (!buffer) {
        return 0;
    }
    try {
        const std::streamsize read = buffer->sgetn(bytes, static_cast<std::streamsize>(count));
        return read > 0 ? static_cast<std::size_t>(read) : 0;
    } catch (...) {
        return 0;
    }
}

} // namespace DrawmereNS
