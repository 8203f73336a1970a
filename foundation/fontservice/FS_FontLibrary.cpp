#include "foundation/fontservice/FS_FontLibrary.h"

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <new>
#include <string_view>

#include FT_MODULE_H

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

// FreeType has many names for a failure that comes of a lack of memory, and goes on where it can.
thread_local bool hasLackedMemory = false;

void* noted(void* block) {
    hasLackedMemory = hasLackedMemory || !block;
    return block;
}

void* allocate(FT_Memory /*memory*/, long size) { return noted(std::malloc(size)); }

void* reallocate(FT_Memory /*memory*/, long /*oldSize*/, long size, void* block) {
    return noted(std::realloc(block, size));
}

void release(FT_Memory /*memory*/, void* block) { std::free(block); }

} // namespace

std::shared_ptr<FS_FontLibrary> FS_FontLibrary::shared() {
    static const auto instance = std::make_shared<FS_FontLibrary>();
    return instance;
}

FS_FontLibrary::FS_FontLibrary() : memory{nullptr, allocate, release, reallocate} {
    expectMemory();
    if (FT_New_Library(&memory, &library) != 0) {
        throw std::bad_alloc(); // nothing else can fail; the next call tries again
    }
    FT_Add_Default_Modules(library);
    FT_Set_Default_Properties(library);
    if (hasLackedMemory) {
        FT_Done_Library(library);
        throw std::bad_alloc();
    }
}

FS_FontLibrary::~FS_FontLibrary() { FT_Done_Library(library); }

void FS_FontLibrary::requireMemory() {
    if (hasLackedMemory) {
        throw std::bad_alloc();
    }
}

void FS_FontLibrary::expectMemory() { hasLackedMemory = false; }

FT_Face FS_FontLibrary::open(const FS_FontSource& source, int faceIndex) {
    if (unpacksTooFar(readHead(source))) {
        return nullptr;
    }
    const std::lock_guard lock(inUse);
    expectMemory();
    FT_Face face = nullptr;
    FT_Error error = 0;
    if (source.bytes) {
        const auto* bytes = reinterpret_cast<const FT_Byte*>(source.bytes->data());
        error = FT_New_Memory_Face(library, bytes, static_cast<FT_Long>(source.bytes->size()),
                                   faceIndex, &face);
    } else {
        error = FT_New_Face(library, source.path.c_str(), faceIndex, &face);
    }
    if (hasLackedMemory && error == 0) {
        FT_Done_Face(face); // it may lack something
    }
    requireMemory();
    return error == 0 ? face : nullptr;
}

void FS_FontLibrary::close(FT_Face face) {
    const std::lock_guard lock(inUse);
    FT_Done_Face(face);
}

} // namespace MoxFontService_NS
