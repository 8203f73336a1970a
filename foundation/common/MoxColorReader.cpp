#include "foundation/common/MoxColorReader.h"

#include "foundation/common/MoxAsciiChars.h"

#include <algorithm>
#include <cmath>
#include <functional>
#include <iterator>

namespace MoxCommonNS {
namespace {

struct NamedColor {
    std::uint32_t rgb;
    std::u16string_view name;
};

constexpr NamedColor svgColors[] = {
#define MOX_COLOR(rgb, text) {rgb, text},
#include "foundation/common/MoxSvgColors.def"
#undef MOX_COLOR
};

static_assert(std::size(svgColors) == 147);
static_assert(std::ranges::adjacent_find(svgColors, std::greater_equal<>(), &NamedColor::name) ==
                  std::end(svgColors),
              "the names are sorted, for the binary search");

constexpr std::size_t longestName = std::ranges::max(svgColors, {}, [](const NamedColor& color) {
                                        return color.name.size();
                                    }).name.size();

constexpr std::u16string_view transparentWord = u"transparent";
constexpr std::uint32_t transparentBlack = 0xFF000000;

/// What a component may grow to while its digits are read; it is clamped to 255 in the end.
constexpr double componentLimit = 1.0e6;
/// Where the digits behind a point stop to count: more of them change no component.
constexpr double divisorLimit = 1.0e15;

const NamedColor* findColor(std::u16string_view name) {
    if (name.empty() || name.size() > longestName) {
        return nullptr;
    }
    char16_t buffer[longestName];
    std::ranges::transform(name, buffer, toAsciiLower);
    const std::u16string_view lower(buffer, name.size());
    const NamedColor* found = std::ranges::lower_bound(svgColors, lower, {}, &NamedColor::name);
    return found != std::end(svgColors) && found->name == lower ? found : nullptr;
}

/// Returns: the value of a hexadecimal digit, -1 for any other character.
int hexValue(char16_t c) {
    if (isAsciiDigit(c)) {
        return c - u'0';
    }
    const char16_t lower = toAsciiLower(c);
    return lower >= u'a' && lower <= u'f' ? lower - u'a' + 10 : -1;
}

/// Characters that would make a longer word of a name, which is then another name.
bool isWordChar(char16_t c) {
    return isAsciiLetter(c) || isAsciiDigit(c) || c == u'-' || c == u'_' || c >= 0x80;
}

int clampComponent(double number) {
    return static_cast<int>(std::lround(std::clamp(number, 0.0, 255.0)));
}

} // namespace

bool MoxColorReader::read(MoxColor& color) {
    skipSpace();
    return accept(u'#') ? readHex(color) : readName(color);
}

bool MoxColorReader::isAtEnd() {
    skipSpace();
    return position == text.size();
}

bool MoxColorReader::accept(char16_t c) {
    if (position < text.size() && text[position] == c) {
        ++position;
        return true;
    }
    return false;
}

void MoxColorReader::skipSpace() {
    while (isXmlSpace(peek())) {
        ++position;
    }
}

/// Returns: the digits at the cursor as a whole number, which stops growing far out of range.
double MoxColorReader::readWhole() {
    double number = 0.0;
    for (; isAsciiDigit(peek()); ++position) {
        number = std::min(number * 10.0 + (peek() - u'0'), componentLimit);
    }
    return number;
}

/// Returns: the digits at the cursor as they count behind a point.
double MoxColorReader::readFraction() {
    double number = 0.0;
    double divisor = 1.0;
    for (; isAsciiDigit(peek()); ++position) {
        if (divisor < divisorLimit) {
            number = number * 10.0 + (peek() - u'0');
            divisor *= 10.0;
        }
    }
    return number / divisor;
}

std::u16string_view MoxColorReader::readWord() {
    const std::size_t start = position;
    while (isWordChar(peek())) {
        ++position;
    }
    return text.substr(start, position - start);
}

bool MoxColorReader::readHex(MoxColor& color) {
    const std::u16string_view digits = readWord();
    if (digits.size() != 3 && digits.size() != 6) {
        return false;
    }
    const int copies = digits.size() == 3 ? 2 : 1;
    std::uint32_t rgb = 0;
    for (const char16_t digit : digits) {
        const int value = hexValue(digit);
        if (value < 0) {
            return false;
        }
        for (int i = 0; i < copies; ++i) {
            rgb = rgb << 4U | static_cast<std::uint32_t>(value);
        }
    }
    color = MoxColor(rgb);
    return true;
}

bool MoxColorReader::readName(MoxColor& color) {
    const std::u16string_view word = readWord();
    if (accept(u'(')) {
        return equalsIgnoreCase(word, u"rgb") && readFunction(color);
    }
    if (equalsIgnoreCase(word, transparentWord)) {
        color = MoxColor(transparentBlack);
        return true;
    }
    const NamedColor* named = findColor(word);
    if (named) {
        color = MoxColor(named->rgb);
    }
    return named != nullptr;
}

bool MoxColorReader::readFunction(MoxColor& color) {
    Component components[3];
    for (Component& component : components) {
        const bool isFirst = &component == components;
        if ((!isFirst && !accept(u',')) || !readComponent(component) ||
            component.isPercentage != components[0].isPercentage) {
            return false;
        }
    }
    if (!accept(u')')) {
        return false;
    }
    color = MoxColor(clampComponent(components[0].number), clampComponent(components[1].number),
                     clampComponent(components[2].number));
    return true;
}

/// Reads one component and the white space around it.
bool MoxColorReader::readComponent(Component& component) {
    skipSpace();
    const bool isNegative = accept(u'-');
    if (!isNegative) {
        accept(u'+');
    }
    const std::size_t start = position;
    component.number = readWhole();
    bool hasDigits = position > start;
    if (accept(u'.')) {
        component.isWhole = false;
        hasDigits = isAsciiDigit(peek());
        component.number += readFraction();
    }
    component.isPercentage = accept(u'%');
    if (component.isPercentage) {
        component.number = component.number * 255.0 / 100.0;
    }
    component.number = isNegative ? -component.number : component.number;
    skipSpace();
    return hasDigits && (component.isWhole || component.isPercentage);
}

} // namespace MoxCommonNS
