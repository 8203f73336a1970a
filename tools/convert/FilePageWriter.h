/// Writes each page into a file of its own.
#pragma once

#include "tools/convert/PageConfig.h"
#include "tools/convert/PageWriter.h"

namespace DrawmereConvert {

/// Each page is a run of the library of its own, so that its file does not depend on the pages that
/// the same process wrote before, nor does the memory that is used.
class FilePageWriter : public PageWriter {
public:
    /// Shape: `place`, a directory of its own for files in progress.
    FilePageWriter(const PageJob& pageJob, const std::string& place);

    PageOutcome write(int page) override;
    PageOutcome finish() override;

private:
    void drawPage(int page, SVGConfig& config, PageOutcome& outcome);
    void moveFiles(const std::string& pageFile) const;
    void clearRoom() const;

    PageJob job;
    std::string room;
};

} // namespace DrawmereConvert
