#include "foundation/records/TLGraphicType.h"

#include <algorithm>
#include <istream>
#include <string_view>

namespace TalGraphic {
namespace {

struct Signature {
    TLGraphicType type;
    std::string_view bytes;
};

constexpr Signature signatures[] = {
    {TLGRAPHICTYPE_PNG, "\x89PNG\r\n\x1A\n"},
    {TLGRAPHICTYPE_JPEG, "\xFF\xD8\xFF"},
};

constexpr std::size_t headSize = 1024;

/// Reads the first bytes of a stream, whose state stays as it is, and goes back to the first.
/// Returns: how many there were, none when the stream can't be repositioned.
std::size_t readHead(std::istream& source, char* bytes) {
    std::streambuf* const buffer = source.rdbuf();
    try {
        if (!buffer || buffer->pubseekpos(0, std::ios::in) != std::streampos(0)) {
            return 0;
        }
        const std::streamsize count = buffer->sgetn(bytes, headSize);
        buffer->pubseekpos(0, std::ios::in);
        return static_cast<std::size_t>(std::max<std::streamsize>(count, 0));
    } catch (...) {
        return 0; // a directory that was opened as a file, for instance
    }
}

/// Returns: whether the text is markup whose root may be `svg`.
bool isSvg(std::string_view head) {
    constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";
    if (head.starts_with(byteOrderMark)) {
        head.remove_prefix(byteOrderMark.size());
    }
    const std::size_t begin = head.find_first_not_of(" \t\r\n");
    return begin != std::string_view::npos && head[begin] == '<' &&
           head.find("<svg") != std::string_view::npos;
}

} // namespace

TLGraphicType findGraphicType(std::istream& source) {
    char bytes[headSize];
    const std::string_view head(bytes, readHead(source, bytes));
    for (const Signature& signature : signatures) {
        if (head.starts_with(signature.bytes)) {
            return signature.type;
        }
    }
    return isSvg(head) ? TLGRAPHICTYPE_SVG : TLGRAPHICTYPE_OTHER;
}

} // namespace TalGraphic
