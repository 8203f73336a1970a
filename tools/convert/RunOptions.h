/// What a run of the program is asked to do.
#pragma once

#include "SVGConfig.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/PageRanges.h"

#include <cstdint>
#include <string>
#include <vector>

namespace DrawmereConvert {

/// What the program tells its caller at its end.
enum EXITSTATUS : std::int32_t {
    EXITSTATUS_DONE = 0,       ///< every page is written
    EXITSTATUS_INCOMPLETE = 1, ///< some pages failed; the others are written
    EXITSTATUS_USAGE = 2,      ///< the program was called wrongly
    EXITSTATUS_UNREADABLE = 3, ///< nothing could be read
};

/// Whether a page that shows all pages is written.
enum INDEXMODE : std::int32_t {
    INDEXMODE_AUTO = 0, ///< for more than one page
    INDEXMODE_ALWAYS = 1,
    INDEXMODE_NEVER = 2,
};

struct RunOptions {
    std::vector<std::string> inputs;
    std::string output;       ///< as given: empty, "-", a directory or the name of a file
    std::string numberFormat; ///< of page numbers in file names; empty for one that sorts
    std::string password;
    PageRanges pages;
    ConvertOptions convert;

    DrawmereNS::SVGConfig::SVGTYPE profile = DrawmereNS::SVGConfig::SVGTYPE_FULL;
    bool singleFile = false;
    bool keepNumber = false; ///< a single page has its number in its name, too
    bool gzip = false;
    std::string images = "embed-all";
    std::string imageFormat = "auto";
    int dpi = 0; ///< of images that have more; 0 leaves them as they are
    int quality = 80;

    bool smallDevice = false;
    int maxSize = 0;      ///< of a page, in units of 1024 bytes; 0 for no limit
    std::string errorSvg; ///< stands in for a page that is larger

    INDEXMODE index = INDEXMODE_AUTO;
    int jobs = 1;
    double timeout = 60; ///< of a page, in seconds; 0 for no limit
    bool verbose = false;
    bool quiet = false;

    bool writesToOutput() const { return output == "-"; }

    bool isOneDocument() const { return singleFile || writesToOutput(); }
};

} // namespace DrawmereConvert
