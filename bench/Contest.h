/// Times several ways of doing the same work against each other, on a machine that is not quiet.
#pragma once

#include <cstddef>
#include <ctime>
#include <functional>
#include <string>
#include <vector>

namespace DrawmereNS {

/// How long something took, in seconds.
struct ContestTime {
    double wall = 0.0;
    double cpu = 0.0; ///< of this process alone
};

/// Measures the time since it was made.
class Stopwatch {
public:
    ContestTime getTime() const;

private:
    static double read(clockid_t clock);

    ContestTime start = {read(CLOCK_MONOTONIC), read(CLOCK_PROCESS_CPUTIME_ID)};
};

/// What one run of a contender came to.
struct ContestResult {
    ContestTime time;
    std::size_t bytes = 0; ///< written
};

/// One way of doing the work. It times itself, so that it may prepare and clean up outside.
struct Contender {
    std::string name;
    std::function<ContestResult()> run;
    bool isSlow = false; ///< takes part in the first rounds only
};

/// A piece of work with everybody who does it; the first contender is the yardstick.
struct Contest {
    std::string title;
    std::vector<Contender> contenders;
    double goal = 0.0;      ///< the ratio that the second contender may have, 0 for none
    double bytesGoal = 0.0; ///< the same for the bytes it writes
};

/// Runs the contenders of each contest in turn, round after round, and prints a table: the medians
/// of the times, and of the ratios to the yardstick's time in the same round. Where other programs
/// keep the machine busy, the processor's time tells more than that of the wall clock. With a
/// filter on the command line (`--benchmark_filter=title/name`) Google Benchmark runs what it names
/// alone instead, for a profiler.
void runContests(const std::vector<Contest>& contests);

/// Returns: whether the bench only has to show that it works.
bool isSmokeRun();

/// Returns: `count`, or a thousandth of it in a smoke run.
std::size_t scaleCount(std::size_t count);

} // namespace DrawmereNS
