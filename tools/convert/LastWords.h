/// What a process says when the reader of a document ends it.
#pragma once

#include <string>

namespace DrawmereConvert {

/// While it lives, a crash and the end of a time limit end the process with a word on its error
/// stream and a status. There can be one at a time, and no `Watchdog` beside it.
class LastWords {
public:
    /// Shape: both texts end in a line feed. Units: `seconds`, 0 for no limit.
    LastWords(const std::string& lateText, const std::string& crashText, double seconds,
              int exitStatus);
    LastWords(const LastWords&) = delete;
    LastWords& operator=(const LastWords&) = delete;
    ~LastWords();
};

} // namespace DrawmereConvert
