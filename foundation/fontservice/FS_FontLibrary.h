/// The instance of FreeType that all faces share.
#pragma once

#include "foundation/fontservice/FS_FaceRequest.h"

#include <ft2build.h>
#include FT_FREETYPE_H

#include <memory>
#include <mutex>

namespace MoxFontService_NS {

/// Opens and closes faces, one at a time; reading an open face needs no more than that face.
class FS_FontLibrary {
public:
    /// Returns: the only instance, which lives as long as any face does; null when FreeType can't
    /// be set up.
    static std::shared_ptr<FS_FontLibrary> shared();

    FS_FontLibrary() = default;
    FS_FontLibrary(const FS_FontLibrary&) = delete;
    FS_FontLibrary& operator=(const FS_FontLibrary&) = delete;
    ~FS_FontLibrary();

    /// Returns: the face, which `close` takes back; null for what is no font.
    FT_Face open(const FS_FontSource& source, int faceIndex);
    void close(FT_Face face);

private:
    std::mutex inUse;
    FT_Library library = nullptr; // owned
};

} // namespace MoxFontService_NS
