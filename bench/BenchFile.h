/// The file that a bench writes to.
#pragma once

#include <cstddef>
#include <string>

namespace DrawmereNS {

/// A file in a directory of its own, in memory where the machine has such a place, so that the disk
/// plays no part. Both go with the object.
class BenchFile {
public:
    BenchFile();
    BenchFile(const BenchFile&) = delete;
    BenchFile& operator=(const BenchFile&) = delete;
    ~BenchFile();

    const std::string& getPath() const { return path; }

    /// Returns: the bytes in the file; 0 when there is none.
    std::size_t getSize() const;

private:
    std::string directory;
    std::string path;
};

} // namespace DrawmereNS
