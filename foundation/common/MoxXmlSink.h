/// The way of a document's bytes to a stream, by a large buffer and, where asked, an encoding.
#pragma once

#include "foundation/common/MoxString.h"

#include <array>
#include <cstring>
#include <iosfwd>
#include <memory>
#include <string_view>
#include <unicode/umachine.h>

struct UConverter;
struct USet;

namespace MoxCommonNS {

/// Collects UTF-8 and hands it on in large pieces, converted when the document's encoding is
/// another; characters that the encoding lacks become character references.
class MoxXmlSink {
public:
    /// Borrows: `stream`. An `encoding` that ICU does not know means UTF-8, like an empty one, and
    /// so does one that lacks ASCII characters or has no name that an XML declaration could hold.
    MoxXmlSink(std::ostream& stream, const UnicodeString& encoding);
    MoxXmlSink(const MoxXmlSink&) = delete;
    MoxXmlSink& operator=(const MoxXmlSink&) = delete;
    ~MoxXmlSink();

    /// Returns: the encoding's name for the XML declaration.
    const char* getEncodingName() const { return encodingName; }

    /// Returns: whether the encoding is another than UTF-8.
    bool isConverting() const { return source != nullptr; }

    /// Returns: whether the encoding has `codePoint`, so that it need not be a reference.
    bool canCarry(UChar32 codePoint);

    /// Makes room for `count` bytes, at most `maxRoom`. Returns: where they go; `advance` takes
    /// them.
    char* room(std::size_t count) {
        if (count > static_cast<std::size_t>(buffer.data() + buffer.size() - cursor)) {
            flushBuffer();
        }
        return cursor;
    }

    void advance(char* end) { cursor = end; }

    void write(std::string_view bytes) {
        if (bytes.size() > maxRoom) {
            writeLong(bytes);
            return;
        }
        std::memcpy(room(bytes.size()), bytes.data(), bytes.size());
        cursor += bytes.size();
    }

    void write(char c) {
        *room(1) = c;
        ++cursor;
    }

    /// Hands on all that is left; nothing may be written afterwards.
    void finish();

    /// Puts the stream into a failed state, and nothing more is written.
    void fail();

    static constexpr std::size_t maxRoom = 4096;

private:
    struct ConverterDeleter {
        void operator()(UConverter* converter) const;
    };

    struct SetDeleter {
        void operator()(USet* set) const;
    };

    void readCarried();
    void openConverter(const UnicodeString& encoding);
    void writeLong(std::string_view bytes);
    void flushBuffer();
    void handOn(const char* bytes, std::size_t count, bool isLast);
    void convert(const char* bytes, std::size_t count, bool isLast);

    static constexpr std::size_t bufferSize = 16384;

    std::ostream& stream; // borrowed
    const char* encodingName = "UTF-8";
    std::unique_ptr<UConverter, ConverterDeleter> source; // UTF-8, null when nothing is converted
    std::unique_ptr<UConverter, ConverterDeleter> target;
    std::unique_ptr<USet, SetDeleter> carried; // what the encoding has, null until it is asked for
    std::array<char, bufferSize> buffer;
    char* cursor = buffer.data();
};

} // namespace MoxCommonNS
