/// Reads the queue of errors of a configuration.
#pragma once

#include "SVGConfig.h"
#include "tests/support/Utf8.h"

#include <string>

namespace DrawmereTest {

using namespace DrawmereNS;

/// Returns: number and text of an error, with " at" behind one that tells a place or anything more.
inline std::string describe(const MoxError& error) {
    const bool tellsMore = !error.getSource().isEmpty() || !error.getExtra().isEmpty() ||
                           error.getLine() != -1 || error.getColumn() != -1;
    return std::to_string(error.getCode()) + " " + utf8(error.getMessage()) +
           (tellsMore ? " at" : "");
}

/// Returns: each queued error, the newest first and one a line; the queue is empty then.
inline std::string takeErrors(SVGConfig& config) {
    std::string lines;
    while (config.hasError()) {
        lines += describe(config.popError()) + "\n";
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
