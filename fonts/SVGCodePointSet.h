/// A set of code points.
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

namespace DrawmereNS {

/// Remembers the characters that a font has dealt with. It may forget some where many share a hash.
class SVGCodePointSet {
public:
    /// Adds `codePoint`. Returns: false when it is known to be there already.
    bool insert(std::uint32_t codePoint);

    /// Forgets all.
    void clear();

private:
    void grow();
    std::uint32_t* findSlot(std::uint32_t mark);

    std::vector<std::uint32_t> slots; // a power of two of them: one more than a code point, or 0
    std::size_t count = 0;
};

} // namespace DrawmereNS
