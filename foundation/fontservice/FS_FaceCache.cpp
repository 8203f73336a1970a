#include "foundation/fontservice/FS_FaceCache.h"

#include <string>

namespace MoxFontService_NS {

namespace {

// All that a face depends on.
std::string makeKey(const FS_FaceRequest& request) {
    std::string key = request.source.makeIdentity();
    if (key.empty()) {
        return key;
    }
    key += '\n' + std::to_string(request.faceIndex);
    if (request.axes) {
        key += ' ' + std::to_string(request.axes->weight) + ' ' +
               std::to_string(request.axes->widthClass) + (request.axes->italic ? " i" : " u");
    }
    return key;
}

} // namespace

FS_FaceCache& FS_FaceCache::shared() {
    static FS_FaceCache cache;
    return cache;
}

std::shared_ptr<FS_Face> FS_FaceCache::find(const FS_FaceRequest& request) {
    const std::string key = makeKey(request);
    if (key.empty()) {
        return nullptr;
    }
    const std::lock_guard lock(inUse);
    if (const std::shared_ptr<FS_Face>* known = faces.find(key)) {
        return *known;
    }
    std::shared_ptr<FS_Face> opened = FS_Face::open(request);
    if (opened) {
        faces.insert(key, opened, request.source.bytes ? request.source.bytes->size() : 0);
    }
    return opened;
}

void FS_FaceCache::clear() {
    const std::lock_guard lock(inUse);
    faces.clear();
}

std::size_t FS_FaceCache::size() {
    const std::lock_guard lock(inUse);
    return faces.size();
}

} // namespace MoxFontService_NS
