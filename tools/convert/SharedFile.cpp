#include "tools/convert/SharedFile.h"

#include <cerrno>
#include <cstring>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace DrawmereConvert {
namespace {

struct OpenFile {
    int descriptor;
    int64_t size;
    unsigned char buffer[4096];
};

ssize_t readAt(const OpenFile& file, unsigned char* to, int64_t place) {
    for (;;) {
        const ssize_t count = pread(file.descriptor, to, sizeof file.buffer, place);
        if (count >= 0 || errno != EINTR) {
            return count;
        }
    }
}

// Between these two and MuPDF, `pos` is the place in the file behind what is in the buffer.

int nextByte(fz_context* ctx, fz_stream* stream, size_t /*wanted*/) {
    auto* const file = static_cast<OpenFile*>(stream->state);
    const ssize_t count = readAt(*file, file->buffer, stream->pos);
    if (count < 0) {
        fz_throw(ctx, FZ_ERROR_GENERIC, "read error: %s", strerror(errno));
    }
    stream->rp = file->buffer;
    stream->wp = file->buffer + count;
    stream->pos += count;
    return count == 0 ? EOF : *stream->rp++;
}

void seekTo(fz_context* ctx, fz_stream* stream, int64_t offset, int whence) {
    const auto* const file = static_cast<const OpenFile*>(stream->state);
    const int64_t base = whence == SEEK_END ? file->size : whence == SEEK_CUR ? stream->pos : 0;
    if (base + offset < 0) {
        fz_throw(ctx, FZ_ERROR_GENERIC, "cannot seek before the start of the file");
    }
    stream->pos = base + offset;
    stream->rp = stream->wp = nullptr;
}

void closeFile(fz_context* ctx, void* state) {
    close(static_cast<OpenFile*>(state)->descriptor);
    fz_free(ctx, state);
}

/// Returns: a descriptor of the plain file `path`.
int openFile(fz_context* ctx, const char* path, int64_t& size) {
    const int descriptor = open(path, O_RDONLY | O_CLOEXEC);
    struct stat facts = {};
    if (descriptor < 0 || fstat(descriptor, &facts) != 0) {
        fz_throw(ctx, FZ_ERROR_GENERIC, "cannot open: %s", strerror(errno));
    }
    if (!S_ISREG(facts.st_mode)) {
        close(descriptor);
        fz_throw(ctx, FZ_ERROR_GENERIC, "cannot open: not a plain file");
    }
    size = facts.st_size;
    return descriptor;
}

} // namespace

fz_stream* openSharedFile(fz_context* ctx, const char* path) {
    auto* const file = static_cast<OpenFile*>(fz_calloc(ctx, 1, sizeof(OpenFile)));
    fz_stream* stream = nullptr;
    file->descriptor = -1;
    fz_var(stream);
    fz_try(ctx) {
        file->descriptor = openFile(ctx, path, file->size);
        stream = fz_new_stream(ctx, file, nextByte, closeFile); // frees the file when it fails
    }
    fz_catch(ctx) {
        if (file->descriptor < 0) {
            fz_free(ctx, file);
        }
        fz_rethrow(ctx);
    }
    stream->seek = seekTo;
    return stream;
}

} // namespace DrawmereConvert
