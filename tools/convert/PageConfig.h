/// The library's configuration for the options of a run.
#pragma once

#include "tools/convert/PageOutcome.h"
#include "tools/convert/RunOptions.h"

#include <exception>

namespace DrawmereConvert {

using DrawmereNS::SVGConfig;

/// Sets what is the same for every document of a run.
void fillConfig(SVGConfig& config, const RunOptions& options);

/// Takes the library's errors from its queue into the outcome. What they are about is missing in
/// the document, so it is not complete.
void takeErrors(SVGConfig& config, PageOutcome& outcome);

/// Says in the outcome that something of the page is missing, and why. The first reason stays.
void noteFault(PageOutcome& outcome, const std::string& reason);
void noteFault(PageOutcome& outcome, const std::exception& error);

/// Says in the outcome whether the page was given up when its time was over.
void noteLateness(PageOutcome& outcome, bool isLate);

} // namespace DrawmereConvert
