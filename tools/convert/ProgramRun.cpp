#include "tools/convert/ProgramRun.h"

#include "tools/convert/DocumentRun.h"
#include "tools/convert/InterruptGuard.h"
#include "tools/convert/PartialFiles.h"

#include <array>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <stdexcept>

namespace DrawmereConvert {
namespace {

constexpr const char* indexName = "index.html";

/// The documents of a run, one after the other.
class ProgramRun {
public:
    explicit ProgramRun(const RunOptions& runOptions) : options(runOptions) {}

    int run() {
        for (const std::string& input : options.inputs) {
            convert(input);
        }
        if (!isIndexWritten()) {
            ++states.at(DOCUMENTSTATE_INCOMPLETE);
        }
        return getStatus();
    }

private:
    void convert(const std::string& input) {
        DocumentRun document(options, input, owners);
        const DOCUMENTSTATE state = document.run();
        ++states.at(static_cast<std::size_t>(state));
        if (state != DOCUMENTSTATE_DONE && state != DOCUMENTSTATE_INCOMPLETE) {
            return;
        }
        if (options.index != INDEXMODE_NEVER && !options.isOneDocument()) {
            directory = document.getDirectory();
            documents.push_back(document.describe());
        }
    }

    bool wantsIndex() const {
        std::size_t count = 0;
        for (const IndexDocument& document : documents) {
            count += document.entries.size();
        }
        return options.index == INDEXMODE_ALWAYS ? count > 0 : count > 1;
    }

    /// Returns: false when the index is wanted and can't be written.
    bool isIndexWritten() const {
        if (!wantsIndex()) {
            return true;
        }
        const std::string path = directory + indexName;
        if (!mayReplace(path)) {
            std::fprintf(stderr, "%s: it is not replaced, for it is not a page of this program\n",
                         path.c_str());
            return false;
        }
        if (!write()) {
            std::fprintf(stderr, "%s: it can't be written\n", path.c_str());
            return false;
        }
        return true;
    }

    static bool mayReplace(const std::string& path) {
        std::error_code failure;
        if (!std::filesystem::exists(path, failure)) {
            return true;
        }
        std::ifstream file(path, std::ios::binary);
        std::string beginning(1000, '\0');
        file.read(beginning.data(), static_cast<std::streamsize>(beginning.size()));
        return isIndexPage(beginning);
    }

    /// Returns: false when the file system refuses.
    bool write() const {
        const InterruptGuard guard; // outlives the file in progress
        try {
            const PartialFiles files(directory);
            const std::string partial = files.makeRoom(0) + indexName;
            std::ofstream file(partial, std::ios::binary);
            file << makeIndexPage(documents);
            file.close();
            if (file) {
                files.moveOut(partial, indexName);
            }
            return static_cast<bool>(file);
        } catch (const std::runtime_error&) {
            return false;
        }
    }

    int getStatus() const {
        if (states.at(DOCUMENTSTATE_MISUSE) > 0) {
            return EXITSTATUS_USAGE;
        }
        const int unreadable = states.at(DOCUMENTSTATE_UNREADABLE);
        if (unreadable == static_cast<int>(options.inputs.size())) {
            return EXITSTATUS_UNREADABLE;
        }
        const bool isDone = unreadable == 0 && states.at(DOCUMENTSTATE_INCOMPLETE) == 0;
        return isDone ? EXITSTATUS_DONE : EXITSTATUS_INCOMPLETE;
    }

    const RunOptions& options;
    FileOwners owners;
    std::array<int, 5> states{}; // how many documents ended in each
    std::string directory;
    std::vector<IndexDocument> documents;
};

} // namespace

int runProgram(const RunOptions& options) { return ProgramRun(options).run(); }

} // namespace DrawmereConvert
