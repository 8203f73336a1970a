/// A run of two pages with everything on them, also for when memory or the disk gives out.
#pragma once

#include "Drawmere.h"
#include "tests/support/TempDir.h"

#include <bitset>
#include <exception>
#include <map>
#include <new>
#include <set>
#include <sstream>
#include <string>
#include <typeinfo>

namespace DrawmereTest {

using namespace DrawmereNS;

/// How a run is configured.
struct RunOptions {
    enum Output { PAGES, SINGLE_FILE, STREAM };

    const char* name;
    SVGConfig::SVGTYPE profile;
    Output output;
    bool gzip = false;
    bool copiesImages = false;
    bool wispMode = false;
    const char16_t* encoding = u"";
};

/// What became of a run.
struct RunOutcome {
    int memoryErrors = 0;                     ///< how many calls threw `std::bad_alloc`
    std::set<int> thrown;                     ///< the codes of the `MoxError`s that calls threw
    std::set<int> queued;                     ///< the codes in the queue at the end
    std::string others;                       ///< what else was thrown; there should be nothing
    bool isFinished = false;                  ///< no call that ends or opens a document threw
    std::map<std::string, std::string> files; ///< all that was written, by name
};

/// Draws the same two pages each time. After a call that throws it goes on with the next, like a
/// caller who makes the best of it, or stops and destroys everything.
class WholeRun {
public:
    /// What has to be there before anything fails.
    WholeRun(const RunOptions& runOptions, bool stopsAtErrors);

    /// Draws, finishes and destroys. Allocates nothing of its own that may not fail.
    /// Borrows: `target`, where a document for a stream goes.
    void draw(std::ostream& target);

    /// Returns: how it went, with the files that were written.
    RunOutcome collect();

private:
    template <typename Action> void step(Action action, bool isEnd = false) {
        if (isStopped) {
            return;
        }
        try {
            action();
            return;
        } catch (const MoxError& error) {
            thrown.set(error.getCode());
        } catch (const std::bad_alloc&) {
            ++memoryErrors;
        } catch (const std::exception& error) {
            otherError = typeid(error).name();
        }
        failedEnds += isEnd ? 1 : 0;
        isStopped = stops;
    }

    void configure(SVGConfig& config) const;
    void drawDocuments(SVGConfig& config, std::ostream& target);
    void openDocument(Drawmere& page, std::ostream& target);
    void drawPage(Drawmere& page, int number);
    void drawShapes(Drawmere& page);
    void drawPaths(Drawmere& page);
    void drawTexts(Drawmere& page);
    void drawEmbeddedTexts(Drawmere& page);
    void drawImages(Drawmere& page);
    void drawDefinitions(Drawmere& page);
    void drawGradients(Drawmere& page);
    void drawLinks(Drawmere& page, int number);
    void takeQueue(SVGConfig& config);

    const RunOptions options;
    const bool stops;
    TempDir directory;
    UnicodeString path;
    UnicodeString base;
    UnicodeString copies;
    bool isStopped = false;
    int memoryErrors = 0;
    int failedEnds = 0;
    bool hasEnded = false;
    const char* otherError = nullptr; // borrowed from the type of the error
    std::bitset<0x10000> thrown;      // by code, as noting one may not allocate
    std::bitset<0x10000> queued;
};

} // namespace DrawmereTest
