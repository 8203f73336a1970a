/// The value of an attribute or of a map: one tagged value in sixteen bytes.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxByteBlock.h"
#include "foundation/common/MoxColor.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxName.h"
#include "foundation/common/MoxPtr.h"
#include "foundation/common/MoxUnitType.h"

#include <cstddef>
#include <cstring>
#include <string_view>
#include <utility>

namespace MoxCommonNS {

class MoxKeptText;
class MoxNamedValueMap;

/// What a `MoxValue` holds.
enum MoxValueType : std::uint8_t {
    MOXVALUE_NULL = 0,
    MOXVALUE_INTEGER = 1,
    MOXVALUE_REAL = 2,
    MOXVALUE_NAME = 3,
    MOXVALUE_STRING = 4,
    MOXVALUE_LENGTH = 5,
    MOXVALUE_COLOR = 6,
    MOXVALUE_MAP = 7,
};

/// A tagged value. Numbers, names and texts of up to ten ASCII characters live in the value itself;
/// a longer text, of bytes when it is ASCII and of UTF-16 otherwise, and a map live on the heap and
/// are owned, so a copy is deep. A text may also be kept in another form, see `fromKept`. A value
/// that was found in a map or among attributes carries the key under which it stood.
class DRAWMERE_API MoxValue {
public:
    /// The null value: it is what a search that finds nothing answers, and its key is 0.
    static const MoxValue NULL_VALUE;

    constexpr MoxValue() = default;

    /// A string.
    MoxValue(const UnicodeString& text) { // NOLINT(google-explicit-constructor): values are its use
        storeText(viewOf(text));
    }

    /// A string.
    MoxValue(std::u16string_view text) { // NOLINT(google-explicit-constructor)
        storeText(text);
    }

    /// A string, up to its terminator.
    MoxValue(const char16_t* text) { // NOLINT(google-explicit-constructor)
        storeText(text);
    }

    /// A name.
    MoxValue(MoxName name) { // NOLINT(google-explicit-constructor)
        store(MOXVALUE_NAME, name.number);
    }

    /// A length.
    MoxValue(MoxLength length) { // NOLINT(google-explicit-constructor)
        store(MOXVALUE_LENGTH, length.getRawValue());
    }

    /// A colour.
    MoxValue(MoxColor color) { // NOLINT(google-explicit-constructor)
        store(MOXVALUE_COLOR, color.getPacked());
    }

    /// An integer.
    MoxValue(int number) { // NOLINT(google-explicit-constructor)
        store(MOXVALUE_INTEGER, number);
    }

    /// A real.
    MoxValue(float number) { // NOLINT(google-explicit-constructor)
        store(MOXVALUE_REAL, number);
    }

    /// Reals are single-precision numbers: `number` is rounded to the nearest.
    MoxValue(double number) // NOLINT(google-explicit-constructor)
        : MoxValue(static_cast<float>(number)) {}

    /// A copy of the map.
    MoxValue(const MoxNamedValueMap& map); // NOLINT(google-explicit-constructor)

    /// A deep copy, key included.
    MoxValue(const MoxValue& other) { copyFrom(other); }

    /// Takes the content over; what is left is null.
    MoxValue(MoxValue&& other) noexcept { takeFrom(other); }

    ~MoxValue() { drop(); }

    // `other` may live in a map that this value owns, so it is read before anything is dropped.
    /// Copies deeply, key included.
    MoxValue& operator=(const MoxValue& other) { return *this = MoxValue(other); }

    /// Takes the content over.
    MoxValue& operator=(MoxValue&& other) noexcept {
        MoxValue taken(std::move(other));
        drop();
        takeFrom(taken);
        return *this;
    }

    /// A string value of plain ASCII bytes, as path data and keywords have them. Bytes above 127
    /// are taken as the characters of that number.
    /// Throws: std::bad_alloc for a text that is longer than a string can be.
    static MoxValue fromAscii(std::string_view text);

    /// A string value whose text lies in `block` already, for a text too large to be copied: it
    /// stays where it is, and only a copy of the value has its own.
    /// Shape: `length` bytes from `begin` on, all of them ASCII; their count fits into an int.
    static MoxValue adoptAscii(MoxByteBlock block, std::size_t begin, std::size_t length);

    /// A string value whose text is kept in another form, and made as a whole when it is asked for:
    /// whatever reads it may throw `std::bad_alloc`, or `std::ios_base::failure` when the text
    /// can't be had any more. Copies of the value share it.
    /// Shape: `text`, not null.
    static MoxValue fromKept(const MoxPtr<MoxKeptText>& text);

    /// True when type and content agree; the key plays no part, and a NaN differs from everything.
    bool operator==(const MoxValue& other) const;

    /// False when both are the same.
    bool operator!=(const MoxValue& other) const { return !(*this == other); }

    /// Returns: what it holds.
    MoxValueType getType() const { return static_cast<MoxValueType>(type); }

    /// Returns: the name under which the value stood, 0 for a value that stands nowhere.
    MoxName getKey() const { return MoxName::fromNumber(key); }

    /// Sets the name under which the value stands.
    void setKey(MoxName name) { key = name.number; }

    /// Returns: the text of the value: a name gives its text, a real the shortest decimal that
    /// reads back as the same number, a length its points with the suffix "pt", null and maps
    /// nothing.
    UnicodeString toString() const;

    /// Returns: the value as a 32-bit integer, towards zero and within the range; a text gives the
    /// number that it begins with, and what holds no number gives 0.
    std::int32_t getIntegerValue() const;

    /// Returns: a length in `unit`; a number as it stands; a text the number that it begins with,
    /// taken as a length when a unit follows and `unit` is one of 6 to 10; otherwise 0.
    float getRealValue(MoxUnitType unit) const;

    /// Returns: a colour as it stands, a text read as a CSS colour; otherwise the fully transparent
    /// colour.
    MoxColor getColorValue() const;

    /// Returns: the name it holds, 0 when it holds none.
    MoxName getNameValue() const;

    /// Returns: the map it holds, valid as long as the value, or an empty one.
    const MoxNamedValueMap& getNamedValueMap() const;

    /// Returns: the item at `key` of a map, `NULL_VALUE` when absent or when this is no map.
    const MoxValue& getNamedItem(MoxName key) const;

    /// Returns: the suffix of `unit` in CSS and SVG ("cm", "mm", "in", "pt", "pc"), empty for
    /// others.
    static UnicodeString getUnitString(MoxUnitType unit);

    /// Returns: true for a string that is kept as UTF-16, which `getWideText` then gives.
    bool isWideText() const { return form == wideForm; }

    /// Returns: true for a string that is in memory of its own, or kept in another form.
    bool hasOwnMemory() const { return form == adoptedForm || form == keptForm; }

    /// Returns: the ASCII bytes of a string that is not wide, valid as long as the value.
    std::string_view getAsciiText() const {
        return type == MOXVALUE_STRING && form <= inlineCapacity ? std::string_view(bytes, form)
                                                                 : getLongText();
    }

    /// Returns: the UTF-16 units of a wide string, valid as long as the value.
    std::u16string_view getWideText() const;

    /// Returns: the text of a string that is kept in another form, valid as long as the value; null
    /// for every other value.
    const MoxKeptText* getKeptText() const {
        return form == keptForm ? load<const MoxKeptText*>() : nullptr;
    }

    /// Returns: the four bytes that an integer, a real, a name, a length or a colour consists of.
    std::uint32_t getBits() const { return load<std::uint32_t>(); }

    /// Returns: the single-precision number of a real or of a length in points.
    float getFloat() const { return load<float>(); }

private:
    struct AdoptedText;
    struct HeapText;

    static constexpr std::size_t inlineCapacity = 10;
    static constexpr std::uint8_t firstHeapForm = 0xFB;
    static constexpr std::uint8_t keptForm = 0xFB;
    static constexpr std::uint8_t adoptedForm = 0xFC;
    static constexpr std::uint8_t mapForm = 0xFD;
    static constexpr std::uint8_t asciiForm = 0xFE;
    static constexpr std::uint8_t wideForm = 0xFF;
    static constexpr std::size_t numberOffset = 2; // aligned to eight bytes, as pointers want it

    template <typename T> T load() const {
        T result;
        // NOLINTNEXTLINE(bugprone-sizeof-expression): pointers are kept as they are
        std::memcpy(&result, bytes + numberOffset, sizeof(T));
        return result;
    }

    template <typename T> void store(MoxValueType newType, T content) {
        type = newType;
        // NOLINTNEXTLINE(bugprone-sizeof-expression): pointers are kept as they are
        std::memcpy(bytes + numberOffset, &content, sizeof(T));
    }

    void copyFrom(const MoxValue& other) {
        std::memcpy(static_cast<void*>(this), static_cast<const void*>(&other), sizeof(MoxValue));
        if (form >= firstHeapForm) {
            cloneHeap();
        }
    }

    void takeFrom(MoxValue& other) noexcept {
        std::memcpy(static_cast<void*>(this), static_cast<const void*>(&other), sizeof(MoxValue));
        other.type = MOXVALUE_NULL;
        other.form = 0;
    }

    void drop() {
        if (form >= firstHeapForm) {
            freeHeap();
        }
    }

    void cloneHeap();
    void freeHeap();
    std::string_view getLongText() const;
    void releaseText();
    void storeText(std::u16string_view text);
    void storeAscii(std::string_view text);
    void storeWide(std::u16string_view text);
    bool equalText(const MoxValue& other) const;

    alignas(8) std::uint32_t key = 0;
    std::uint8_t type = MOXVALUE_NULL;
    std::uint8_t form = 0; // the length of a text inside the value, or where the content lives
    char bytes[inlineCapacity] = {};
};

static_assert(sizeof(MoxValue) == 16);

} // namespace MoxCommonNS
