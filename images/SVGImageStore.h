/// Where the bytes of embedded images wait until the document is written.
#pragma once

#include "foundation/common/MoxByteBlock.h"
#include "foundation/common/MoxPtr.h"
#include "foundation/common/MoxTempFile.h"
#include "images/SVGBase64Lines.h"

#include <cstddef>
#include <cstdint>
#include <iosfwd>
#include <string>
#include <string_view>

namespace DrawmereNS {

/// The bytes of one image: first those in a file, then those in memory; one of them is usually
/// empty.
struct SVGStoredImage {
    MoxCommonNS::MoxPtr<MoxCommonNS::MoxTempFile> file; ///< null when `fileBytes` is 0
    std::uint64_t fileBegin = 0;
    std::size_t fileBytes = 0; ///< a multiple of `SVGImageStore::chunkBytes` when memory follows
    MoxCommonNS::MoxByteBlock block;
    std::size_t blockBytes = 0;
};

/// Keeps the bytes of the images of one document: up to a budget in memory, and the rest in a file
/// without a name. Where there can't be such a file, or no more of it, memory takes them all. An
/// image stays readable when the store is gone.
class SVGImageStore {
public:
    /// How many bytes of a document stay in memory.
    static constexpr std::size_t memoryBudget = 16U << 20U;

    /// The piece in which bytes are read and stored, whole lines of base64.
    static constexpr std::size_t chunkBytes = 1024 * SVGBase64Lines::lineBytes;

    explicit SVGImageStore(std::size_t budget = memoryBudget,
                           std::string directory = MoxCommonNS::MoxTempFile::getDirectory());

    /// Reads up to `count` bytes of `source` from where it stands, fewer when there are no more.
    /// Returns: false when there was no memory for them.
    bool keep(std::istream& source, std::size_t count, SVGStoredImage& image);

private:
    class Reader;

    bool openFile();
    bool fillFile(Reader& reader, SVGStoredImage& image);
    bool fillBlock(std::string_view first, Reader& reader, SVGStoredImage& image);

    std::size_t room; // the rest of the budget
    std::string directory;
    MoxCommonNS::MoxPtr<MoxCommonNS::MoxTempFile> file; // null until it is needed
    bool hasNoFile = false;                             // once one was asked for in vain
};

} // namespace DrawmereNS
