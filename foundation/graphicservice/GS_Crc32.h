/// The checksum of PNG chunks.
#pragma once

#include <cstddef>
#include <cstdint>

namespace MoxGraphicService_NS {

/// The cyclic redundancy check of PNG (ISO 3309), taken over bytes as they come. The folder has its
/// own because whole files are checked: by multiplications without carries where the machine has
/// them, otherwise eight bytes at a time. Both ways come to the same.
class GS_Crc32 {
public:
    void add(const std::uint8_t* bytes, std::size_t count);

    /// The same without vector code.
    void addPlain(const std::uint8_t* bytes, std::size_t count);

    /// Returns: the checksum of all bytes so far.
    std::uint32_t getValue() const;

private:
    std::uint32_t state = 0xFFFFFFFF;
};

} // namespace MoxGraphicService_NS
