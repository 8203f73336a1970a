/// A large piece of memory that goes from owner to owner.
#pragma once

#include <cstddef>
#include <cstdlib>
#include <memory>

namespace MoxCommonNS {

/// Gives memory of `makeZeroBlock` back.
struct MoxByteBlockDeleter {
    /// Frees `bytes`, which may be null.
    void operator()(char* bytes) const { std::free(bytes); }
};

/// Owns bytes, which go back when it dies.
using MoxByteBlock = std::unique_ptr<char[], MoxByteBlockDeleter>;

/// Returns: `size` zero bytes, null when there is no memory. The system has zeros ready, so a large
/// block costs nothing until it is written to.
inline MoxByteBlock makeZeroBlock(std::size_t size) {
    return MoxByteBlock(static_cast<char*>(std::calloc(size, 1)));
}

} // namespace MoxCommonNS
