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
    /// Returns: the only instance, which lives as long as any face does; never null.
    /// Throws: std::bad_alloc.
    static std::shared_ptr<FS_FontLibrary> shared();

    /// Throws: std::bad_alloc.
    FS_FontLibrary();
    FS_FontLibrary(const FS_FontLibrary&) = delete;
    FS_FontLibrary& operator=(const FS_FontLibrary&) = delete;
    ~FS_FontLibrary();

    /// Throws: std::bad_alloc when FreeType has lacked memory on this thread since `expectMemory`,
    /// whatever it made of that.
    static void requireMemory();
    static void expectMemory();

    /// Returns: the face, which `close` takes back; null for what is no font.
    /// Throws: std::bad_alloc.
    FT_Face open(const FS_FontSource& source, int faceIndex);
    void close(FT_Face face);

private:
    std::mutex inUse;
    FT_MemoryRec_ memory;
    FT_Library library = nullptr; // owned
};

} // namespace MoxFontService_NS
