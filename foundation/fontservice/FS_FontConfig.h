/// The configuration of fontconfig, asked for faces by name.
#pragma once

#include "foundation/fontservice/FS_FoundFace.h"

#include <fontconfig/fontconfig.h>

#include <chrono>
#include <optional>
#include <string>
#include <vector>

namespace MoxFontService_NS {

/// A configuration of its own with the fonts it knows, not the one other parts of the program may
/// share and change. One thread at a time.
class FS_FontConfig {
public:
    /// Reads the configuration and the list of fonts. Throws: std::bad_alloc.
    FS_FontConfig();
    FS_FontConfig(const FS_FontConfig&) = delete;
    FS_FontConfig& operator=(const FS_FontConfig&) = delete;
    ~FS_FontConfig();

    /// Returns: the font called `name`, in UTF-8, that is nearest to `wanted`: a family, full or
    /// PostScript name, a generic family of CSS, or an alias.
    std::optional<FS_FoundName> find(const std::string& name, const FS_FaceStyle& wanted) const;

    /// Returns: false when files have changed since.
    bool isUpToDate() const;

    /// Returns: how often to ask whether they have; never is a very long time.
    std::chrono::seconds getRescanInterval() const;

private:
    using Families = std::vector<std::string>;

    std::optional<FS_FoundName> findListed(const char* property, const std::string& name,
                                           const FS_FaceStyle& wanted) const;
    std::optional<FS_FoundName> findAlias(const std::string& name,
                                          const FS_FaceStyle& wanted) const;
    std::optional<FS_FoundName> findGeneric(const std::string& name,
                                            const FS_FaceStyle& wanted) const;
    Families substitute(const Families& families) const;
    Families findDeclared(const std::string& name) const;

    FcConfig* config; // owned
};

} // namespace MoxFontService_NS
