// One SVG writer at one workload: draw-WRITER WORKLOAD DIVISOR DIRECTORY [IMAGE...] writes its
// documents into the directory and prints the seconds it took, those of the processor, and the most
// kilobytes of memory that the process has had.
#include "bench/Contest.h"
#include "bench/ResidentMemory.h"
#include "bench/peers/Workload.h"

#include <cstdio>
#include <cstdlib>
#include <iterator>

namespace DrawmereNS {
namespace {

int run(const std::vector<std::string>& words) {
    constexpr std::size_t kilobyte = 1024;
    constexpr std::size_t fixedWords = 3;
    if (words.size() < fixedWords) {
        std::fprintf(stderr, "usage: WORKLOAD DIVISOR DIRECTORY [IMAGE...]\n");
        return 2;
    }
    WorkloadInput input;
    input.divisor = std::strtoul(words[1].c_str(), nullptr, 10);
    input.images.assign(words.begin() + fixedWords, words.end());
    if (input.divisor == 0) {
        std::fprintf(stderr, "the divisor is no number above 0\n");
        return 2;
    }
    const std::unique_ptr<Pen> pen = makePen(words[2]);
    const Stopwatch watch;
    if (!drawWorkload(words[0], *pen, input)) {
        std::fprintf(stderr, "no workload %s\n", words[0].c_str());
        return 2;
    }
    pen->finishRun();
    const ContestTime time = watch.getTime();
    std::printf("%.6f %.6f %zu\n", time.wall, time.cpu, countPeakBytes() / kilobyte);
    return 0;
}

} // namespace
} // namespace DrawmereNS

int main(int argc, char** argv) {
    return DrawmereNS::run(std::vector<std::string>(argv + 1, argv + argc));
}
