/// Compiled in front of an example, so that its text runs unchanged in every output profile.
#pragma once

#include "Drawmere.h"

#include <cstdlib>
#include <string>

namespace DrawmereNS {

/// A configuration whose defaults come from the environment: the number of a profile, and switches
/// that are set when they are there. What the example itself sets goes before them.
class ProfileConfig : public SVGConfig {
public:
    ProfileConfig() {
        const char* profile = std::getenv("EXAMPLE_PROFILE");
        svgType = static_cast<SVGTYPE>(profile ? std::stoi(profile) : 0);
        wispMode = std::getenv("EXAMPLE_WISP_MODE") != nullptr;
        gzip = std::getenv("EXAMPLE_GZIP") != nullptr;
        adjustConfig();
    }
};

} // namespace DrawmereNS

// The examples write `SVGConfig config;` and know nothing of this.
#define SVGConfig ProfileConfig // NOLINT(cppcoreguidelines-macro-usage)
