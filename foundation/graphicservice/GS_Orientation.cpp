#include "foundation/graphicservice/GS_Orientation.h"

#include <algorithm>

namespace MoxGraphicService_NS {
namespace {

/// How an orientation is undone, by number.
struct Turn {
    bool isTransposed; // columns become rows, before the two others
    bool fromRight;
    bool fromBottom;
};

constexpr Turn turns[] = {
    {false, false, false}, // no such number
    {false, false, false}, // 1: as it is
    {false, true, false},  // 2: mirrored
    {false, true, true},   // 3: upside down
    {false, false, true},  // 4: upside down and mirrored
    {true, false, false},  // 5: mirrored along the diagonal
    {true, true, false},   // 6: a quarter clockwise
    {true, true, true},    // 7: mirrored along the other diagonal
    {true, false, true},   // 8: a quarter counterclockwise
};

} // namespace

bool turnBitmap(const GS_Bitmap& source, int orientation, GS_Bitmap& target) {
    const Turn turn = turns[orientation];
    const int columns = turn.isTransposed ? source.rows : source.columns;
    const int rows = turn.isTransposed ? source.columns : source.rows;
    if (!target.allocate(columns, rows, source.channels)) {
        return false;
    }
    target.profile = source.profile;
    for (int y = 0; y < rows; ++y) {
        std::uint8_t* to = target.getRow(y);
        const int fromY = turn.fromBottom ? rows - 1 - y : y;
        for (int x = 0; x < columns; ++x, to += target.channels) {
            const int fromX = turn.fromRight ? columns - 1 - x : x;
            const std::uint8_t* from =
                source.getRow(turn.isTransposed ? fromX : fromY) +
                static_cast<std::ptrdiff_t>(turn.isTransposed ? fromY : fromX) * source.channels;
            std::copy_n(from, source.channels, to);
        }
    }
    return true;
}

} // namespace MoxGraphicService_NS
