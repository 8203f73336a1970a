#include "images/SVGImageStore.h"

#include "images/SVGImageBytes.h"

#include <algorithm>
#include <cstdlib>
#include <memory>
#include <new>
#include <utility>

namespace DrawmereNS {

using MoxCommonNS::MoxTempFile;

namespace {

/// Gives back the memory of bytes that did not come.
void shrink(SVGStoredImage& image) {
    void* const shrunk =
        std::realloc(image.block.get(), std::max<std::size_t>(1, image.blockBytes));
    if (shrunk) {
        static_cast<void>(image.block.release());
        image.block.reset(static_cast<char*>(shrunk));
    }
}

} // namespace

/// Reads a stream in chunks, until one is not full.
class SVGImageStore::Reader {
public:
    Reader(std::istream& input, std::size_t count) : source(input), left(count) {}

    /// Returns: how many bytes may still come.
    std::size_t countLeft() const { return left; }

    /// Reads the next chunk to `bytes`. Returns: its size.
    std::size_t read(char* bytes) {
        const std::size_t wanted = std::min(chunkBytes, left);
        const std::size_t count = SVGImageBytes::read(source, bytes, wanted);
        left = count == wanted ? left - count : 0;
        return count;
    }

private:
    std::istream& source; // borrowed
    std::size_t left;
};

SVGImageStore::SVGImageStore(std::size_t budget, std::string fileDirectory)
    : room(budget), directory(std::move(fileDirectory)) {}

bool SVGImageStore::keep(std::istream& source, std::size_t count, SVGStoredImage& image) {
    Reader reader(source, count);
    return count > room && openFile() ? fillFile(reader, image) : fillBlock({}, reader, image);
}

/// Returns: whether there is a file.
bool SVGImageStore::openFile() {
    if (!file && !hasNoFile) {
        file = MoxTempFile::make(directory);
        hasNoFile = !file;
    }
    return !hasNoFile;
}

/// Fills the file. A chunk that it does not take, and all behind it, go into memory.
bool SVGImageStore::fillFile(Reader& reader, SVGStoredImage& image) {
    const std::unique_ptr<char[]> chunk(new (std::nothrow) char[chunkBytes]);
    if (!chunk) {
        return false;
    }
    image.file = file;
    image.fileBegin = file->getSize();
    while (reader.countLeft() > 0) {
        const std::size_t count = reader.read(chunk.get());
        if (!file->append(chunk.get(), count)) {
            hasNoFile = true;
            return fillBlock({chunk.get(), count}, reader, image);
        }
        image.fileBytes += count;
    }
    return true;
}

/// Fills memory, with `first` before what is read.
bool SVGImageStore::fillBlock(std::string_view first, Reader& reader, SVGStoredImage& image) {
    const std::size_t expected = first.size() + reader.countLeft();
    if (expected == 0) {
        return true;
    }
    image.block.reset(static_cast<char*>(std::malloc(expected)));
    if (!image.block) {
        return false;
    }
    char* end = std::copy(first.begin(), first.end(), image.block.get());
    while (reader.countLeft() > 0) {
        end += reader.read(end);
    }
    image.blockBytes = static_cast<std::size_t>(end - image.block.get());
    room -= std::min(room, image.blockBytes);
    if (image.blockBytes < expected) {
        shrink(image);
    }
    return true;
}

} // namespace DrawmereNS
