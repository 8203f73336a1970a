#include "bench/Contest.h"

#include <algorithm>
#include <benchmark/benchmark.h>
#include <cstdio>
#include <cstdlib>
#include <malloc.h>

namespace DrawmereNS {
namespace {

constexpr int fullRounds = 11;
constexpr int slowRounds = 3;
constexpr std::size_t smokeDivisor = 1000;

/// What all runs of one contender came to.
struct Row {
    std::vector<double> wall;
    std::vector<double> wallRatios;
    std::vector<double> cpu;
    std::vector<double> cpuRatios;
    std::size_t bytes = 0;
};

double findMedian(std::vector<double> values) {
    const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
    std::nth_element(values.begin(), middle, values.end());
    return *middle;
}

/// Each run starts with an empty heap, as the first document of a process does; otherwise what the
/// run before left of it decides.
ContestResult runFresh(const Contender& contender) {
    malloc_trim(0);
    return contender.run();
}

void runOnce(const Contender& contender, const Row& yardstick, Row& row) {
    const ContestResult result = runFresh(contender);
    row.wall.push_back(result.time.wall);
    row.wallRatios.push_back(result.time.wall / yardstick.wall.back());
    row.cpu.push_back(result.time.cpu);
    row.cpuRatios.push_back(result.time.cpu / yardstick.cpu.back());
    row.bytes = result.bytes;
}

std::vector<Row> runRounds(const Contest& contest) {
    std::vector<Row> rows(contest.contenders.size());
    const int rounds = isSmokeRun() ? 1 : fullRounds;
    for (int round = 0; round < rounds; ++round) {
        for (std::size_t i = 0; i < rows.size(); ++i) {
            if (round < slowRounds || !contest.contenders[i].isSlow) {
                runOnce(contest.contenders[i], rows[0], rows[i]);
            }
        }
    }
    return rows;
}

void printHeading(const std::string& title) {
    std::printf("\n%s\n  %-13s %8s %8s %9s %8s %9s %8s %9s\n", title.c_str(), "", "wall ms",
                "ratio", "cpu ms", "ratio", "MB", "ratio", "MB/cpu s");
}

void printRow(const std::string& name, const Row& row, const Row& yardstick) {
    constexpr double thousand = 1e3;
    constexpr double million = 1e6;
    const auto bytes = static_cast<double>(row.bytes);
    const double cpu = findMedian(row.cpu);
    std::printf("  %-13s %8.1f %7.2fx %9.1f %7.2fx %9.2f %7.2fx %9.0f\n", name.c_str(),
                findMedian(row.wall) * thousand, findMedian(row.wallRatios), cpu * thousand,
                findMedian(row.cpuRatios), bytes / million,
                bytes / static_cast<double>(yardstick.bytes), bytes / million / cpu);
}

void printContest(const Contest& contest) {
    const std::vector<Row> rows = runRounds(contest);
    printHeading(contest.title);
    for (std::size_t i = 0; i < rows.size(); ++i) {
        printRow(contest.contenders[i].name, rows[i], rows[0]);
    }
    if (contest.goal > 0.0) {
        std::printf("  goal for %s: at most %.2fx\n", contest.contenders[1].name.c_str(),
                    contest.goal);
    }
    if (contest.bytesGoal > 0.0) {
        std::printf("  goal for its bytes: at most %.2fx\n", contest.bytesGoal);
    }
}

void measure(benchmark::State& state, const Contender& contender) {
    for ([[maybe_unused]] auto _ : state) {
        const ContestResult result = runFresh(contender);
        state.SetIterationTime(result.time.wall);
        state.counters["bytes"] = static_cast<double>(result.bytes);
    }
}

/// Registers each contender with Google Benchmark, to be run alone.
void registerContest([[maybe_unused]] const Contest& contest) {
#ifndef __clang_analyzer__ // it takes what the benchmark library keeps for itself for a leak
    for (const Contender& contender : contest.contenders) {
        const std::string name = contest.title + "/" + contender.name;
        const auto body = [contender](benchmark::State& state) { measure(state, contender); };
        benchmark::RegisterBenchmark(name.c_str(), body)
            ->UseManualTime()
            ->Unit(benchmark::kMillisecond);
    }
#endif
}

bool hasFilter() {
    const std::string filter = benchmark::GetBenchmarkFilter();
    return !filter.empty() && filter != "all";
}

} // namespace

ContestTime Stopwatch::getTime() const {
    return {read(CLOCK_MONOTONIC) - start.wall, read(CLOCK_PROCESS_CPUTIME_ID) - start.cpu};
}

double Stopwatch::read(clockid_t clock) {
    constexpr double nano = 1e-9;
    timespec now = {};
    clock_gettime(clock, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * nano;
}

void runContests(const std::vector<Contest>& contests) {
    for (const Contest& contest : contests) {
        if (hasFilter()) {
            registerContest(contest);
        } else {
            printContest(contest);
        }
    }
    if (hasFilter()) {
        benchmark::RunSpecifiedBenchmarks();
    }
}

bool isSmokeRun() { return std::getenv("DRAWMERE_BENCH_SMOKE") != nullptr; }

std::size_t scaleCount(std::size_t count) { return isSmokeRun() ? count / smokeDivisor : count; }

} // namespace DrawmereNS
