#include "foundation/graphicservice/GS_PixelForm.h"

#include <algorithm>
#include <array>

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t mostColors = 256;

/// The set of colours met so far, with room for little more than a palette holds.
class ColorSet {
public:
    /// Returns: false when there are more colours than a palette holds.
    bool add(std::uint32_t color) {
        for (std::size_t i = hash(color);; i = (i + 1) % slotCount) {
            if (!isUsed[i]) {
                isUsed[i] = true;
                slots[i] = color;
                return ++count <= mostColors;
            }
            if (slots[i] == color) {
                return true;
            }
        }
    }

    std::vector<std::uint32_t> list() const {
        std::vector<std::uint32_t> colors;
        for (std::size_t i = 0; i < slotCount; ++i) {
            if (isUsed[i]) {
                colors.push_back(slots[i]);
            }
        }
        return colors;
    }

private:
    static constexpr std::size_t slotCount = 1024;

    static std::size_t hash(std::uint32_t color) {
        constexpr std::uint32_t factor = 0x9E3779B1;
        constexpr int shift = 22; // leaves the ten bits of a slot
        return color * factor >> shift;
    }

    std::array<std::uint32_t, slotCount> slots = {};
    std::array<bool, slotCount> isUsed = {};
    std::size_t count = 0;
};

/// Returns: the pixel as 0xAARRGGBB.
std::uint32_t readColor(const std::uint8_t* pixel, int channels) {
    const bool isGrey = channels < 3;
    const std::uint32_t red = pixel[0];
    const std::uint32_t green = pixel[isGrey ? 0 : 1];
    const std::uint32_t blue = pixel[isGrey ? 0 : 2];
    const std::uint32_t alpha = channels % 2 == 0 ? pixel[channels - 1] : UINT8_MAX;
    return alpha << 24 | red << 16 | green << 8 | blue;
}

bool isGreyRow(const GS_Bitmap& bitmap, int y) {
    const std::uint8_t* pixel = bitmap.getRow(y);
    for (int x = 0; x < bitmap.columns; ++x, pixel += bitmap.channels) {
        if (pixel[0] != pixel[1] || pixel[1] != pixel[2]) {
            return false;
        }
    }
    return true;
}

bool addRow(ColorSet& set, const GS_Bitmap& bitmap, int y) {
    const std::uint8_t* pixel = bitmap.getRow(y);
    std::uint32_t last = ~readColor(pixel, bitmap.channels);
    for (int x = 0; x < bitmap.columns; ++x, pixel += bitmap.channels) {
        const std::uint32_t color = readColor(pixel, bitmap.channels);
        if (color != last && !set.add(color)) {
            return false;
        }
        last = color;
    }
    return true;
}

/// Returns: the fewest bits that count `count` colours.
int findIndexDepth(std::size_t count) {
    int depth = 1;
    while ((std::size_t{1} << depth) < count) {
        depth *= 2;
    }
    return depth;
}

/// Returns: the fewest bits that hold all these greys as they are.
int findGreyDepth(const std::vector<std::uint32_t>& colors) {
    for (const int depth : {1, 2, 4}) {
        const unsigned step = UINT8_MAX / ((1U << depth) - 1U);
        if (std::ranges::all_of(
                colors, [step](std::uint32_t color) { return (color & 0xFF) % step == 0; })) {
            return depth;
        }
    }
    return 8;
}

} // namespace

GS_PixelForm::GS_PixelForm(const GS_Bitmap& bitmap) : channels(bitmap.channels) {
    dropAlpha(bitmap);
    dropColor(bitmap);
    collectColors(bitmap);
    reduceDepth();
}

void GS_PixelForm::convertRow(const GS_Bitmap& bitmap, int y, std::uint8_t* target) const {
    if (!colors.empty()) {
        index(bitmap, y, target);
        return;
    }
    const std::uint8_t* pixel = bitmap.getRow(y);
    const bool isGrey = channels < 3;
    const int shift = 8 - depth;
    for (int x = 0; x < bitmap.columns; ++x, pixel += bitmap.channels) {
        const int colorCount = isGrey ? 1 : 3;
        for (int i = 0; i < colorCount; ++i) {
            *target++ = static_cast<std::uint8_t>(pixel[i] >> shift);
        }
        if (channels % 2 == 0) {
            *target++ = pixel[bitmap.channels - 1];
        }
    }
}

void GS_PixelForm::dropAlpha(const GS_Bitmap& bitmap) {
    if (bitmap.hasAlpha() && !bitmap.isTransparent()) {
        --channels;
    }
}

/// On purpose: pixels with a profile of red, green and blue stay colours though all of them are
/// grey, as such a profile can't stand in a grey file.
void GS_PixelForm::dropColor(const GS_Bitmap& bitmap) {
    if (channels < 3 || !bitmap.profile.empty()) {
        return;
    }
    for (int y = 0; y < bitmap.rows; ++y) {
        if (!isGreyRow(bitmap, y)) {
            return;
        }
    }
    channels -= 2;
}

/// Keeps the colours when there are few; for pixels of opaque grey they tell the depth only.
void GS_PixelForm::collectColors(const GS_Bitmap& bitmap) {
    const bool hasGreyProfile = bitmap.channels < 3 && !bitmap.profile.empty();
    if (hasGreyProfile && channels == 2) {
        return;
    }
    ColorSet set;
    for (int y = 0; y < bitmap.rows; ++y) {
        if (!addRow(set, bitmap, y)) {
            return;
        }
    }
    colors = set.list();
    std::ranges::sort(colors); // the transparent ones first, and the same file every time
}

void GS_PixelForm::reduceDepth() {
    if (colors.empty()) {
        return;
    }
    if (channels == 1) {
        depth = findGreyDepth(colors);
        colors.clear();
        return;
    }
    depth = findIndexDepth(colors.size());
    channels = 1;
}

void GS_PixelForm::index(const GS_Bitmap& bitmap, int y, std::uint8_t* target) const {
    const std::uint8_t* pixel = bitmap.getRow(y);
    std::uint32_t last = ~readColor(pixel, bitmap.channels);
    std::uint8_t found = 0;
    for (int x = 0; x < bitmap.columns; ++x, pixel += bitmap.channels) {
        const std::uint32_t color = readColor(pixel, bitmap.channels);
        if (color != last) {
            const auto place = std::ranges::lower_bound(colors, color) - colors.begin();
            found = static_cast<std::uint8_t>(place);
            last = color;
        }
        *target++ = found;
    }
}

} // namespace MoxGraphicService_NS
