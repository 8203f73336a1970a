#include "foundation/common/MoxValue.h"

#include "foundation/common/MoxAsciiChars.h"
#include "foundation/common/MoxAsciiText.h"
#include "foundation/common/MoxKeptText.h"
#include "foundation/common/MoxMutex.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxNamedValueMap.h"
#include "foundation/common/MoxNumberText.h"
#include "foundation/common/MoxParser.h"
#include "foundation/common/MoxUnitWords.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <new>
#include <string>

namespace MoxCommonNS {

/// A text on the heap: its length in code units, then the units. Values that are copies of each
/// other share it, as nobody changes it.
struct MoxValue::HeapText {
    std::uint32_t length;
    int users = 1;

    template <typename Unit> Unit* units() { return reinterpret_cast<Unit*>(this + 1); }

    static HeapText* make(std::size_t length, std::size_t unitSize) {
        void* memory = std::malloc(sizeof(HeapText) + length * unitSize);
        if (!memory) {
            throw std::bad_alloc();
        }
        return new (memory) HeapText{static_cast<std::uint32_t>(length)};
    }
};

/// A text in a block that came from outside.
struct MoxValue::AdoptedText {
    MoxByteBlock block;
    std::string_view text; // in the block
};

namespace {

const MoxNamedValueMap& emptyMap() {
    static const MoxNamedValueMap& map = *new MoxNamedValueMap;
    return map;
}

UnicodeString fromBytes(const char* text, std::size_t length) {
    UnicodeString result(static_cast<std::int32_t>(length), 0, 0);
    char16_t* units = result.getBuffer(static_cast<std::int32_t>(length));
    if (!units) {
        throw std::bad_alloc();
    }
    std::transform(text, text + length, units,
                   [](char c) { return static_cast<char16_t>(static_cast<unsigned char>(c)); });
    result.releaseBuffer(static_cast<std::int32_t>(length));
    return result;
}

std::int32_t clampToInteger(double number) {
    constexpr double lowest = std::numeric_limits<std::int32_t>::min();
    constexpr double highest = std::numeric_limits<std::int32_t>::max();
    return std::isnan(number) ? 0 : static_cast<std::int32_t>(std::clamp(number, lowest, highest));
}

/// The number that a text begins with, and the unit behind it if there is one.
struct LeadingNumber {
    double number = 0.0;
    MoxUnitType unit = MOXUNIT_NONE;
};

/// The unit that all the letters at the beginning of `text` name, so "in" of "inch" is none.
MoxUnitType readUnit(std::string_view text) {
    const auto* end = std::find_if_not(
        text.begin(), text.end(), [](char c) { return isAsciiLetter(static_cast<char16_t>(c)); });
    const std::u16string letters(text.begin(), end);
    for (const MoxWord<MoxUnitType>& unit : unitWords) {
        if (equalsIgnoreCase(letters, unit.word)) {
            return unit.key;
        }
    }
    return MOXUNIT_NONE;
}

LeadingNumber readLeadingNumber(const UnicodeString& source) {
    std::string text;
    UnicodeString(source).trim().toUTF8String(text);
    const char* start = text.data();
    const char* last = start + text.size();
    if (text.size() > 1 && text[0] == '+' && text[1] != '-') {
        ++start;
    }
    LeadingNumber result;
    const auto [end, error] =
        std::from_chars(start, last, result.number, std::chars_format::general);
    if (error != std::errc() || !std::isfinite(result.number)) {
        return {};
    }
    result.unit = readUnit({end, static_cast<std::size_t>(last - end)});
    return result;
}

} // namespace

constinit const MoxValue MoxValue::NULL_VALUE;

void MoxValue::storeText(std::u16string_view text) {
    type = MOXVALUE_STRING;
    if (!isAscii(text)) {
        storeWide(text);
        return;
    }
    char* target = bytes;
    if (text.size() <= inlineCapacity) {
        form = static_cast<std::uint8_t>(text.size());
    } else {
        HeapText* heap = HeapText::make(text.size(), sizeof(char));
        target = heap->units<char>();
        store(MOXVALUE_STRING, heap);
        form = asciiForm;
    }
    narrowAscii(text, target);
}

MoxValue::MoxValue(const MoxNamedValueMap& map) {
    store(MOXVALUE_MAP, new MoxNamedValueMap(map));
    form = mapForm;
}

MoxValue MoxValue::fromAscii(std::string_view text) {
    if (text.size() > static_cast<std::size_t>(std::numeric_limits<std::int32_t>::max())) {
        throw std::bad_alloc(); // as far as a string can count
    }
    if (!isAscii(text)) {
        return {fromBytes(text.data(), text.size())};
    }
    MoxValue result;
    result.storeAscii(text);
    return result;
}

MoxValue MoxValue::adoptAscii(MoxByteBlock block, std::size_t begin, std::size_t length) {
    MoxValue result;
    const std::string_view text(block.get() + begin, length);
    result.store(MOXVALUE_STRING, new AdoptedText{std::move(block), text});
    result.form = adoptedForm;
    return result;
}

MoxValue MoxValue::fromKept(const MoxPtr<MoxKeptText>& text) {
    MoxValue result;
    text->addRef();
    result.store(MOXVALUE_STRING, static_cast<const MoxKeptText*>(text.get()));
    result.form = keptForm;
    return result;
}

void MoxValue::storeAscii(std::string_view text) {
    type = MOXVALUE_STRING;
    if (text.size() <= inlineCapacity) {
        std::copy(text.begin(), text.end(), bytes);
        form = static_cast<std::uint8_t>(text.size());
        return;
    }
    HeapText* heap = HeapText::make(text.size(), sizeof(char));
    std::copy(text.begin(), text.end(), heap->units<char>());
    store(MOXVALUE_STRING, heap);
    form = asciiForm;
}

void MoxValue::storeWide(std::u16string_view text) {
    HeapText* heap = HeapText::make(text.size(), sizeof(char16_t));
    std::copy(text.begin(), text.end(), heap->units<char16_t>());
    store(MOXVALUE_STRING, heap);
    form = wideForm;
}

void MoxValue::cloneHeap() {
    if (form == mapForm) {
        store(MOXVALUE_MAP, new MoxNamedValueMap(*load<MoxNamedValueMap*>()));
        return;
    }
    if (form == adoptedForm) {
        storeAscii(load<AdoptedText*>()->text);
        return;
    }
    if (form == keptForm) {
        getKeptText()->addRef();
        return;
    }
    MoxMutex::interlockedIncrement(load<HeapText*>()->users);
}

void MoxValue::freeHeap() {
    if (form == mapForm) {
        delete load<MoxNamedValueMap*>();
    } else if (form == adoptedForm) {
        delete load<AdoptedText*>();
    } else if (form == keptForm) {
        getKeptText()->release();
    } else {
        releaseText();
    }
}

void MoxValue::releaseText() {
    auto* text = load<HeapText*>();
    if (MoxMutex::interlockedDecrement(text->users) == 0) {
        std::free(text);
    }
}

/// Returns: the ASCII bytes of a string on the heap, nothing of any other value.
std::string_view MoxValue::getLongText() const {
    if (form == asciiForm) {
        auto* heap = load<HeapText*>();
        return {heap->units<char>(), heap->length};
    }
    if (form == adoptedForm) {
        return load<AdoptedText*>()->text;
    }
    if (form == keptForm) {
        return getKeptText()->getText();
    }
    return {};
}

std::u16string_view MoxValue::getWideText() const {
    if (form != wideForm) {
        return {};
    }
    auto* heap = load<HeapText*>();
    return {heap->units<char16_t>(), heap->length};
}

bool MoxValue::equalText(const MoxValue& other) const {
    if (form == keptForm && getKeptText() == other.getKeptText()) {
        return true;
    }
    // A text that is ASCII is never kept wide, so texts of two forms differ.
    return isWideText() == other.isWideText() && getAsciiText() == other.getAsciiText() &&
           getWideText() == other.getWideText();
}

bool MoxValue::operator==(const MoxValue& other) const {
    if (type != other.type) {
        return false;
    }
    switch (type) {
    case MOXVALUE_NULL:
        return true;
    case MOXVALUE_REAL:
    case MOXVALUE_LENGTH:
        return getFloat() == other.getFloat();
    case MOXVALUE_STRING:
        return equalText(other);
    case MOXVALUE_MAP:
        return getNamedValueMap() == other.getNamedValueMap();
    default:
        return load<std::uint32_t>() == other.load<std::uint32_t>();
    }
}

UnicodeString MoxValue::toString() const {
    char text[maxRealText];
    switch (type) {
    case MOXVALUE_INTEGER:
        return fromBytes(text, writeInteger(load<std::int32_t>(), text));
    case MOXVALUE_REAL:
        return fromBytes(text, writeReal(getFloat(), text));
    case MOXVALUE_LENGTH:
        return fromBytes(text, writeReal(getFloat(), text)).append(u"pt", 2);
    case MOXVALUE_NAME:
        return MoxNameTable::getSharedNameString(getNameValue());
    case MOXVALUE_COLOR:
        return getColorValue().toString(true, false, false);
    case MOXVALUE_STRING:
        break;
    default:
        return {};
    }
    if (isWideText()) {
        const std::u16string_view wide = getWideText();
        return {wide.data(), static_cast<std::int32_t>(wide.size())};
    }
    return fromBytes(getAsciiText().data(), getAsciiText().size());
}

std::int32_t MoxValue::getIntegerValue() const {
    switch (type) {
    case MOXVALUE_INTEGER:
        return load<std::int32_t>();
    case MOXVALUE_REAL:
    case MOXVALUE_LENGTH:
        return clampToInteger(static_cast<double>(getFloat()));
    case MOXVALUE_STRING:
    case MOXVALUE_NAME:
        return clampToInteger(readLeadingNumber(toString()).number);
    default:
        return 0;
    }
}

float MoxValue::getRealValue(MoxUnitType unit) const {
    switch (type) {
    case MOXVALUE_INTEGER:
        return static_cast<float>(load<std::int32_t>());
    case MOXVALUE_REAL:
        return getFloat();
    case MOXVALUE_LENGTH:
        return MoxLength::fromRaw(getFloat()).getRealValue(unit);
    case MOXVALUE_STRING:
    case MOXVALUE_NAME:
        break;
    default:
        return 0.0F;
    }
    const LeadingNumber leading = readLeadingNumber(toString());
    const auto number = static_cast<float>(leading.number);
    const bool convert = leading.unit != MOXUNIT_NONE && findWord(unitWords, unit) != nullptr;
    return convert ? MoxLength(number, leading.unit).getRealValue(unit) : number;
}

MoxColor MoxValue::getColorValue() const {
    if (type == MOXVALUE_COLOR) {
        return {load<std::uint32_t>()};
    }
    MoxColor color(0, 0, 0, 0);
    if (type == MOXVALUE_STRING || type == MOXVALUE_NAME) {
        MoxParser::readColor(toString(), /*strict=*/true, color);
    }
    return color;
}

MoxName MoxValue::getNameValue() const {
    return type == MOXVALUE_NAME ? MoxName::fromNumber(load<std::uint32_t>()) : MoxName();
}

const MoxNamedValueMap& MoxValue::getNamedValueMap() const {
    return type == MOXVALUE_MAP ? *load<MoxNamedValueMap*>() : emptyMap();
}

const MoxValue& MoxValue::getNamedItem(MoxName itemKey) const {
    return type == MOXVALUE_MAP ? getNamedValueMap().getNamedItem(itemKey) : NULL_VALUE;
}

UnicodeString MoxValue::getUnitString(MoxUnitType unit) {
    const char16_t* word = findWord(unitWords, unit);
    return word ? UnicodeString(word) : UnicodeString();
}

} // namespace MoxCommonNS
