#include "foundation/fontservice/FS_FontLibrary.h"

#include <algorithm>
#include <fstream>
#include <string_view>

namespace MoxFontService_NS {

namespace {

// A compressed font may unpack to no more than this.
constexpr std::uint32_t mostUnpackedBytes = 64U << 20U;

// The beginning of a font up to the size that a WOFF or WOFF 2 header states for the unpacked one.
constexpr std::size_t headSize = 20;

std::string readHead(const FS_FontSource& source) {
    if (source.bytes) {
        return source.bytes->substr(0, headSize);
    }
    std::string head(headSize, '\0');
    std::ifstream file(source.path, std::ios::binary);
    file.read(head.data(), headSize);
    head.resize(static_cast<std::size_t>(file.gcount()));
    return head;
}

bool unpacksTooFar(const std::string& head) {
    const bool packed = head.starts_with("wOFF") || head.starts_with("wOF2");
    if (!packed || head.size() < headSize) {
        return packed;
    }
    std::uint32_t size = 0;
    for (const char byte : head.substr(headSize - 4)) {
        size = size << 8U | static_cast<unsigned char>(byte);
    }
    return size > mostUnpackedBytes;
}

} // namespace

std::shared_ptr<FS_FontLibrary> FS_FontLibrary::shared() {
    static const std::shared_ptr<FS_FontLibrary> instance = [] {
        auto made = std::make_shared<FS_FontLibrary>();
        return FT_Init_FreeType(&made->library) == 0 ? made : nullptr;
    }();
    return instance;
}

FS_FontLibrary::~FS_FontLibrary() {
    if (library) {
        FT_Done_FreeType(library);
    }
}

FT_Face FS_FontLibrary::open(const FS_FontSource& source, int faceIndex) {
    if (unpacksTooFar(readHead(source))) {
        return nullptr;
    }
    const std::lock_guard lock(inUse);
    FT_Face face = nullptr;
    FT_Error error = 0;
    if (source.bytes) {
        const auto* bytes = reinterpret_cast<const FT_Byte*>(source.bytes->data());
        error = FT_New_Memory_Face(library, bytes, static_cast<FT_Long>(source.bytes->size()),
                                   faceIndex, &face);
    } else {
        error = FT_New_Face(library, source.path.c_str(), faceIndex, &face);
    }
    return error == 0 ? face : nullptr;
}

void FS_FontLibrary::close(FT_Face face) {
    const std::lock_guard lock(inUse);
    FT_Done_Face(face);
}

} // namespace MoxFontService_NS
