// Writing characters, with references for those that can't stand as they are.
#include "foundation/common/MoxKeptText.h"
#include "foundation/common/MoxXmlChars.h"
#include "foundation/common/MoxXmlScan.h"
#include "foundation/common/MoxXmlWriter.h"

#include <array>
#include <unicode/utf16.h>
#include <unicode/utf8.h>

namespace MoxCommonNS {
namespace {

constexpr std::string_view lineFeedReference = "&#10;";

struct Escape {
    char character;
    bool onlyInAttributes;
    std::string_view reference;
};

// A line feed or a tab in an attribute, and a carriage return anywhere, would be changed by a
// reader. What the byte of a delete character means differs from reader to reader.
constexpr Escape escapes[] = {
    {'<', false, "&lt;"},   {'&', false, "&amp;"},     {'>', false, "&gt;"},
    {'"', true, "&quot;"},  {'\t', true, "&#9;"},      {'\n', true, lineFeedReference},
    {'\r', false, "&#13;"}, {'\x7F', false, "&#127;"},
};

/// Bit 1: not as it is in text; bit 2: not as it is in an attribute.
constexpr std::array<std::uint8_t, 128> specialCharacters = [] {
    std::array<std::uint8_t, 128> marks = {};
    for (UChar32 c = 0; c < 128; ++c) {
        marks[c] = isXmlChar(c) ? 0 : 3;
    }
    for (const Escape& escape : escapes) {
        marks[static_cast<unsigned char>(escape.character)] = escape.onlyInAttributes ? 2 : 3;
    }
    return marks;
}();

bool isSpecial(char16_t c, bool inAttribute) {
    return (specialCharacters[c] & (inAttribute ? 2 : 1)) != 0;
}

/// The control characters behind ASCII: not every reader has them in the encodings of one byte.
bool isControl(UChar32 codePoint) { return codePoint >= 0x80 && codePoint < 0xA0; }

bool mustEscape(UChar32 codePoint, bool inAttribute) {
    return codePoint < 128 ? isSpecial(static_cast<char16_t>(codePoint), inAttribute)
                           : isControl(codePoint) || !isXmlChar(codePoint);
}

/// Reads what stands at `i` and moves `i` behind it; half a surrogate pair comes as it is.
UChar32 takeCodePoint(std::u16string_view text, std::size_t& i) {
    UChar32 codePoint = 0;
    U16_NEXT(text.data(), i, text.size(), codePoint);
    return codePoint;
}

/// Returns: the end of the bytes.
char* writeUtf8(UChar32 codePoint, char* out) {
    std::size_t length = 0;
    auto* bytes = reinterpret_cast<std::uint8_t*>(out);
    U8_APPEND_UNSAFE(bytes, length, codePoint);
    return out + length;
}

} // namespace

void MoxXmlWriter::writeText(const MoxValue& text, bool inAttribute) {
    if (text.isWideText()) {
        writeWide(text.getWideText(), inAttribute);
    } else {
        writeAscii(text.getAsciiText(), inAttribute);
    }
}

void MoxXmlWriter::writeAscii(std::string_view text, bool inAttribute) {
    std::size_t start = 0;
    std::size_t i = findXmlMarkup(text, 0);
    while (i < text.size()) {
        const auto c = static_cast<unsigned char>(text[i]);
        if (isSpecial(c, inAttribute)) {
            sink.write(text.substr(start, i - start));
            writeEscaped(c, inAttribute);
            start = i + 1;
        }
        i = findXmlMarkup(text, i + 1);
    }
    sink.write(text.substr(start));
}

/// A document with a hole must not pass for a whole one, so a text that is lost ends the writing.
void MoxXmlWriter::writeKept(const MoxKeptText& text) {
    static_assert(lineFeedReference.size() <= MoxKeptText::maxLineFeed);
    const auto write = [this](std::string_view piece) { sink.write(piece); };
    if (!text.handOut(lineFeedReference, write)) {
        sink.fail();
    }
}

void MoxXmlWriter::writeWide(std::u16string_view text, bool inAttribute) {
    std::size_t i = 0;
    while (i < text.size()) {
        const UChar32 codePoint = takeCodePoint(text, i);
        if (mustEscape(codePoint, inAttribute)) {
            writeEscaped(codePoint, inAttribute);
        } else {
            sink.advance(writeUtf8(codePoint, sink.room(U8_MAX_LENGTH)));
        }
    }
}

void MoxXmlWriter::writeEscaped(UChar32 codePoint, bool inAttribute) {
    for (const Escape& escape : escapes) {
        if (escape.character == codePoint && (inAttribute || !escape.onlyInAttributes)) {
            sink.write(escape.reference);
            return;
        }
    }
    if (isControl(codePoint)) {
        sink.write("&#");
        writeInteger(codePoint);
        sink.write(';');
        return;
    }
    // The replacement character U+FFFD stands for what XML forbids.
    sink.write("\xEF\xBF\xBD");
}

} // namespace MoxCommonNS
