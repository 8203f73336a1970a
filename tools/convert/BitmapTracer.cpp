#include "tools/convert/BitmapTracer.h"

#include <array>

namespace DrawmereConvert {
namespace {

/// A step along the sides of pixels, with what is set on its right.
struct Step {
    int x;
    int y;
    // The pixels ahead on the left and on the right of the way, against the corner reached.
    int leftX;
    int leftY;
    int rightX;
    int rightY;
};

// Right, down, left, up: to turn right is the next, to turn left the one before.
constexpr std::array<Step, 4> steps = {{
    {1, 0, 0, -1, 0, 0},
    {0, 1, 0, 0, -1, 0},
    {-1, 0, -1, 0, -1, -1},
    {0, -1, -1, -1, 0, -1},
}};

class Tracer {
public:
    Tracer(const ImagePixels& mask, std::size_t limit)
        : width(mask.getWidth()), height(mask.getHeight()), maxCorners(limit),
          pixels(static_cast<std::size_t>(width) * height), isTaken(pixels.size()) {
        std::vector<std::uint8_t> row;
        for (int y = 0; y < height; ++y) {
            mask.readMaskRow(y, row);
            for (int x = 0; x < width; ++x) {
                pixels[indexOf(x, y)] = row[x] > 127;
            }
        }
    }

    std::vector<BitmapLoop> run() {
        std::vector<BitmapLoop> loops;
        for (int y = 0; y < height; ++y) {
            for (int x = 0; x < width; ++x) {
                if (isSet(x, y) && !isSet(x, y - 1) && !isTaken[indexOf(x, y)]) {
                    loops.push_back(follow(x, y));
                }
                if (corners > maxCorners) {
                    return {};
                }
            }
        }
        return loops;
    }

private:
    std::size_t indexOf(int x, int y) const { return static_cast<std::size_t>(y) * width + x; }

    bool isSet(int x, int y) const {
        return x >= 0 && y >= 0 && x < width && y < height && pixels[indexOf(x, y)];
    }

    /// Follows the line that begins with the upper side of a pixel.
    BitmapLoop follow(const int startX, const int startY) {
        BitmapLoop loop;
        int x = startX;
        int y = startY;
        std::size_t way = 0;
        do {
            if (way == 0) {
                isTaken[indexOf(x, y)] = true;
            }
            x += steps[way].x;
            y += steps[way].y;
            const std::size_t next = turn(x, y, way);
            if (next != way) {
                loop.push_back({static_cast<float>(x) / static_cast<float>(width),
                                static_cast<float>(y) / static_cast<float>(height)});
                way = next;
            }
        } while (x != startX || y != startY || way != 0);
        corners += loop.size();
        return loop;
    }

    std::size_t turn(int x, int y, std::size_t way) const {
        const Step& step = steps[way];
        if (!isSet(x + step.rightX, y + step.rightY)) {
            return (way + 1) % steps.size();
        }
        const bool isBlocked = isSet(x + step.leftX, y + step.leftY);
        return isBlocked ? (way + steps.size() - 1) % steps.size() : way;
    }

    int width;
    int height;
    std::size_t maxCorners;
    std::size_t corners = 0;
    std::vector<bool> pixels;
    std::vector<bool> isTaken; // upper sides that a line has passed
};

} // namespace

std::vector<BitmapLoop> traceBitmap(const ImagePixels& mask, std::size_t maxCorners) {
    return Tracer(mask, maxCorners).run();
}

} // namespace DrawmereConvert
