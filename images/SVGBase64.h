/// Turns bytes into the base64 text of a data URI.
#pragma once

#include "DrawmereExport.h"

#include <cstdint>
#include <iosfwd>

namespace DrawmereNS {

/// What the input of `SVGBase64::CreateMatchingEncodingBuffer` is; any number but 0 means a text.
enum BASE64INPUTTYPE : std::int32_t {
    BASE64INPUTTYPE_FILE = 0,
    BASE64INPUTTYPE_TEXT = 1,
};

/// Base64 (RFC 4648) in lines of 76 characters, each closed by a line feed; a last line with fewer
/// is not closed. Nothing is kept between calls.
///
/// A text needs a buffer of the size that `CalculateRecquiredEncodeOutputBufferSize` tells: it
/// leaves room for line ends of two bytes and a terminating zero.
class DRAWMERE_API SVGBase64 {
public:
    /// The characters for 0 to 63.
    static constexpr char BASE64_ALPHABET[] =
        "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";

    // What the encoding of files and streams answers.
    static constexpr int SUCCESS = 0;     ///< the text is complete
    static constexpr int NO_SOURCE = -20; ///< the source can't be opened
    static constexpr int NO_TARGET = -19; ///< the target can't be opened or written
    static constexpr int NO_MEMORY = -18; ///< no memory, or too small a buffer to write to

    /// Returns: the bytes of the buffer for the text of `size` bytes, 0 when an int can't tell
    /// them.
    static int CalculateRecquiredEncodeOutputBufferSize(unsigned long size); // sic

    /// Returns: that size for the bytes of a file or of a text that ends in a zero byte; in spite
    /// of the name nothing is allocated. 0 for an empty text and what is too large, `NO_SOURCE` for
    /// a file that can't be read.
    static int CreateMatchingEncodingBuffer(const char* input, BASE64INPUTTYPE type);

    /// Encodes up to three bytes.
    /// Shape: `in[count]`, `out[4]`. Ignores: a count that is none of 1 to 3.
    static void EncodeByteTriple(const char* in, unsigned long count, char* out);

    /// Encodes a whole buffer and fills what is left of `out` with zeros.
    /// Shape: `in[size]`, `out` as large as the formula says. Ignores: a size too large for it.
    static void EncodeBuffer(const char* in, unsigned long size, char* out);

    /// Encodes a file into a file. Both paths are local and in UTF-8.
    /// Returns: `SUCCESS` or what went wrong; one file can't be both.
    static int EncodeFile(const char* source, const char* target);

    /// Encodes a file into memory. Without a buffer there is nothing to do, which is a success.
    /// Shape: `out[outSize]`, zeros as large as the formula says; what the text doesn't fill is
    /// left alone. Returns: `SUCCESS` or what went wrong; `NO_MEMORY` when the text had to be cut.
    static int encodeFile2Buffer(const char* path, char* out, unsigned long outSize);

    /// The same for a stream that can be repositioned, from its beginning to its end. What can't be
    /// read is left out.
    static int encodeStream2Buffer(std::istream& source, char* out, unsigned long outSize);
};

} // namespace DrawmereNS
