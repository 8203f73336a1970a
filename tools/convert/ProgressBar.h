/// Shows on a terminal how far a document is.
#pragma once

#include <chrono>
#include <string>

namespace DrawmereConvert {

/// A line on the error stream that is written over and over, and gone at the end. Nothing is shown
/// when that stream is no terminal.
class ProgressBar {
public:
    /// Shape: `label`, what stands before the bar; `pageCount`, of all pages.
    /// Without `isWanted` nothing is shown.
    ProgressBar(const std::string& barLabel, int pageCount, bool isWanted);
    ProgressBar(const ProgressBar&) = delete;
    ProgressBar& operator=(const ProgressBar&) = delete;
    ~ProgressBar();

    /// Notes that a further page is done, and shows it if the last time is long enough ago.
    void advance();

    /// Takes the line away, so that a message can be printed there.
    void clear();

    /// Returns: the line after `seconds`: the bar, the count, the rate and what time is left.
    static std::string describe(const std::string& label, int done, int total, double seconds);

private:
    using Clock = std::chrono::steady_clock;

    std::string label;
    int total;
    int done = 0;
    bool isShown;
    bool isVisible = false;
    Clock::time_point begin = Clock::now();
    Clock::time_point next = begin; // when it is shown again
};

} // namespace DrawmereConvert
