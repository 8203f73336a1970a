/// The direction of includes between the folders, and which folder may use which library.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace DrawmereTest {

/// One include line of a source: what stands between the quotes or the angle brackets.
struct IncludeLine {
    std::string target;
    bool quoted = false;
};

/// Reads an include out of a source line. Returns: nothing for any other line.
std::optional<IncludeLine> readInclude(std::string_view line);

/// Judges one include of `file`, a path from the root of the repository.
/// Returns: what is wrong with it, empty when it is allowed.
std::string findIncludeFault(std::string_view file, const IncludeLine& include);

} // namespace DrawmereTest
