#include "tools/convert/FilePageWriter.h"

#include "tools/convert/Watchdog.h"

#include <filesystem>

namespace DrawmereConvert {

namespace fs = std::filesystem;
using DrawmereNS::SVGPageUri;

FilePageWriter::FilePageWriter(const PageJob& pageJob, const std::string& place)
    : job(pageJob), room(place) {}

PageOutcome FilePageWriter::write(int page) {
    PageOutcome outcome;
    outcome.page = page;
    SVGConfig config;
    fillConfig(config, job.options);
    try {
        const Watchdog watchdog(job.converter, job.options.timeout);
        drawPage(page, config, outcome);
        const std::string file = job.names.getPageFile(page, job.isSinglePage);
        config.checkMaxFileSize(UnicodeString::fromUTF8(room + PartialFiles::nameInside(file)),
                                page + 1);
        moveFiles(file);
        outcome.isWritten = true;
        noteLateness(outcome, watchdog.hasBarked());
    } catch (const ConvertError& error) {
        outcome.isUnreadable = true;
        noteFault(outcome, error);
    } catch (const std::exception& error) {
        noteFault(outcome, error);
        clearRoom();
    }
    takeErrors(config, outcome);
    outcome.error = job.files->nameOutside(outcome.error, room);
    return outcome;
}

void FilePageWriter::drawPage(int page, SVGConfig& config, PageOutcome& outcome) {
    config.streamOutput = false;
    config.keepPageNumber = !job.isSinglePage || job.options.keepNumber;
    const auto inside = [](const std::string& name) {
        return UnicodeString::fromUTF8(PartialFiles::nameInside(name));
    };
    const UnicodeString start = UnicodeString::fromUTF8(room);
    config.svgOutputUri = start + inside(job.names.getPageFile(page, job.isSinglePage));
    config.copyNamePrefix = inside(job.names.getPageStem(page, job.isSinglePage) + "-");
    SVGPageUri uri(start + inside(job.names.getWholeFile()), inside(job.names.getNumberFormat()));
    Drawmere drawmere(&config, &uri);
    outcome.size = job.converter.loadPage(page);
    drawmere.initRootSvg(config.svgOutputUri);
    PagePlace place;
    place.number = page + 1;
    outcome.report = job.converter.drawPage(place, job.targets, drawmere);
    drawmere.finishRootSvg();
    drawmere.finish();
}

// Images first: once the page is there, all that it refers to is.
void FilePageWriter::moveFiles(const std::string& pageFile) const {
    std::vector<std::string> others;
    for (const fs::directory_entry& entry : fs::directory_iterator(room)) {
        const std::string name = entry.path().filename().string();
        if (name != PartialFiles::nameInside(pageFile)) {
            others.push_back(name);
        }
    }
    for (const std::string& name : others) {
        job.files->moveOut(room + name, name);
    }
    job.files->moveOut(room + PartialFiles::nameInside(pageFile), pageFile);
}

void FilePageWriter::clearRoom() const {
    std::error_code ignored;
    for (const fs::directory_entry& entry : fs::directory_iterator(room, ignored)) {
        fs::remove(entry.path(), ignored);
    }
}

PageOutcome FilePageWriter::finish() { return {}; }

} // namespace DrawmereConvert
