/// Runs of random calls in every form that output can have.
#pragma once

#include "tests/support/RandomCalls.h"

#include <sstream>
#include <string>
#include <vector>

namespace DrawmereTest {

/// A run whose options the choices set: to a stream, into one file or into a file a page,
/// compressed or not, with random numbers of pages in the file names.
class RandomRun {
public:
    /// Borrows: `choices`, for the life of the object.
    explicit RandomRun(RandomCalls& choices);

    /// Draws `count` calls at most. Returns: the documents that were written, decompressed.
    std::vector<std::string> draw(int count);

    RandomCalls& calls; // borrowed
    SVGConfig config;
    TempDir output; ///< where the files go, and nothing else
    SVGPageUri uri;
    std::ostringstream stream;
    Drawmere drawmere{&config, &uri};

private:
    std::vector<std::string> listDocuments() const;
};

} // namespace DrawmereTest
