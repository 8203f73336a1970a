#include "tools/convert/PageConfig.h"

#include <new>

namespace DrawmereConvert {

using MoxCommonNS::MoxName;

namespace {

/// Returns: the library's word for what happens to images. Those inside a document lie in no file
/// that a page could be linked to, so they are embedded then.
MoxName findImageWord(const std::string& word) {
    return MoxName(UnicodeString::fromUTF8(word == "link" ? "embed-all" : word));
}

} // namespace

void fillConfig(SVGConfig& config, const RunOptions& options) {
    config.svgType = options.profile;
    config.gzip = options.gzip;
    config.saveOption = u"decimals=3";
    config.setImageProcessingType(findImageWord(options.images));
    config.setImageConversion(MoxName(UnicodeString::fromUTF8(options.imageFormat)));
    config.downsampleDpi = options.dpi;
    config.jpegQuality = options.quality;
    config.wispMode = options.smallDevice;
    if (options.maxSize > 0) {
        config.wispOptions = UnicodeString::fromUTF8("maxsize=" + std::to_string(options.maxSize) +
                                                     ",errorsvg=" + options.errorSvg);
    }
    config.adjustConfig();
}

void takeErrors(SVGConfig& config, PageOutcome& outcome) {
    for (const MoxCommonNS::MoxError& error : config.errors) {
        std::string text;
        noteFault(outcome, error.getMessage().toUTF8String(text));
    }
    config.clearError();
}

void noteFault(PageOutcome& outcome, const std::string& reason) {
    outcome.report.isComplete = false;
    if (outcome.error.empty()) {
        outcome.error = reason;
    }
}

void noteFault(PageOutcome& outcome, const std::exception& error) {
    const bool isForMemory = dynamic_cast<const std::bad_alloc*>(&error) != nullptr;
    noteFault(outcome, isForMemory ? std::string("it takes more memory than it may have")
                                   : std::string(error.what()));
}

void noteLateness(PageOutcome& outcome, bool isLate) {
    outcome.isLate = isLate;
    outcome.report.isComplete = outcome.report.isComplete && !isLate;
}

} // namespace DrawmereConvert
