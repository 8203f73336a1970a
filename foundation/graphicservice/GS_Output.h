/// Where the bytes of a written image go.
#pragma once

#include <cstddef>
#include <ostream>

namespace MoxGraphicService_NS {

/// Writes to a stream and never throws, so that the C libraries can call it.
class GS_Output {
public:
    /// Borrows: `target`, for its own life.
    explicit GS_Output(std::ostream& target) noexcept;

    /// Returns: false when the stream refused these or earlier bytes.
    bool write(const void* bytes, std::size_t count) noexcept;

    /// Returns: false when the stream refused any bytes so far.
    bool flush() noexcept;

private:
    std::ostream& stream; // borrowed
};

} // namespace MoxGraphicService_NS
