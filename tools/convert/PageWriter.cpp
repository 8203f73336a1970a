#include "tools/convert/PageWriter.h"

#include "tools/convert/FilePageWriter.h"
#include "tools/convert/WholeDocumentWriter.h"

#include <algorithm>

#include <sys/resource.h>

namespace DrawmereConvert {
namespace {

#if defined(__SANITIZE_ADDRESS__)
constexpr bool isSanitized = true; // which sets aside more than any machine has
#else
constexpr bool isSanitized = false;
#endif

/// Bounds what the process can ask for: as much again as the reader of the document may have, and
/// some room for the program itself. What asks for more gets an exception.
void limitMemory(std::size_t readerBytes) {
    constexpr rlim_t room = rlim_t{512} << 20U;
    rlimit limit = {};
    if (isSanitized || readerBytes == 0 || getrlimit(RLIMIT_AS, &limit) != 0) {
        return;
    }
    limit.rlim_cur = std::min(limit.rlim_max, 2 * rlim_t{readerBytes} + room);
    setrlimit(RLIMIT_AS, &limit);
}

} // namespace

std::unique_ptr<PageWriter> makePageWriter(const PageJob& job, int room) {
    limitMemory(job.options.convert.maxMemory);
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
