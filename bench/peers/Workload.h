/// The work that every SVG writer of the table does.
#pragma once

#include "bench/peers/Pen.h"

#include <cstddef>
#include <string>
#include <vector>

namespace DrawmereNS {

/// What a workload is made of.
struct WorkloadInput {
    std::size_t divisor = 1;         ///< of all counts, to try things out
    std::vector<std::string> images; ///< paths of PNG files
};

/// Draws the workload `name`; its numbers are made as it goes, and are the same for every writer.
/// Returns: false when there is none of this name.
bool drawWorkload(const std::string& name, Pen& pen, const WorkloadInput& input);

} // namespace DrawmereNS
