#include "tools/convert/IndexPage.h"

namespace DrawmereConvert {

std::string makeIndexPage(const std::vector<IndexDocument>& documents) {
    return documents.empty() ? "" : "<!DOCTYPE html>";
}

bool isIndexPage(const std::string& bytes) { return !bytes.empty(); }

} // namespace DrawmereConvert
