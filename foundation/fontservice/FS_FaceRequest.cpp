#include "foundation/fontservice/FS_FaceRequest.h"

#include <sys/stat.h>

namespace MoxFontService_NS {

std::string FS_FontSource::makeIdentity() const {
    if (bytes) {
        return "bytes " + std::to_string(reinterpret_cast<std::uintptr_t>(bytes.get()));
    }
    struct stat file = {};
    if (stat(path.c_str(), &file) != 0 || !S_ISREG(file.st_mode)) {
        return {}; // reading a pipe or a device might never end
    }
    return "file " + std::to_string(file.st_dev) + ' ' + std::to_string(file.st_ino) + ' ' +
           std::to_string(file.st_size) + ' ' + std::to_string(file.st_mtim.tv_sec) + ' ' +
           std::to_string(file.st_mtim.tv_nsec) + ' ' + path;
}

} // namespace MoxFontService_NS
