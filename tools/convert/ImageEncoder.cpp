#include "tools/convert/ImageEncoder.h"

#include "tools/convert/PngWriter.h"

#include <algorithm>
#include <array>

namespace DrawmereConvert {
namespace {

constexpr std::uint32_t alphaMask = 0xFF000000;
constexpr std::uint32_t white = 0x00FFFFFF;

/// Reads rows as they are to be seen, of the size that shows all pixels of the image and its mask.
class LookRows {
public:
    LookRows(const ImagePixels& image, const ImageLook& wanted)
        : pixels(image), look(wanted), width(image.getWidth()), height(image.getHeight()) {
        if (look.mask) {
            width = std::max(width, look.mask->getWidth());
            height = std::max(height, look.mask->getHeight());
        }
        width *= look.zoom;
        height *= look.zoom;
    }

    int getWidth() const { return width; }

    int getHeight() const { return height; }

    const std::vector<std::uint32_t>& read(int y) {
        const int sourceRow = scaleDown(y, pixels.getHeight(), height);
        const int maskedRow = look.mask ? scaleDown(y, look.mask->getHeight(), height) : 0;
        if (sourceRow != lastRow || maskedRow != lastMaskRow) {
            lastRow = sourceRow;
            lastMaskRow = maskedRow;
            build();
        }
        return row;
    }

private:
    /// Returns: the place among `count` that stands at `index` among `of`.
    static int scaleDown(int index, int count, int of) {
        return static_cast<int>(static_cast<std::int64_t>(index) * count / of);
    }

    void build() {
        pixels.readRow(lastRow, source);
        row.resize(static_cast<std::size_t>(width));
        for (int x = 0; x < width; ++x) {
            row[x] = colour(source[scaleDown(x, pixels.getWidth(), width)]);
        }
        if (!look.mask) {
            return;
        }
        look.mask->readMaskRow(lastMaskRow, maskRow);
        for (int x = 0; x < width; ++x) {
            const std::uint32_t alpha = maskRow[scaleDown(x, look.mask->getWidth(), width)];
            row[x] = alpha == 0 ? 0 : (row[x] & ~alphaMask) | alpha << 24U;
        }
    }

    std::uint32_t colour(std::uint32_t pixel) const {
        if (look.isWhite || look.color) {
            return (pixel & alphaMask) | (look.isWhite ? white : *look.color);
        }
        if (pixel < 0x01000000U) { // all that can't be seen is one colour
            return 0;
        }
        if (!look.isGray) {
            return pixel;
        }
        const std::uint32_t gray =
            ((pixel >> 16U & 255U) * 77 + (pixel >> 8U & 255U) * 151 + (pixel & 255U) * 28) >> 8U;
        return (pixel & alphaMask) | gray << 16U | gray << 8U | gray;
    }

    const ImagePixels& pixels;
    const ImageLook& look;
    int width;
    int height;
    int lastRow = -1;
    int lastMaskRow = -1;
    std::vector<std::uint32_t> source;
    std::vector<std::uint8_t> maskRow;
    std::vector<std::uint32_t> row;
};

/// The colours of an image as long as they are few.
class Palette {
public:
    /// Returns: the number of `pixel`, -1 when there is no room for it.
    int find(std::uint32_t pixel) {
        std::size_t slot = (pixel * 2654435761U) >> 22U;
        while (slots[slot] != 0 && colors[slots[slot] - 1] != pixel) {
            slot = (slot + 1) % slots.size();
        }
        if (slots[slot] == 0) {
            if (colors.size() == maxColors) {
                return -1;
            }
            colors.push_back(pixel);
            slots[slot] = static_cast<std::uint16_t>(colors.size());
        }
        return slots[slot] - 1;
    }

    std::vector<std::uint32_t> colors;

private:
    static constexpr std::size_t maxColors = 256;
    std::array<std::uint16_t, 1024> slots{}; // 1 more than the index, 0 when free
};

struct ImageFacts {
    Palette palette;
    bool hasFewColors = true;
    bool hasAlpha = false;
};

void inspectRow(const std::vector<std::uint32_t>& row, ImageFacts& facts) {
    std::uint32_t last = row.empty() ? 0 : ~row.front();
    for (const std::uint32_t pixel : row) {
        if (pixel == last) {
            continue;
        }
        last = pixel;
        facts.hasAlpha = facts.hasAlpha || (pixel & alphaMask) != alphaMask;
        facts.hasFewColors = facts.hasFewColors && facts.palette.find(pixel) >= 0;
    }
}

ImageFacts inspect(LookRows& rows) {
    ImageFacts facts;
    for (int y = 0; y < rows.getHeight() && (facts.hasFewColors || !facts.hasAlpha); ++y) {
        inspectRow(rows.read(y), facts);
    }
    return facts;
}

PngHeader makeHeader(const LookRows& rows, int depth, PNGCOLORS colors) {
    PngHeader header;
    header.width = static_cast<std::uint32_t>(rows.getWidth());
    header.height = static_cast<std::uint32_t>(rows.getHeight());
    header.depth = depth;
    header.colors = colors;
    return header;
}

int findDepth(std::size_t colors) {
    return colors <= 2 ? 1 : colors <= 4 ? 2 : colors <= 16 ? 4 : 8;
}

void setPalette(const Palette& palette, PngHeader& header) {
    for (const std::uint32_t color : palette.colors) {
        header.palette += {static_cast<char>(color >> 16U), static_cast<char>(color >> 8U),
                           static_cast<char>(color)};
        header.alphas += static_cast<char>(color >> 24U);
    }
    const auto last = header.alphas.find_last_not_of('\xFF');
    header.alphas.resize(last == std::string::npos ? 0 : last + 1);
}

std::string encodePalette(LookRows& rows, Palette& palette) {
    PngHeader header = makeHeader(rows, findDepth(palette.colors.size()), PNGCOLORS_PALETTE);
    setPalette(palette, header);
    const std::size_t rowBytes = (header.width * static_cast<std::size_t>(header.depth) + 7) / 8;
    std::vector<unsigned char> data(rowBytes * header.height);
    for (int y = 0; y < rows.getHeight(); ++y) {
        unsigned char* out = data.data() + rowBytes * static_cast<std::size_t>(y);
        int shift = 8;
        for (const std::uint32_t pixel : rows.read(y)) {
            shift -= header.depth;
            *out = static_cast<unsigned char>(*out | palette.find(pixel) << shift);
            if (shift == 0) {
                shift = 8;
                ++out;
            }
        }
    }
    return writePng(header, data.data(), rowBytes);
}

std::string encodeAlpha(LookRows& rows) {
    const PngHeader header = makeHeader(rows, 8, PNGCOLORS_RGBA);
    std::vector<unsigned char> data;
    data.reserve(std::size_t{header.width} * header.height * 4);
    for (int y = 0; y < rows.getHeight(); ++y) {
        for (const std::uint32_t pixel : rows.read(y)) {
            data.insert(data.end(),
                        {static_cast<unsigned char>(pixel >> 16U),
                         static_cast<unsigned char>(pixel >> 8U), static_cast<unsigned char>(pixel),
                         static_cast<unsigned char>(pixel >> 24U)});
        }
    }
    return writePng(header, data.data(), std::size_t{header.width} * 4);
}

void appendLittle(std::string& file, std::uint32_t number, int bytes) {
    for (int i = 0; i < bytes; ++i) {
        file.push_back(static_cast<char>(number >> (8 * i) & 0xFFU));
    }
}

std::string encodeBitmap(LookRows& rows) {
    constexpr std::uint32_t headerBytes = 54;
    const auto width = static_cast<std::uint32_t>(rows.getWidth());
    const auto height = static_cast<std::uint32_t>(rows.getHeight());
    const std::uint32_t rowBytes = (width * 3 + 3) / 4 * 4;
    std::string file = "BM";
    file.reserve(headerBytes + std::size_t{rowBytes} * height);
    for (const std::uint32_t field :
         {headerBytes + rowBytes * height, 0U, headerBytes, 40U, width, height, 24U << 16U | 1U, 0U,
          rowBytes * height, 0U, 0U, 0U, 0U}) {
        appendLittle(file, field, 4);
    }
    for (int y = rows.getHeight(); y-- > 0;) {
        for (const std::uint32_t pixel : rows.read(y)) {
            appendLittle(file, pixel, 3);
        }
        file.append(rowBytes - width * 3, '\0');
    }
    return file;
}

} // namespace

std::string encodeImage(const ImagePixels& pixels, const ImageLook& look) {
    if (pixels.isEmpty()) {
        return {};
    }
    LookRows rows(pixels, look);
    ImageFacts facts = inspect(rows);
    if (facts.hasFewColors) {
        return encodePalette(rows, facts.palette);
    }
    return facts.hasAlpha ? encodeAlpha(rows) : encodeBitmap(rows);
}

} // namespace DrawmereConvert
