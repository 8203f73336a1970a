#include "foundation/graphicservice/GS_Input.h"

#include <algorithm>

namespace MoxGraphicService_NS {
namespace {

/// Returns: the position in the stream after the move, 0 when it failed.
std::uint64_t moveTo(std::streambuf& buffer, std::streamoff offset, std::ios_base::seekdir from) {
    try {
        const std::streamoff reached = buffer.pubseekoff(offset, from, std::ios_base::in);
        return reached < 0 ? 0 : static_cast<std::uint64_t>(reached);
    } catch (...) {
        return 0;
    }
}

} // namespace

GS_Input::GS_Input(std::istream& source) noexcept : buffer(source.rdbuf()) {
    if (buffer) {
        size = moveTo(*buffer, 0, std::ios_base::end);
        moveTo(*buffer, 0, std::ios_base::beg);
    }
}

std::uint64_t GS_Input::getSize() const noexcept { return size; }

std::uint64_t GS_Input::getPosition() const noexcept { return position; }

std::uint64_t GS_Input::getRest() const noexcept { return size - position; }

bool GS_Input::seek(std::uint64_t newPosition) noexcept {
    if (!buffer || newPosition > size) {
        return false;
    }
    position = newPosition;
    const auto offset = static_cast<std::streamoff>(newPosition);
    return moveTo(*buffer, offset, std::ios_base::beg) == newPosition;
}

std::size_t GS_Input::read(void* target, std::size_t count) noexcept {
    if (!buffer || count == 0) {
        return 0;
    }
    try {
        const auto wanted = static_cast<std::streamsize>(std::min<std::uint64_t>(count, getRest()));
        const std::streamsize got = buffer->sgetn(static_cast<char*>(target), wanted);
        position += static_cast<std::uint64_t>(std::max<std::streamsize>(got, 0));
        return static_cast<std::size_t>(std::max<std::streamsize>(got, 0));
    } catch (...) {
        return 0;
    }
}

bool GS_Input::readAll(void* target, std::size_t count) noexcept {
    return read(target, count) == count;
}

} // namespace MoxGraphicService_NS
