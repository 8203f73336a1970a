#include "foundation/fontservice/FS_SystemFonts.h"

#include <string>

namespace MoxFontService_NS {

namespace {

std::string makeKey(const std::string& name, const FS_FaceStyle& wanted) {
    return std::to_string(wanted.weight) + ' ' + std::to_string(wanted.widthClass) +
           (wanted.italic ? " i " : " u ") + name;
}

} // namespace

FS_SystemFonts& FS_SystemFonts::shared() {
    static FS_SystemFonts fonts;
    return fonts;
}

std::optional<FS_FoundName> FS_SystemFonts::find(const UnicodeString& name,
                                                 const FS_FaceStyle& wanted) {
    std::string bytes;
    name.toUTF8String(bytes);
    const std::lock_guard lock(inUse);
    refresh();
    const std::string key = makeKey(bytes, wanted);
    if (const std::optional<FS_FoundName>* known = names.find(key)) {
        return *known;
    }
    std::optional<FS_FoundName> found = config->find(bytes, wanted);
    names.insert(key, found, 1);
    return found;
}

void FS_SystemFonts::refresh() {
    const auto now = std::chrono::steady_clock::now();
    if (config && now - lastCheck < config->getRescanInterval()) {
        return;
    }
    lastCheck = now;
    if (!config || !config->isUpToDate()) {
        config = std::make_unique<FS_FontConfig>();
        names.clear();
    }
}

} // namespace MoxFontService_NS
