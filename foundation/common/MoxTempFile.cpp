#include "foundation/common/MoxTempFile.h"

#include <cerrno>
#include <cstdlib>

#include <fcntl.h>
#include <sys/resource.h>
#include <unistd.h>

namespace MoxCommonNS {
namespace {

/// Calls `transfer(done)`, which answers how many bytes it moved from there on, until all are.
/// Returns: false at a failure, or when nothing moves.
template <typename Transfer> bool moveAll(std::size_t count, Transfer transfer) {
    std::size_t done = 0;
    while (done < count) {
        const ssize_t moved = transfer(done);
        if (moved > 0) {
            done += static_cast<std::size_t>(moved);
        } else if (moved == 0 || errno != EINTR) {
            return false;
        }
    }
    return true;
}

} // namespace

std::string MoxTempFile::getDirectory() {
    const char* const directory = secure_getenv("TMPDIR");
    return directory && *directory != '\0' ? directory : "/tmp";
}

MoxPtr<MoxTempFile> MoxTempFile::make(const std::string& directory) {
    int descriptor = openUnnamed(directory);
    if (descriptor < 0) {
        descriptor = openUnlinked(directory);
    }
    if (descriptor < 0) {
        return {};
    }
    try {
        return {new MoxTempFile(descriptor)};
    } catch (...) { // no memory
        close(descriptor);
        throw;
    }
}

int MoxTempFile::openUnnamed(const std::string& directory) {
    return open(directory.c_str(), O_TMPFILE | O_RDWR | O_CLOEXEC, S_IRUSR | S_IWUSR);
}

int MoxTempFile::openUnlinked(const std::string& directory) {
    std::string path = directory + "/drawmere-XXXXXX";
    const int descriptor = mkostemp(path.data(), O_CLOEXEC); // with the mode 0600
    if (descriptor >= 0) {
        unlink(path.c_str());
    }
    return descriptor;
}

MoxTempFile::MoxTempFile(int descriptor) : file(descriptor), maker(getpid()) {}

MoxTempFile::~MoxTempFile() { close(file); }

/// A write beyond the limit for files would end a process that takes no precautions. Two processes
/// that a fork made of one share the file, and each would overwrite what the other appends.
bool MoxTempFile::mayAppend(std::size_t count) const {
    rlimit limit = {};
    return !isFull && maker == getpid() && getrlimit(RLIMIT_FSIZE, &limit) == 0 &&
           (limit.rlim_cur == RLIM_INFINITY || size + count <= limit.rlim_cur);
}

bool MoxTempFile::append(const char* bytes, std::size_t count) {
    isFull = !mayAppend(count) || !moveAll(count, [&](std::size_t done) {
        return pwrite(file, bytes + done, count - done, static_cast<off_t>(size + done));
    });
    size += isFull ? 0 : count;
    return !isFull;
}

bool MoxTempFile::read(std::uint64_t offset, char* bytes, std::size_t count) const {
    return moveAll(count, [&](std::size_t done) {
        return pread(file, bytes + done, count - done, static_cast<off_t>(offset + done));
    });
}

} // namespace MoxCommonNS
