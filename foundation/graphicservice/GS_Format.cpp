#include "foundation/graphicservice/GS_Format.h"

#include "foundation/graphicservice/GS_BmpReader.h"
#include "foundation/graphicservice/GS_GifReader.h"
#include "foundation/graphicservice/GS_JpegReader.h"
#include "foundation/graphicservice/GS_JpegStructure.h"
#include "foundation/graphicservice/GS_PngReader.h"
#include "foundation/graphicservice/GS_PngStructure.h"
#include "foundation/graphicservice/GS_TiffReader.h"
#include "foundation/graphicservice/GS_WebpReader.h"

namespace MoxGraphicService_NS {
namespace {

using namespace std::string_view_literals;

constexpr GS_Format formats[] = {
    {RASTERKIND_PNG, readPngInfo, readPngPixels}, {RASTERKIND_JPEG, readJpegInfo, readJpegPixels},
    {RASTERKIND_GIF, readGifInfo, readGifPixels}, {RASTERKIND_TIFF, readTiffInfo, readTiffPixels},
    {RASTERKIND_BMP, readBmpInfo, readBmpPixels}, {RASTERKIND_WEBP, readWebpInfo, readWebpPixels},
};

/// What a file of some form has at its beginning and, where `further` is not empty, at an offset.
struct Mark {
    GS_RasterKind kind;
    std::string_view start;
    std::size_t offset = 0;
    std::string_view further = {};
};

constexpr Mark rasterMarks[] = {
    {RASTERKIND_PNG, "\x89PNG\r\n\x1A\n"sv},
    {RASTERKIND_JPEG, "\xFF\xD8\xFF"sv},
    {RASTERKIND_GIF, "GIF87a"sv},
    {RASTERKIND_GIF, "GIF89a"sv},
    {RASTERKIND_TIFF, "II*\0"sv},
    {RASTERKIND_TIFF, "MM\0*"sv},
    {RASTERKIND_TIFF, "II+\0"sv}, // BigTIFF
    {RASTERKIND_TIFF, "MM\0+"sv},
    {RASTERKIND_BMP, "BM"sv, 15, "\0\0\0"sv}, // the size of the second header is a small number
    {RASTERKIND_WEBP, "RIFF"sv, 8, "WEBP"sv},
};

struct VectorMark {
    std::string_view start;
    std::size_t offset = 0;
    std::string_view further = {};
};

constexpr VectorMark vectorMarks[] = {
    {"%PDF-"sv},
    {"%!PS"sv},
    {"\xC5\xD0\xD3\xC6"sv},         // PostScript with a preview
    {"\x01\0\0\0"sv, 40, " EMF"sv}, // EMF
    {"\xD7\xCD\xC6\x9A"sv},         // WMF with a placing header
    {"\x01\0\x09\0\0"sv},           // WMF without
};

template <typename Row> bool matches(const Row& mark, std::string_view head) {
    return head.starts_with(mark.start) &&
           (mark.further.empty() ||
            (head.size() > mark.offset && head.substr(mark.offset).starts_with(mark.further)));
}

/// Returns: whether this is the beginning of an XML document with the root `svg`, as far as that
/// can be told without reading XML.
bool isSvg(std::string_view head) {
    constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";
    if (head.starts_with(byteOrderMark)) {
        head.remove_prefix(byteOrderMark.size());
    }
    const std::size_t start = head.find_first_not_of(" \t\r\n");
    return start != std::string_view::npos && head[start] == '<' &&
           head.find("<svg") != std::string_view::npos;
}

} // namespace

const GS_Format* findFormat(std::string_view head) {
    for (const Mark& mark : rasterMarks) {
        if (matches(mark, head)) {
            return &formats[mark.kind];
        }
    }
    return nullptr;
}

bool isVectorFile(std::string_view head) {
    for (const VectorMark& mark : vectorMarks) {
        if (matches(mark, head)) {
            return true;
        }
    }
    return isSvg(head);
}

} // namespace MoxGraphicService_NS
