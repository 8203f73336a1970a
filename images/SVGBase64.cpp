#include "images/SVGBase64.h"

#include "images/SVGBase64Lines.h"
#include "images/SVGImageBytes.h"

#include <algorithm>
#include <climits>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <memory>
#include <new>
#include <system_error>

namespace DrawmereNS {
namespace {

constexpr std::size_t tripleBytes = 3;
constexpr std::size_t quadCharacters = 4;
constexpr std::size_t chunkLines = 1024;
constexpr std::size_t chunkBytes = chunkLines * SVGBase64Lines::lineBytes;

struct FileCloser {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

using File = std::unique_ptr<std::FILE, FileCloser>;

/// Opens a file that is neither a directory, which could be opened too but not be read, nor a pipe,
/// which may keep its opener waiting for ever.
File openSource(const char* path) {
    std::error_code failure;
    const auto status =
        path ? std::filesystem::status(path, failure) : std::filesystem::file_status();
    if (!path || std::filesystem::is_directory(status) || std::filesystem::is_fifo(status)) {
        return nullptr;
    }
    return File(std::fopen(path, "rb"));
}

std::size_t countCharacters(std::size_t bytes) {
    return (bytes + tripleBytes - 1) / tripleBytes * quadCharacters;
}

/// Reads by `read(bytes, count)`, which answers how many came, until less than a chunk came, and
/// gives each chunk to `take(bytes, count)`, which answers `SUCCESS` to go on. All chunks but the
/// last are whole lines, so the texts of the chunks make up the text of all.
template <typename Read, typename Take> int encodeChunks(Read read, Take take) {
    const std::unique_ptr<char[]> bytes(new (std::nothrow) char[chunkBytes]);
    if (!bytes) {
        return SVGBase64::NO_MEMORY;
    }
    std::size_t count = chunkBytes;
    while (count == chunkBytes) {
        count = read(bytes.get(), chunkBytes);
        const int result = take(bytes.get(), count);
        if (result != SVGBase64::SUCCESS) {
            return result;
        }
    }
    return SVGBase64::SUCCESS;
}

/// A buffer that is filled chunk by chunk and never beyond its end.
class TextBuffer {
public:
    TextBuffer(char* out, std::size_t outSize) : cursor(out), room(outSize) {}

    int operator()(const char* bytes, std::size_t count) {
        const std::size_t length = SVGBase64Lines::countText(count);
        if (length > room) {
            return SVGBase64::NO_MEMORY;
        }
        cursor = SVGBase64Lines::encodeText(bytes, count, cursor);
        room -= length;
        return SVGBase64::SUCCESS;
    }

private:
    char* cursor;
    std::size_t room;
};

auto makeReader(std::FILE* file) {
    return [file](char* bytes, std::size_t count) { return std::fread(bytes, 1, count, file); };
}

bool isSameFile(const char* one, const char* other) {
    std::error_code failure;
    return std::filesystem::equivalent(one, other, failure);
}

} // namespace

int SVGBase64::CalculateRecquiredEncodeOutputBufferSize(unsigned long size) {
    if (size > INT_MAX) {
        return 0;
    }
    const std::size_t characters = countCharacters(size);
    const std::size_t lines = characters / SVGBase64Lines::lineCharacters;
    const std::size_t result = characters + 2 * lines + 1;
    return result > INT_MAX ? 0 : static_cast<int>(result);
}

int SVGBase64::CreateMatchingEncodingBuffer(const char* input, BASE64INPUTTYPE type) {
    if (type != BASE64INPUTTYPE_FILE) {
        const std::size_t length = input ? std::strlen(input) : 0;
        return length > 0 ? CalculateRecquiredEncodeOutputBufferSize(length) : 0;
    }
    const File file = openSource(input);
    if (!file || std::fseek(file.get(), 0, SEEK_END) != 0) {
        return NO_SOURCE;
    }
    const long size = std::ftell(file.get());
    return size < 0 ? NO_SOURCE : CalculateRecquiredEncodeOutputBufferSize(size);
}

void SVGBase64::EncodeByteTriple(const char* in, unsigned long count, char* out) {
    if (count < 1 || count > tripleBytes) {
        return;
    }
    unsigned int bits = 0;
    for (unsigned long i = 0; i < tripleBytes; ++i) {
        bits = bits << 8U | (i < count ? static_cast<unsigned char>(in[i]) : 0U);
    }
    for (unsigned long i = 0; i < quadCharacters; ++i) {
        out[i] = i <= count ? BASE64_ALPHABET[bits >> (18U - 6U * i) & 0x3FU] : '=';
    }
}

void SVGBase64::EncodeBuffer(const char* in, unsigned long size, char* out) {
    const int outSize = CalculateRecquiredEncodeOutputBufferSize(size);
    if (outSize > 0) {
        char* const end = SVGBase64Lines::encodeText(in, size, out);
        std::fill(end, out + outSize, '\0');
    }
}

int SVGBase64::EncodeFile(const char* source, const char* target) {
    const File in = openSource(source);
    if (!in) {
        return NO_SOURCE;
    }
    // Opening the target would empty the source.
    if (!target || isSameFile(source, target)) {
        return NO_TARGET;
    }
    File out(std::fopen(target, "wb"));
    if (!out) {
        return NO_TARGET;
    }
    const std::unique_ptr<char[]> text(
        new (std::nothrow) char[SVGBase64Lines::countText(chunkBytes)]);
    if (!text) {
        return NO_MEMORY;
    }
    const int result =
        encodeChunks(makeReader(in.get()), [&](const char* bytes, std::size_t count) {
            const std::size_t length =
                SVGBase64Lines::encodeText(bytes, count, text.get()) - text.get();
            return std::fwrite(text.get(), 1, length, out.get()) == length ? SUCCESS : NO_TARGET;
        });
    const bool isWritten = std::fclose(out.release()) == 0;
    return result == SUCCESS && !isWritten ? NO_TARGET : result;
}

int SVGBase64::encodeFile2Buffer(const char* path, char* out, unsigned long outSize) {
    if (!out || outSize == 0) {
        return SUCCESS;
    }
    const File file = openSource(path);
    if (!file) {
        return NO_SOURCE;
    }
    // On purpose: a file too large for any text leaves none and is no failure here.
    if (CreateMatchingEncodingBuffer(path, BASE64INPUTTYPE_FILE) < 1) {
        return SUCCESS;
    }
    return encodeChunks(makeReader(file.get()), TextBuffer(out, outSize));
}

int SVGBase64::encodeStream2Buffer(std::istream& source, char* out, unsigned long outSize) {
    if (!out || outSize == 0) {
        return SUCCESS;
    }
    const std::streamoff length = SVGImageBytes::start(source);
    std::size_t left = length > 0 ? static_cast<std::size_t>(length) : 0;
    const auto read = [&source, &left](char* bytes, std::size_t count) {
        const std::size_t found = SVGImageBytes::read(source, bytes, std::min(count, left));
        left -= found;
        return found;
    };
    return encodeChunks(read, TextBuffer(out, outSize));
}

} // namespace DrawmereNS
