// Holds the number rule of path data against its plainest form on more than a hundred million
// floats, or on all there are:
//
//     mkdir -p build && g++ -std=c++20 -O2 -I. -Iinclude -o build/number_rule_proof
//         tests/proof/NumberRuleProof.cpp path/SVGNumberRule.cpp && build/number_rule_proof
//
// in one line, at the root of the repository. It takes too long for every run of the tests. An
// argument is the distance between the bit patterns that are tried: 41 without one, 1 for every
// float.
#include "tests/path/PlainNumberRule.h"

#include <chrono>
#include <cstdlib>

namespace {

constexpr std::uint64_t usualStride = 41;
constexpr int manyTies = 1'000'000;

std::uint64_t readStride(int argc, char** argv) {
    const std::uint64_t stride = argc > 1 ? std::strtoull(argv[1], nullptr, 10) : usualStride;
    return stride > 0 ? stride : usualStride;
}

} // namespace

int main(int argc, char** argv) {
    using Clock = std::chrono::steady_clock;
    const Clock::time_point start = Clock::now();
    DrawmereTest::NumberRuleCheck rule;
    rule.checkTies(manyTies);
    rule.checkPatterns(readStride(argc, argv));
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(Clock::now() - start);
    std::printf("%lld numbers, %lld faults, %lld s %s\n", static_cast<long long>(rule.count),
                static_cast<long long>(rule.faults), static_cast<long long>(seconds.count()),
                rule.lastFault.c_str());
    return rule.faults == 0 ? EXIT_SUCCESS : EXIT_FAILURE;
}
