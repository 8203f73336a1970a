// Writes documents of random calls, as the public header allows them, into a directory. The first
// letter of a name is that of the profile in docs/output.md.
// Usage: docs_random_documents DIRECTORY
#include "tests/support/RandomRun.h"

#include <cstdio>

using namespace DrawmereTest;

namespace {

struct Profile {
    char letter;
    SVGConfig::SVGTYPE number;
};

constexpr Profile profiles[] = {
    {'F', SVGConfig::SVGTYPE_FULL},
    {'B', SVGConfig::SVGTYPE_BASIC},
    {'T', SVGConfig::SVGTYPE_TINY},
    {'P', SVGConfig::SVGTYPE_PLAZMIC},
};
constexpr unsigned seedCount = 100;
constexpr int callCount = 150;

void write(const Profile& profile, unsigned seed, const std::string& directory) {
    RandomCalls calls(seed, RandomCalls::ORDERLY);
    RandomRun run(calls);
    run.config.svgType = profile.number;
    run.config.wispMode = false;
    int number = 0;
    for (const std::string& document : run.draw(callCount)) {
        std::ostringstream path;
        path << directory << '/' << profile.letter << seed << '-' << ++number << ".svg";
        std::ofstream(path.str()) << document;
    }
}

} // namespace

int main(int argc, char** argv) {
    try {
        for (const Profile& profile : profiles) {
            for (unsigned seed = 0; argc == 2 && seed < seedCount; ++seed) {
                write(profile, seed, argv[1]);
            }
        }
    } catch (const std::exception& error) {
        std::fprintf(stderr, "docs_random_documents: %s\n", error.what());
        return 1;
    }
}
