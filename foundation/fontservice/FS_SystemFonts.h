/// The fonts that are installed in the system.
#pragma once

#include "foundation/fontservice/FS_FontConfig.h"
#include "foundation/fontservice/FS_FoundFace.h"
#include "foundation/fontservice/FS_LruCache.h"

#include <chrono>
#include <memory>
#include <mutex>
#include <optional>

namespace MoxFontService_NS {

/// Finds fonts by name, and remembers what it found and what it did not. Fonts that are installed
/// or removed while the process runs are seen after the time that the configuration says.
/// Safe for threads.
class FS_SystemFonts {
public:
    static constexpr std::size_t mostNames = 512;

    /// Returns: the fonts of the process.
    static FS_SystemFonts& shared();

    /// Returns: the font called `name` that is nearest to `wanted`; nothing for a name that
    /// neither a font has nor the configuration declares.
    std::optional<FS_FoundName> find(const UnicodeString& name, const FS_FaceStyle& wanted);

private:
    void refresh();

    std::mutex inUse;
    std::unique_ptr<FS_FontConfig> config; // null before the first search
    std::chrono::steady_clock::time_point lastCheck;
    FS_LruCache<std::optional<FS_FoundName>> names{mostNames, mostNames};
};

} // namespace MoxFontService_NS
