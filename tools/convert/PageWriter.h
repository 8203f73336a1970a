/// Writes pages of a document.
#pragma once

#include "tools/convert/OutputNames.h"
#include "tools/convert/PageOutcome.h"
#include "tools/convert/PageTargets.h"
#include "tools/convert/PartialFiles.h"
#include "tools/convert/RunOptions.h"

namespace DrawmereConvert {

/// What writers of one document share, and only read.
struct PageJob {
    const RunOptions& options;
    DocumentConverter& converter;
    const PageTargets& targets;
    const OutputNames& names;
    const PartialFiles* files; // null when nothing goes to files
    bool isSinglePage;         ///< only one page of the document is converted
};

/// Lives in a process of its own, whose end it need not survive.
class PageWriter {
public:
    virtual ~PageWriter() = default;

    /// Converts a page, counted from 0. What goes wrong is in the outcome.
    virtual PageOutcome write(int page) = 0;

    /// Ends the document when all pages share one.
    virtual PageOutcome finish() = 0;
};

/// Returns: a writer of one file a page, or of one document of all.
/// Shape: `room`, a number that no other writer of the run has.
std::unique_ptr<PageWriter> makePageWriter(const PageJob& job, int room);

} // namespace DrawmereConvert
