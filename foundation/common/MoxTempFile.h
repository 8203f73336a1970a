/// A file without a name, for bytes that would need too much memory.
#pragma once

#include "foundation/common/MoxPtr.h"
#include "foundation/common/MoxRCObject.h"

#include <cstddef>
#include <cstdint>
#include <string>

namespace MoxCommonNS {

/// A file that nobody else can open and that is gone with its last owner, or with the process. One
/// thread appends; what stands in the file may be read by several at once.
class MoxTempFile : public MoxRCObject {
public:
    /// Returns: where such files go: $TMPDIR, or else /tmp.
    static std::string getDirectory();

    /// Returns: an empty file in `directory`; null when none can be made there, or when the process
    /// has used up half of the descriptors that it may have.
    static MoxPtr<MoxTempFile> make(const std::string& directory);

    // The two ways to make one. Both return a descriptor, -1 for a failure.
    /// Makes a file that never has a name, which not every file system can do.
    static int openUnnamed(const std::string& directory);
    /// Makes a file and takes its name away.
    static int openUnlinked(const std::string& directory);

    MoxTempFile(const MoxTempFile&) = delete;
    MoxTempFile& operator=(const MoxTempFile&) = delete;
    ~MoxTempFile() override;

    /// Returns: the count of bytes that were appended.
    std::uint64_t getSize() const { return size; }

    /// Writes `count` bytes behind all others. Returns: false when not all of them could be
    /// written; then the file is as before, and nothing more can be appended.
    bool append(const char* bytes, std::size_t count);

    /// Reads bytes that were appended. Returns: false when it can't have all of them.
    bool read(std::uint64_t offset, char* bytes, std::size_t count) const;

private:
    explicit MoxTempFile(int descriptor);
    bool mayAppend(std::size_t count) const;

    int file;           // owned
    std::int64_t maker; // the process that may append
    std::uint64_t size = 0;
    bool isFull = false;
};

} // namespace MoxCommonNS
