#include "foundation/records/TLGraphicType.h"

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
    std::streambuf* const buffer = source.rdbuf(); // the state of the stream stays as it is
    if (!buffer || buffer->pubseekpos(0, std::ios::in) != std::streampos(0)) {
        return TLGRAPHICTYPE_OTHER;
    }
    const std::streamsize count = buffer->sgetn(bytes, headSize);
    buffer->pubseekpos(0, std::ios::in);
    const std::string_view head(bytes, static_cast<std::size_t>(count > 0 ? count : 0));
    for (const Signature& signature : signatures) {
        if (head.starts_with(signature.bytes)) {
            return signature.type;
        }
    }
    return isSvg(head) ? TLGRAPHICTYPE_SVG : TLGRAPHICTYPE_OTHER;
}

} // namespace TalGraphic
