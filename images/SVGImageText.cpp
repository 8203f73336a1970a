#include "images/SVGImageText.h"

#include <algorithm>
#include <memory>
#include <utility>

namespace DrawmereNS {
namespace {

constexpr std::size_t pieceLines = 512;
constexpr std::size_t pieceBytes = pieceLines * SVGBase64Lines::lineBytes;
static_assert(SVGImageStore::chunkBytes % pieceBytes == 0); // so that lines go on behind the file

/// Too large for the stack of a small thread.
struct Buffers {
    char bytes[pieceBytes];
    char encoded[pieceLines * (SVGBase64Lines::lineCharacters + SVGImageText::maxLineFeed)];
};

/// Calls `give(begin, count)` for each piece of `total` bytes, until it answers false.
/// Returns: whether it never did.
template <typename Give> bool forEachPiece(std::size_t total, Give give) {
    bool isGiven = true;
    for (std::size_t begin = 0; isGiven && begin < total; begin += pieceBytes) {
        isGiven = give(begin, std::min(pieceBytes, total - begin));
    }
    return isGiven;
}

/// Gives a text to `take`, with `lineFeed` in the place of each line feed.
void handOutPrefix(std::string_view text, std::string_view lineFeed,
                   const MoxCommonNS::MoxKeptText::Taker& take) {
    std::size_t end = text.find('\n');
    while (end != std::string_view::npos) {
        take(text.substr(0, end));
        take(lineFeed);
        text.remove_prefix(end + 1);
        end = text.find('\n');
    }
    take(text);
}

} // namespace

SVGImageText::SVGImageText(std::string uriPrefix, SVGStoredImage bytes)
    : prefix(std::move(uriPrefix)), image(std::move(bytes)) {}

SVGImageText::~SVGImageText() = default;

std::size_t SVGImageText::getLength() const {
    return prefix.size() + SVGBase64Lines::countText(image.fileBytes + image.blockBytes);
}

bool SVGImageText::handOut(std::string_view lineFeed, const Taker& take) const {
    const auto buffers = std::make_unique_for_overwrite<Buffers>();
    const auto encode = [&](const char* bytes, std::size_t count) {
        char* const text = buffers->encoded;
        const char* const end = SVGBase64Lines::encodeText(bytes, count, text, lineFeed);
        take({text, static_cast<std::size_t>(end - text)});
        return true;
    };
    handOutPrefix(prefix, lineFeed, take);
    return forEachPiece(image.fileBytes,
                        [&](std::size_t begin, std::size_t count) {
                            return image.file->read(image.fileBegin + begin, buffers->bytes,
                                                    count) &&
                                   encode(buffers->bytes, count);
                        }) &&
           forEachPiece(image.blockBytes, [&](std::size_t begin, std::size_t count) {
               return encode(image.block.get() + begin, count);
           });
}

} // namespace DrawmereNS
