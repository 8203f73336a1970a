#include "tools/convert/PageWriter.h"

#include "tools/convert/FilePageWriter.h"
#include "tools/convert/WholeDocumentWriter.h"

namespace DrawmereConvert {

std::unique_ptr<PageWriter> makePageWriter(const PageJob& job, int room) {
    if (!job.files) {
        return std::make_unique<WholeDocumentWriter>(job, std::string());
    }
    const std::string place = job.files->makeRoom(room);
    if (job.options.singleFile) {
        return std::make_unique<WholeDocumentWriter>(job, place);
    }
    return std::make_unique<FilePageWriter>(job, place);
}

} // namespace DrawmereConvert
