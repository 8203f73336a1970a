#include "tests/support/Gunzip.h"

#include <memory>
#include <stdexcept>

#include <zlib.h>

namespace DrawmereTest {
namespace {

constexpr int onlyGzip = 15 + 16;

struct Inflater {
    Inflater() {
        if (inflateInit2(&stream, onlyGzip) != Z_OK) {
            throw std::runtime_error("no memory for zlib");
        }
    }

    Inflater(const Inflater&) = delete;
    Inflater& operator=(const Inflater&) = delete;

    ~Inflater() { inflateEnd(&stream); }

    z_stream stream = {};
};

} // namespace

std::string gunzip(const std::string& file) {
    Inflater inflater;
    std::string input = file; // zlib wants bytes that it might change
    inflater.stream.next_in = reinterpret_cast<Bytef*>(input.data());
    inflater.stream.avail_in = static_cast<uInt>(input.size());
    std::string content;
    std::string piece(65536, '\0');
    int result = Z_OK;
    while (result == Z_OK) {
        inflater.stream.next_out = reinterpret_cast<Bytef*>(piece.data());
        inflater.stream.avail_out = static_cast<uInt>(piece.size());
        result = inflate(&inflater.stream, Z_NO_FLUSH);
        content.append(piece, 0, piece.size() - inflater.stream.avail_out);
    }
    if (result != Z_STREAM_END || inflater.stream.avail_in != 0) {
        throw std::runtime_error("no complete gzip file");
    }
    return content;
}

} // namespace DrawmereTest
