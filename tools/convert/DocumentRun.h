/// Converts one document of a run.
#pragma once

#include "tools/convert/IndexPage.h"
#include "tools/convert/OutputNames.h"
#include "tools/convert/PageOutcome.h"
#include "tools/convert/PageTargets.h"

#include <map>
#include <string>
#include <vector>

namespace DrawmereConvert {

class InterruptGuard;
class PartialFiles;
class ProgressBar;

/// How far a document came.
enum DOCUMENTSTATE : std::int32_t {
    DOCUMENTSTATE_DONE = 0,
    DOCUMENTSTATE_INCOMPLETE = 1,  ///< some pages failed
    DOCUMENTSTATE_UNREADABLE = 2,  ///< nothing was read
    DOCUMENTSTATE_MISUSE = 3,      ///< what was asked for can't be done
    DOCUMENTSTATE_INTERRUPTED = 4, ///< a signal ends the program
};

/// Which document has made each file of the run, so that none takes another's place.
using FileOwners = std::map<std::string, std::string>;

class DocumentRun {
public:
    /// Borrows: both, for the life of the object.
    DocumentRun(const RunOptions& runOptions, const std::string& path, FileOwners& fileOwners);

    /// Converts the document, and says on the error stream what there is to say.
    DOCUMENTSTATE run();

    /// Returns: what the index shows of the document.
    IndexDocument describe() const;

    /// Returns: the directory of the files, with a slash at its end; once `run` has returned.
    const std::string& getDirectory() const { return directory; }

private:
    void say(const std::string& text) const;
    DOCUMENTSTATE tryReading();
    DOCUMENTSTATE read(int exitStatus);
    bool readOutline();
    DOCUMENTSTATE open();
    DOCUMENTSTATE convert();
    DOCUMENTSTATE checkFiles(const OutputNames& names);
    /// Has an image that is a document stay where it is.
    void linkDocument();
    void nameTargets(const OutputNames& names);
    bool runPool(const OutputNames& names, const PartialFiles* files, const InterruptGuard& guard);
    void take(const PageOutcome& outcome, ProgressBar& bar);
    DOCUMENTSTATE sum() const;
    void sayPage(const PageOutcome& outcome) const;
    std::string describePlace() const;
    IndexEntry describePage(const PageOutcome& outcome) const;
    void saySum(const PageReport& all, std::size_t written) const;

    const RunOptions& options;
    std::string input;
    FileOwners& owners;
    DocumentConverter converter;
    std::string directory;
    std::vector<int> pages;
    PageTargets targets;
    std::vector<OutlineEntry> outline;
    std::map<int, PageOutcome> outcomes; // by page, the document of all at -1
};

} // namespace DrawmereConvert
