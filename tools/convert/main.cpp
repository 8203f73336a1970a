// drawmere-convert: documents in, linked SVG pages out.

#include "tools/convert/CommandLine.h"
#include "tools/convert/ProgramRun.h"

#include <cstdio>
#include <exception>

int main(int argc, char** argv) {
    using namespace DrawmereConvert; // NOLINT(google-build-using-namespace): its own program
    try {
        const CommandLine line = readCommandLine(argc, argv);
        return line.options ? runProgram(*line.options) : line.status;
    } catch (const std::exception& error) {
        std::fprintf(stderr, "drawmere-convert: %s\n", error.what());
        return EXITSTATUS_INCOMPLETE;
    }
}
