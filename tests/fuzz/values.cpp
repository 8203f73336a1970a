// Numbers, colours, lengths and matrices: what is printed reads back as what it was.
#include "foundation/common/MoxNumberText.h"
#include "foundation/common/MoxParser.h"
#include "foundation/common/MoxUtil.h"
#include "path/SVGDrawElement.h"
#include "state/SVGGraphicContext.h"
#include "tests/fuzz/Require.h"
#include "tests/path/PlainNumberRule.h"
#include "tests/support/Choices.h"
#include "tests/support/Utf8.h"

#include <cmath>

using namespace DrawmereTest;
using namespace DrawmereNS;
using namespace MoxCommonNS;

namespace {

float makeFloat(Choices& choices) { return std::bit_cast<float>(choices.number()); }

MoxValue parse(const UnicodeString& text) {
    return MoxParser::parse(text, 0, MoxTokenizer::TOKENIZER_DEFAULT);
}

void checkDecimal(const std::string& text) {
    require(text.find_first_not_of("-.0123456789") == std::string::npos && !text.ends_with('.'),
            text + " is no plain number");
    require(text != "-0", "there is no minus zero");
}

void checkFloat(Choices& choices) {
    const float number = makeFloat(choices);
    const std::string text = utf8(MoxUtil::toString(static_cast<double>(number)));
    checkDecimal(text);
    const float read = parse(UnicodeString::fromUTF8(text)).getRealValue(MOXUNIT_NONE);
    require(read == (std::isfinite(number) ? number : 0.0F), text + " reads as something else");
    require(utf8(MoxValue(number).toString()) == text, text + " is another text as a value");
}

void checkDouble(Choices& choices) {
    const std::uint64_t high = choices.number();
    const auto number = std::bit_cast<double>(high << 32U | choices.number());
    const std::string text = utf8(MoxUtil::toString(number));
    checkDecimal(text);
    const bool isFloat = static_cast<double>(static_cast<float>(number)) == number;
    const double read = isFloat ? static_cast<double>(std::strtof(text.c_str(), nullptr))
                                : std::strtod(text.c_str(), nullptr);
    require(read == (std::isfinite(number) ? number : 0.0), text + " reads as something else");
}

void checkInteger(Choices& choices) {
    const int number = static_cast<int>(choices.number());
    const MoxValue read = parse(MoxUtil::toString(number));
    require(read.getType() == MOXVALUE_INTEGER && read.getIntegerValue() == number,
            std::to_string(number));
}

void checkRuleNumber(Choices& choices) {
    NumberRuleCheck rule;
    rule.check(makeFloat(choices));
    require(rule.faults == 0, rule.lastFault);
}

// A buffer of any size holds the beginning of the text.
void checkRuleBuffer(Choices& choices) {
    const MoxLength length = MoxLength::fromRaw(makeFloat(choices));
    const std::string whole = utf8(SVGDrawElement::makeLengthToStringValue(length));
    std::string buffer(choices.below(64), 'x');
    SVGDrawElement::makeLengthToStringValue(length, buffer.data(), buffer.size());
    if (!buffer.empty()) {
        const std::string written = buffer.c_str();
        require(whole.starts_with(written), written + " is no part of " + whole);
        require(written.size() == std::min(whole.size(), buffer.size() - 1), whole + " was cut");
    }
}

void checkColor(Choices& choices) {
    const MoxColor color(choices.number());
    const bool withAlpha = choices.flag();
    const UnicodeString text = color.toString(true, withAlpha, choices.flag());
    if (text.startsWith(u"rgba")) {
        return; // CSS has it, SVG 1.1 can't read it
    }
    MoxColor read;
    require(MoxParser::readColor(text, true, read), utf8(text) + " is no colour");
    const bool isSame = color.getAlpha() == 0 ? read.getAlpha() == 0
                                              : read.getRed() == color.getRed() &&
                                                    read.getGreen() == color.getGreen() &&
                                                    read.getBlue() == color.getBlue();
    require(isSame, utf8(text) + " is another colour");
}

void checkColorText(Choices& choices) {
    const UnicodeString text = UnicodeString::fromUTF8(choices.takeBytes(choices.below(40)));
    MoxColor strict;
    MoxColor loose;
    const bool isStrict = MoxParser::readColor(text, true, strict);
    const bool isLoose = MoxParser::readColor(text, false, loose);
    require(!isStrict || (isLoose && strict == loose), utf8(text) + " is two colours");
    require(isLoose || loose.getAlpha() == 0, utf8(text) + " is not transparent");
}

// Texts that are values keep their type and their content when they are printed and read again.
void checkValueText(Choices& choices) {
    const UnicodeString text = UnicodeString::fromUTF8(choices.takeBytes(choices.below(60)));
    const MoxValue value = parse(text);
    const UnicodeString printed = value.toString();
    if (value.getType() == MOXVALUE_COLOR) {
        MoxColor read;
        require(MoxParser::readColor(printed, true, read) && MoxValue(read) == value,
                utf8(text) + " became " + utf8(printed));
        return;
    }
    const MoxValue again = parse(printed);
    const bool isWhole = value.getType() == MOXVALUE_REAL && printed.indexOf(u'.') < 0;
    require(again == value || isWhole, utf8(text) + " became " + utf8(printed));
    require(again.getRealValue(MOXUNIT_NONE) == value.getRealValue(MOXUNIT_NONE),
            utf8(text) + " has another number than " + utf8(printed));
}

void checkUnits(Choices& choices) {
    const float number = makeFloat(choices);
    const auto unit = static_cast<MoxUnitType>(choices.below(12));
    const float back = MoxLength(number, unit).getRealValue(unit);
    constexpr float most = 1e36F;
    constexpr float least = 1e-36F;
    if (std::fabs(number) < most && std::fabs(number) > least) {
        require(std::fabs(back - number) <= std::fabs(number) * 2e-7F, std::to_string(number));
    }
}

SVGMatrix makeMatrix(Choices& choices) {
    float numbers[6];
    for (float& number : numbers) {
        constexpr float usual[] = {0.0F, 1.0F, -1.0F, 0.5F, 2.0F, 90.0F};
        number = choices.flag() ? choices.pick(usual) : makeFloat(choices);
    }
    return {numbers[0], numbers[1], numbers[2], numbers[3], numbers[4], numbers[5]};
}

// The list of numbers in the parentheses of a transform.
std::vector<float> readNumbers(const std::string& text) {
    std::vector<float> numbers;
    const char* next = text.c_str() + text.find('(');
    while (*next == '(' || *next == ',' || *next == ' ') {
        char* end = nullptr;
        numbers.push_back(std::strtof(next + 1, &end));
        require(end != next + 1, text);
        checkDecimal(std::string(next + 1, static_cast<const char*>(end)));
        next = end;
    }
    require(std::string_view(next) == ")", text + " does not end");
    return numbers;
}

float finite(float number) { return std::isfinite(number) ? number : 0.0F; }

void checkMatrix(Choices& choices) {
    SVGMatrix matrix = makeMatrix(choices);
    const std::string text = utf8(SVGGraphicContext::convertMatrixToString(matrix));
    if (text.empty()) {
        return;
    }
    const std::vector<float> numbers = readNumbers(text);
    const std::vector<float> all = {finite(matrix.a), finite(matrix.b), finite(matrix.c),
                                    finite(matrix.d), finite(matrix.e), finite(matrix.f)};
    require(!text.starts_with("matrix") || numbers == all, text + " has other numbers");
    SVGMatrix inverse = matrix.inverse();
    SVGMatrix product = matrix.multiply(inverse);
    product.setType();
    inverse.setType();
}

constexpr void (*checks[])(Choices& choices) = {
    checkFloat, checkDouble,    checkInteger,   checkRuleNumber, checkRuleBuffer,
    checkColor, checkColorText, checkValueText, checkUnits,      checkMatrix,
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Choices choices(inputOf(data, size));
    while (!choices.isUsedUp()) {
        choices.pick(checks)(choices);
    }
    return 0;
}
