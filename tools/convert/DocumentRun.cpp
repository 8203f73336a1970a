#include "tools/convert/DocumentRun.h"

#include "tools/convert/ChildCall.h"
#include "tools/convert/InterruptGuard.h"
#include "tools/convert/JobPool.h"
#include "tools/convert/LastWords.h"
#include "tools/convert/PageWriter.h"
#include "tools/convert/ProgressBar.h"

#include <algorithm>
#include <cstdio>
#include <filesystem>

namespace DrawmereConvert {
namespace {

namespace fs = std::filesystem;

constexpr int wholeDocument = -1;
constexpr double patience = 2; // with a process that is to end itself

bool isSameFile(const std::string& one, const std::string& other) {
    std::error_code failure;
    return fs::equivalent(one, other, failure);
}

std::string describeApproximations(const PageReport& report) {
    std::string text;
    for (int kind = 0; kind < APPROXIMATION_COUNT; ++kind) {
        const int count = report.approximations.at(static_cast<std::size_t>(kind));
        if (count > 0) {
            text += (text.empty() ? "" : ", ") +
                    describeApproximation(static_cast<APPROXIMATION>(kind), count);
        }
    }
    return text;
}

} // namespace

DocumentRun::DocumentRun(const RunOptions& runOptions, const std::string& path,
                         FileOwners& fileOwners)
    : options(runOptions), input(path), owners(fileOwners), converter(runOptions.convert) {}

void DocumentRun::say(const std::string& text) const {
    std::fprintf(stderr, "%s: %s\n", input.c_str(), text.c_str());
}

DOCUMENTSTATE DocumentRun::run() {
    DOCUMENTSTATE state = tryReading();
    if (state == DOCUMENTSTATE_DONE) {
        state = read(EXITSTATUS_UNREADABLE);
    }
    if (state == DOCUMENTSTATE_DONE) {
        state = convert();
    }
    const bool hasPages = state == DOCUMENTSTATE_DONE || state == DOCUMENTSTATE_INCOMPLETE;
    const bool wantsOutline = options.index != INDEXMODE_NEVER && !options.isOneDocument();
    return hasPages && wantsOutline && !readOutline() ? DOCUMENTSTATE_INCOMPLETE : state;
}

/// Reads the document in another process first, when there are others that this one is to survive
/// for.
DOCUMENTSTATE DocumentRun::tryReading() {
    if (options.inputs.size() == 1) {
        return DOCUMENTSTATE_DONE;
    }
    const ChildResult result = callApart(
        [this] { return std::string(1, static_cast<char>(read(1))); }, options.timeout * patience);
    if (!result.reason.empty()) {
        say(result.reason);
    }
    return result.isDone ? static_cast<DOCUMENTSTATE>(result.bytes.front())
                         : DOCUMENTSTATE_UNREADABLE;
}

DOCUMENTSTATE DocumentRun::read(int exitStatus) {
    const LastWords words(input + ": it takes too long to read the document\n",
                          input + ": the reader of the document broke off\n", options.timeout,
                          exitStatus);
    const DOCUMENTSTATE opened = open();
    if (opened == DOCUMENTSTATE_DONE) {
        converter.findDestinations(targets);
    }
    return opened;
}

/// Returns: false when there is an outline that can't be read.
bool DocumentRun::readOutline() {
    const ChildResult result =
        callApart([this] { return packOutline(converter.getOutline()); }, options.timeout);
    outline = unpackOutline(result.bytes);
    if (!result.isDone) {
        say("its outline can't be read");
    }
    return result.isDone;
}

DOCUMENTSTATE DocumentRun::open() {
    try {
        converter.open(input, options.password);
    } catch (const std::exception& error) {
        say(error.what());
        return DOCUMENTSTATE_UNREADABLE;
    }
    const int count = converter.getPageCount();
    pages = options.pages.select(count);
    if (pages.empty()) {
        say("none of the pages asked for is among its " + std::to_string(count));
        return DOCUMENTSTATE_MISUSE;
    }
    const OutputNames names(options, input, count);
    directory = names.getDirectory();
    if (options.images == "link") {
        linkDocument();
    }
    targets.singleFile = options.isOneDocument();
    nameTargets(names);
    return options.writesToOutput() ? DOCUMENTSTATE_DONE : checkFiles(names);
}

void DocumentRun::linkDocument() {
    std::error_code isElsewhere;
    const fs::path place = directory.empty() ? "." : directory;
    const fs::path path = fs::relative(input, place, isElsewhere);
    converter.link(input, OutputNames::toReference(path.empty() ? input : path.string()));
}

void DocumentRun::nameTargets(const OutputNames& names) {
    targets.files.resize(static_cast<std::size_t>(converter.getPageCount()));
    for (const int page : pages) {
        targets.files.at(static_cast<std::size_t>(page)) = UnicodeString::fromUTF8(
            OutputNames::toReference(names.getPageFile(page, pages.size() == 1)));
    }
}

DOCUMENTSTATE DocumentRun::checkFiles(const OutputNames& names) {
    for (const int page : pages) {
        const std::string file = names.getDirectory() +
                                 (options.singleFile ? names.getWholeFile()
                                                     : names.getPageFile(page, pages.size() == 1));
        for (const std::string& other : options.inputs) {
            if (isSameFile(file, other)) {
                say(file + " would take the place of a document that is converted");
                return DOCUMENTSTATE_MISUSE;
            }
        }
        const std::string& owner = owners.emplace(file, input).first->second;
        if (owner != input) {
            say(std::string(file).append(" would take the place of a page of ").append(owner));
            return DOCUMENTSTATE_MISUSE;
        }
    }
    return DOCUMENTSTATE_DONE;
}

DOCUMENTSTATE DocumentRun::convert() {
    const OutputNames names(options, input, converter.getPageCount());
    const InterruptGuard guard; // outlives the files in progress, so they are gone before it ends
    try {
        std::unique_ptr<PartialFiles> files;
        if (!options.writesToOutput()) {
            files = std::make_unique<PartialFiles>(names.getDirectory());
        }
        if (!runPool(names, files.get(), guard)) {
            return DOCUMENTSTATE_INTERRUPTED;
        }
    } catch (const fs::filesystem_error& error) {
        say(error.path1().string() + ": " + error.code().message());
        return DOCUMENTSTATE_MISUSE;
    }
    return sum();
}

bool DocumentRun::runPool(const OutputNames& names, const PartialFiles* files,
                          const InterruptGuard& guard) {
    const PageJob job = {options, converter, targets, names, files, pages.size() == 1};
    ProgressBar bar(input, static_cast<int>(pages.size()), !options.quiet);
    PoolTask task;
    task.pages = pages;
    task.isOneDocument = options.isOneDocument();
    task.jobs = options.jobs;
    task.timeout = options.timeout;
    task.makeWriter = [&job](int room) { return makePageWriter(job, room); };
    task.take = [this, &bar](const PageOutcome& outcome) { take(outcome, bar); };
    return JobPool(task, guard).run();
}

void DocumentRun::take(const PageOutcome& outcome, ProgressBar& bar) {
    PageOutcome& kept = outcomes[outcome.page];
    kept = outcome;
    if (options.index == INDEXMODE_NEVER) {
        kept.report.links.clear();
    }
    if (outcome.page != wholeDocument) {
        bar.advance();
    }
}

DOCUMENTSTATE DocumentRun::sum() const {
    PageReport all;
    std::size_t written = 0;
    bool isUnreadable = true;
    for (const auto& [page, outcome] : outcomes) {
        sayPage(outcome);
        all.add(outcome.report);
        written += outcome.isWritten && page != wholeDocument ? 1 : 0;
        isUnreadable = isUnreadable && (outcome.isUnreadable || page == wholeDocument);
    }
    const auto whole = outcomes.find(wholeDocument);
    if (whole != outcomes.end() && !whole->second.isWritten) {
        written = 0;
    }
    if (isUnreadable) {
        return DOCUMENTSTATE_UNREADABLE;
    }
    if (!options.quiet) {
        saySum(all, written);
    }
    const bool isDone = all.isComplete && written == pages.size();
    return isDone ? DOCUMENTSTATE_DONE : DOCUMENTSTATE_INCOMPLETE;
}

void DocumentRun::sayPage(const PageOutcome& outcome) const {
    const std::string place =
        outcome.page == wholeDocument ? "" : "page " + std::to_string(outcome.page + 1) + ": ";
    if (outcome.isLate) {
        say(place + (outcome.isWritten ? "its time was over before all of it was drawn"
                                       : "given up, for its time was over"));
    } else if (!outcome.error.empty()) {
        say(place + outcome.error);
    } else if (!outcome.report.isComplete) {
        say(place + "not all of it can be read");
    }
    if (options.verbose && outcome.report.countApproximations() > 0) {
        say(place + describeApproximations(outcome.report));
    }
    if (options.verbose || (!outcome.report.isComplete && !options.quiet)) {
        for (const std::string& message : outcome.report.messages) {
            say(place + message);
        }
    }
}

/// Returns: the file when there is one, else the directory, as a reader would write it.
std::string DocumentRun::describePlace() const {
    const OutputNames names(options, input, converter.getPageCount());
    std::string file;
    if (options.singleFile) {
        file = names.getWholeFile();
    } else if (pages.size() == 1) {
        file = names.getPageFile(pages.front(), true);
    }
    const std::string place = directory.starts_with("./") ? directory.substr(2) : directory;
    return place.empty() && file.empty() ? "./" : place + file;
}

void DocumentRun::saySum(const PageReport& all, std::size_t written) const {
    std::string text = std::to_string(written) + (written == 1 ? " page" : " pages") + " written";
    if (!options.writesToOutput()) {
        text += " to " + describePlace();
    }
    if (written < pages.size()) {
        text += ", " + std::to_string(pages.size() - written) + " failed";
    }
    const std::string approximations = describeApproximations(all);
    say(text + (approximations.empty() ? "" : "; " + approximations));
}

IndexDocument DocumentRun::describe() const {
    IndexDocument document;
    document.title = converter.getTitle();
    if (document.title.empty()) {
        document.title = fs::path(input).stem().string();
    }
    document.language = converter.getLanguage();
    document.outline = outline;
    for (const auto& [page, outcome] : outcomes) {
        if (outcome.isWritten) {
            document.entries.push_back(describePage(outcome));
        }
    }
    return document;
}

IndexEntry DocumentRun::describePage(const PageOutcome& outcome) const {
    const auto page = static_cast<std::size_t>(outcome.page);
    IndexEntry entry;
    entry.page = outcome.page;
    entry.size = outcome.size;
    entry.links = outcome.report.links;
    targets.files.at(page).toUTF8String(entry.file);
    for (const LinkDestination& destination : targets.destinations.at(page)) {
        std::string id;
        entry.anchors.push_back({destination.id.toUTF8String(id), destination.y});
    }
    return entry;
}

} // namespace DrawmereConvert
