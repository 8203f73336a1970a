/// Reads the queue of errors of a configuration.
#pragma once

#include "SVGConfig.h"
#include "tests/support/Utf8.h"

#include <string>

namespace DrawmereTest {

using namespace DrawmereNS;

/// Returns: number and text of each queued error, one a line, with " at" behind one that tells a
/// place or anything more; the queue is empty then.
inline std::string takeErrors(SVGConfig& config) {
    std::string lines;
    while (config.hasError()) {
        const MoxError error = config.popError();
        const bool tellsMore = !error.getSource().isEmpty() || !error.getExtra().isEmpty() ||
                               error.getLine() != -1 || error.getColumn() != -1;
        lines += std::to_string(error.getCode()) + " " + utf8(error.getMessage()) +
                 (tellsMore ? " at\n" : "\n");
    }
    return lines;
}

/// Returns: number and text of what `call` throws, "nothing" when it returns.
template <typename Call> std::string catchError(Call call) {
    try {
        call();
    } catch (const MoxError& error) {
        return std::to_string(error.getCode()) + " " + error.what();
    }
    return "nothing";
}

inline constexpr char otherTypeError[] = "16407 Pop type is not same with push type.";

} // namespace DrawmereTest
