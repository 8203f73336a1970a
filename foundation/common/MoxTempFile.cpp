#include "foundation/common/MoxTempFile.h"

#include <cerrno>
#include <cstdlib>
#include <utility>

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

/// Takes the first of the files that `directory` gives, -1 for none.
int openFile(const std::string& directory) {
    const int unnamed = MoxTempFile::openUnnamed(directory);
    return unnamed >= 0 ? unnamed : MoxTempFile::openUnlinked(directory);
}

/// Documents that wait for their links have a file each. Half of the descriptors that the process
/// may have are left for all else, such as the files of finished pages.
bool leavesRoom(int descriptor) {
    rlimit limit = {};
    return getrlimit(RLIMIT_NOFILE, &limit) == 0 &&
           static_cast<rlim_t>(descriptor) < limit.rlim_cur / 2;
}

} // namespace

std::string MoxTempFile::getDirectory() {
    const char* const directory = secure_getenv("TMPDIR");
    return directory && *directory != '\0' ? directory : "/tmp";
}

MoxPtr<MoxTempFile> MoxTempFile::make(const std::string& directory) {
    const int descriptor = openFile(directory);
    if (descriptor < 0) {
        return {};
    }
    try {
        MoxPtr<MoxTempFile> file(new MoxTempFile(descriptor)); // which closes it
        return leavesRoom(descriptor) ? std::move(file) : MoxPtr<MoxTempFile>();
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
