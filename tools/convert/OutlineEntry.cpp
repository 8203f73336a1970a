#include "tools/convert/OutlineEntry.h"

#include <sstream>

namespace DrawmereConvert {

// Each entry: two numbers, a blank, the title and a null, which is in no title.
std::string packOutline(const std::vector<OutlineEntry>& outline) {
    std::string bytes;
    for (const OutlineEntry& entry : outline) {
        bytes += std::to_string(entry.page) + " " + std::to_string(entry.level) + " " +
                 entry.title.c_str() + '\0';
    }
    return bytes;
}

std::vector<OutlineEntry> unpackOutline(const std::string& bytes) {
    std::istringstream stream(bytes);
    std::vector<OutlineEntry> outline;
    OutlineEntry entry;
    while (stream >> entry.page >> entry.level && stream.get() &&
           std::getline(stream, entry.title, '\0')) {
        outline.push_back(entry);
    }
    return outline;
}

} // namespace DrawmereConvert
