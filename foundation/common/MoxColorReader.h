/// Reads a colour from a text.
#pragma once

#include "foundation/common/MoxColor.h"

#include <cstddef>
#include <string_view>

namespace MoxCommonNS {

/// A cursor that reads one colour of SVG 1.1: one of its 147 colour names, "#rgb", "#rrggbb", or
/// "rgb(...)" with three integers or three percentages, all in any case. As in CSS2, numbers may
/// have signs and white space around them, and values out of range are clamped; whole numbers and
/// percentages don't mix. "transparent" is read too.
class MoxColorReader {
public:
    /// Borrows: the characters of `content`, as long as the reader is used.
    explicit MoxColorReader(std::u16string_view content) : text(content) {}

    /// Reads white space and the colour behind it.
    /// Returns: false when there is none, which leaves `color` as it was.
    bool read(MoxColor& color);

    /// Returns: true when nothing but white space is left.
    bool isAtEnd();

private:
    struct Component {
        double number = 0.0;
        bool isWhole = true;
        bool isPercentage = false;
    };

    char16_t peek() const { return position < text.size() ? text[position] : u'\0'; }

    bool accept(char16_t c);
    void skipSpace();
    double readWhole();
    double readFraction();
    std::u16string_view readWord();
    bool readHex(MoxColor& color);
    bool readName(MoxColor& color);
    bool readFunction(MoxColor& color);
    bool readComponent(Component& component);

    std::u16string_view text;
    std::size_t position = 0;
};

} // namespace MoxCommonNS
