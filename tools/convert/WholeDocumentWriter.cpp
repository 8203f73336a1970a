#include "tools/convert/WholeDocumentWriter.h"

#include "tools/convert/Watchdog.h"

#include <algorithm>
#include <filesystem>
#include <iostream>
#include <stdexcept>

namespace DrawmereConvert {
namespace {

constexpr float gap = 12; // points between pages

MoxCommonNS::MoxLength toLength(float points) {
    return MoxCommonNS::MoxLength(points, MoxCommonNS::MOXUNIT_POINT);
}

} // namespace

WholeDocumentWriter::WholeDocumentWriter(const PageJob& pageJob, const std::string& place)
    : job(pageJob), room(place),
      uri(UnicodeString::fromUTF8(room + PartialFiles::nameInside(job.names.getWholeFile()))),
      drawmere(&config, &uri) {
    fillConfig(config, job.options);
    config.singleFile = true;
    config.streamOutput = room.empty();
    config.svgOutputUri = uri.getText();
    config.copyNamePrefix =
        UnicodeString::fromUTF8(PartialFiles::nameInside(job.names.getPageStem(0, true) + "-"));
}

PageOutcome WholeDocumentWriter::write(int page) {
    PageOutcome outcome;
    outcome.page = page;
    try {
        open();
        const Watchdog watchdog(job.converter, job.options.timeout);
        drawPage(page, outcome);
        outcome.isWritten = true;
        noteLateness(outcome, watchdog.hasBarked());
    } catch (const ConvertError& error) {
        outcome.isUnreadable = true;
        noteFault(outcome, error);
    } catch (const std::exception& error) {
        noteFault(outcome, error);
    }
    sayErrors(outcome);
    return outcome;
}

void WholeDocumentWriter::sayErrors(PageOutcome& outcome) {
    takeErrors(config, outcome);
    if (job.files) {
        outcome.error = job.files->nameOutside(outcome.error, room);
    }
}

void WholeDocumentWriter::open() {
    if (isOpen) {
        return;
    }
    if (room.empty()) {
        drawmere.initRootSvg(&std::cout);
    } else {
        drawmere.initRootSvg(uri.getText());
    }
    isOpen = true;
}

void WholeDocumentWriter::drawPage(int page, PageOutcome& outcome) {
    outcome.size = job.converter.loadPage(page);
    PagePlace place;
    place.number = page + 1;
    place.isSingle = false;
    place.offset = size.height > 0 ? size.height + gap : 0;
    outcome.report = job.converter.drawPage(place, job.targets, drawmere);
    size.width = std::max(size.width, outcome.size.width);
    size.height = place.offset + outcome.size.height;
}

PageOutcome WholeDocumentWriter::finish() {
    PageOutcome outcome;
    outcome.page = -1;
    try {
        save();
        outcome.isWritten = true;
    } catch (const std::exception& error) {
        noteFault(outcome, error);
    }
    sayErrors(outcome);
    return outcome;
}

void WholeDocumentWriter::save() {
    if (room.empty()) {
        saveToOutput();
        return;
    }
    close();
    for (const auto& entry : std::filesystem::directory_iterator(room)) {
        const std::string name = entry.path().filename().string();
        const bool isDocument = name == PartialFiles::nameInside(job.names.getWholeFile());
        job.files->moveOut(room + name, isDocument ? job.names.getWholeFile() : name);
    }
}

void WholeDocumentWriter::saveToOutput() {
    try {
        close();
    } catch (const MoxCommonNS::MoxError&) {
        // The library tells a stream that fails by its path, and this one has none.
        if (std::cout) {
            throw;
        }
    }
    if (!std::cout.flush()) {
        throw std::runtime_error("the standard output takes no more");
    }
}

void WholeDocumentWriter::close() {
    drawmere.setCanvasSize(toLength(size.width), toLength(size.height));
    drawmere.finishRootSvg();
    drawmere.finish();
}

} // namespace DrawmereConvert
