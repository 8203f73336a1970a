#include "config/SVGZip.h"

#include "foundation/common/MoxCStr.h"

#include <algorithm>
#include <fstream>
#include <limits>

#include <zlib.h>

namespace DrawmereNS {
namespace {

constexpr int gzipWindowBits = 15 + 16; // the largest window, and a gzip header in place of zlib's
constexpr int highestMemoryLevel = 9;

std::ostream* openFile(const UnicodeString& fileName) {
    if (fileName.indexOf(u'\0') >= 0) { // it would end the path early and name some other file
        auto* const closed = new std::ofstream;
        closed->setstate(std::ios::failbit);
        return closed;
    }
    return new std::ofstream(MoxCommonNS::MoxCStr(fileName).toCStr(),
                             std::ios::out | std::ios::binary | std::ios::trunc);
}

} // namespace

SVGZipStreamBuf::SVGZipStreamBuf(std::ostream& output)
    : target(&output), ownsTarget(false), zstream(std::make_unique<z_stream>()) {
    setp(inputBuffer, inputBuffer + bufferSize);
    initZStream();
}

SVGZipStreamBuf::SVGZipStreamBuf(const UnicodeString& fileName)
    : target(openFile(fileName)), ownsTarget(true), zstream(std::make_unique<z_stream>()) {
    setp(inputBuffer, inputBuffer + bufferSize);
    initZStream();
}

SVGZipStreamBuf::~SVGZipStreamBuf() {
    try {
        gzOut();
        FinishEncodeBuf();
        target->flush();
    } catch (...) {
        // A target may be set to throw what its state tells already; here nobody could catch it.
        deflateEnd(zstream.get());
    }
    if (ownsTarget) {
        delete target; // which closes the file
    }
}

void SVGZipStreamBuf::initZStream() {
    deflateEnd(zstream.get()); // of an earlier start; does nothing at the first
    *zstream = z_stream();
    const int result =
        deflateInit2_(zstream.get(), Z_BEST_COMPRESSION, Z_DEFLATED, gzipWindowBits,
                      highestMemoryLevel, Z_DEFAULT_STRATEGY, ZLIB_VERSION, sizeof(z_stream));
    if (result != Z_OK) {
        target->setstate(std::ios::badbit);
    }
    zstream->next_out = outputBuffer;
    zstream->avail_out = bufferSize;
}

unsigned long SVGZipStreamBuf::EncodeBuffer(unsigned char* in, unsigned char*, unsigned long size,
                                            unsigned long outSize) {
    constexpr unsigned long longest = std::numeric_limits<uInt>::max();
    for (bool isWorking = true; isWorking && size > 0;) {
        const unsigned long count = std::min(size, longest);
        zstream->next_in = in;
        zstream->avail_in = static_cast<uInt>(count);
        isWorking = deflateInput();
        in += count;
        size -= count;
    }
    return outSize - zstream->avail_out;
}

int SVGZipStreamBuf::FinishEncodeBuf() {
    if (!zstream->state) {
        return 0; // it has ended, by an earlier call or by a failure that the target knows of
    }
    zstream->next_in = nullptr;
    zstream->avail_in = 0;
    int result = Z_OK;
    while (result == Z_OK) {
        result = deflate(zstream.get(), Z_FINISH);
        if (zstream->avail_out == 0) {
            writeOutput(bufferSize);
        }
    }
    writeOutput(bufferSize - zstream->avail_out);
    deflateEnd(zstream.get());
    if (result != Z_STREAM_END) {
        target->setstate(std::ios::badbit);
    }
    return 0;
}

int SVGZipStreamBuf::gzOut() {
    auto* const begin = reinterpret_cast<unsigned char*>(pbase()); // zlib's bytes have no sign
    const auto size = static_cast<unsigned long>(pptr() - pbase());
    setp(inputBuffer, inputBuffer + bufferSize);
    EncodeBuffer(begin, outputBuffer, size, bufferSize);
    return 0;
}

int SVGZipStreamBuf::overflow(int c) {
    gzOut();
    // On purpose: the end-of-file value is a byte like others and stores 255. No stream asks for
    // it: each calls with the character that found no room.
    const char byte = traits_type::to_char_type(c);
    *pptr() = byte;
    pbump(1);
    return target->fail() ? traits_type::eof() : traits_type::to_int_type(byte);
}

int SVGZipStreamBuf::sync() {
    gzOut();
    return target->fail() ? -1 : 0;
}

/// Writes the first `count` bytes of the output buffer, which is then empty.
void SVGZipStreamBuf::writeOutput(std::size_t count) {
    zstream->next_out = outputBuffer;
    zstream->avail_out = bufferSize;
    target->write(reinterpret_cast<const char*>(outputBuffer), static_cast<std::streamsize>(count));
}

/// Deflates all that zlib was given.
/// Returns: false after a failure, which ends the compression.
bool SVGZipStreamBuf::deflateInput() {
    while (zstream->avail_in != 0) {
        if (deflate(zstream.get(), Z_NO_FLUSH) != Z_OK) {
            deflateEnd(zstream.get());
            target->setstate(std::ios::badbit);
            return false;
        }
        if (zstream->avail_out == 0) {
            writeOutput(bufferSize);
        }
    }
    return true;
}

SVGZipStream::SVGZipStream(const UnicodeString& fileName)
    : std::ostream(nullptr), buffer(fileName) {
    rdbuf(&buffer);
    if (buffer.target->fail()) {
        setstate(std::ios::failbit);
    }
}

SVGZipStream::SVGZipStream(std::ostream& target) : std::ostream(nullptr), buffer(target) {
    rdbuf(&buffer);
}

SVGZipStream::~SVGZipStream() = default;

} // namespace DrawmereNS
