/// Writes all pages below each other into one document.
#pragma once

#include "tools/convert/PageConfig.h"
#include "tools/convert/PageWriter.h"

namespace DrawmereConvert {

/// The document goes to a file, or to the standard output.
class WholeDocumentWriter : public PageWriter {
public:
    /// Shape: `place`, a directory of its own for the file in progress; empty for the standard
    /// output.
    WholeDocumentWriter(const PageJob& pageJob, const std::string& place);

    PageOutcome write(int page) override;
    PageOutcome finish() override;

private:
    void sayErrors(PageOutcome& outcome);
    void open();
    void drawPage(int page, PageOutcome& outcome);
    void save();
    void saveToOutput();
    void close();

    PageJob job;
    std::string room;
    SVGConfig config;
    DrawmereNS::SVGPageUri uri;
    Drawmere drawmere;
    bool isOpen = false;
    PageSize size; // of what is drawn so far
};

} // namespace DrawmereConvert
