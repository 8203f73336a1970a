/// What a fuzz target says when a property does not hold.
#pragma once

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>

namespace DrawmereTest {

/// Ends the process, which a fuzzer takes for a finding, unless `holds`.
inline void require(bool holds, const std::string& what) {
    if (!holds) {
        std::fprintf(stderr, "The property does not hold: %s\n", what.c_str());
        std::abort();
    }
}

/// Returns: the input of a target.
inline std::string_view inputOf(const std::uint8_t* data, std::size_t size) {
    return {reinterpret_cast<const char*>(data), size};
}

} // namespace DrawmereTest
