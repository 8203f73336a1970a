/// The faces that are open in this process.
#pragma once

#include "foundation/fontservice/FS_Face.h"
#include "foundation/fontservice/FS_LruCache.h"

#include <memory>
#include <mutex>

namespace MoxFontService_NS {

/// Keeps the faces asked for last open, so that the same request gets the same face. It holds a
/// bounded count of faces and of bytes in memory; faces in use stay open beyond that.
/// Safe for threads.
class FS_FaceCache {
public:
    static constexpr std::size_t mostFaces = 32;
    static constexpr std::size_t mostBytes = 64U << 20U;

    /// Returns: the cache of the process.
    static FS_FaceCache& shared();

    /// Returns: the face, opened if need be; null for what can't be read.
    std::shared_ptr<FS_Face> find(const FS_FaceRequest& request);

    /// Forgets all faces; those in use stay open.
    void clear();

    /// Returns: the count of faces kept.
    std::size_t size();

private:
    std::mutex inUse;
    FS_LruCache<std::shared_ptr<FS_Face>> faces{mostFaces, mostBytes};
};

} // namespace MoxFontService_NS
