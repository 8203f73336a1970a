#include "foundation/common/MoxNameTable.h"

#include "foundation/common/MoxXmlChars.h"

#include <algorithm>
#include <functional>
#include <memory>
#include <mutex>
#include <shared_mutex>
#include <string_view>
#include <unicode/utf8.h>
#include <unordered_map>

namespace MoxCommonNS {
namespace {

struct FixedName {
    std::uint32_t number;
    const char16_t* text;
};

constexpr FixedName fixedNames[] = {
#define MOX_NAME(enumerator, number, text) {number, text},
#include "foundation/common/MoxNameEnum.def"
#undef MOX_NAME
};

constexpr const char16_t* svgNames[] = {
#define SVG_NAME(identifier, text) text,
#include "foundation/names/SVGName.def"
#undef SVG_NAME
};

void appendUtf8(std::string& out, UChar32 codePoint) {
    std::uint8_t bytes[U8_MAX_LENGTH] = {};
    std::int32_t length = 0;
    U8_APPEND_UNSAFE(bytes, length, codePoint);
    out.append(bytes, bytes + length);
}

std::string makeXmlName(const UnicodeString& text) {
    std::string name;
    for (std::int32_t i = 0; i < text.length(); i = text.moveIndex32(i, 1)) {
        const UChar32 codePoint = text.char32At(i);
        const bool allowed = i == 0 ? isXmlNameStart(codePoint) : isXmlNameChar(codePoint);
        appendUtf8(name, allowed ? codePoint : u'_');
    }
    return name;
}

bool isDeclaration(const UnicodeString& name) {
    return name == u"xmlns" || name.startsWith(u"xmlns:");
}

bool isPlainName(const UnicodeString& text, const std::string& xmlName) {
    const bool isText = std::equal(xmlName.begin(), xmlName.end(), text.getBuffer(),
                                   text.getBuffer() + text.length());
    return isText && !isDeclaration(text);
}

} // namespace

/// The way into the table: gives out the numbers, one thread at a time.
class MoxNameStore {
public:
    MoxNameStore() {
        for (const FixedName& fixed : fixedNames) {
            enter(fixed.number, UnicodeString(fixed.text));
        }
        for (const char16_t* text : svgNames) {
            enterSvgName(UnicodeString(text));
        }
    }

    std::uint32_t intern(const UnicodeString& text) {
        const std::u16string_view key = viewOf(text);
        {
            const std::shared_lock lock(mutex);
            if (const auto known = numbers.find(key); known != numbers.end()) {
                return known->second;
            }
        }
        const std::unique_lock lock(mutex);
        if (const auto known = numbers.find(key); known != numbers.end()) {
            return known->second;
        }
        enter(nextNumber, text);
        return nextNumber++;
    }

private:
    using Slot = MoxNameTable::Slot;

    void enterSvgName(const UnicodeString& text) {
        // The number of a name that has a fixed one stays unused, so that all others keep a number
        // that follows from their place in the list.
        if (!numbers.contains(viewOf(text))) {
            enter(nextNumber, text);
        }
        ++nextNumber;
    }

    void enter(std::uint32_t number, const UnicodeString& text) {
        auto entry = std::make_unique<MoxNameTable::Entry>();
        entry->text = UnicodeString(text.getBuffer(), text.length());
        entry->xmlName = makeXmlName(text);
        entry->attributeStart = " " + entry->xmlName + "=\"";
        entry->isPlain = isPlainName(entry->text, entry->xmlName);
        const MoxNameTable::Place place = MoxNameTable::placeOf(number);
        std::atomic<Slot*>& block = MoxNameTable::blocks[place.block];
        Slot* slots = block.load(std::memory_order_relaxed);
        if (!slots) {
            slots = new Slot[std::size_t{MoxNameTable::firstFreeNumber} << place.block]();
            block.store(slots, std::memory_order_release);
        }
        numbers.emplace(viewOf(entry->text), number);
        slots[place.index].store(entry.release(), std::memory_order_release);
    }

    std::unordered_map<std::u16string_view, std::uint32_t> numbers; // views of the entries' texts
    std::shared_mutex mutex;
    std::uint32_t nextNumber = MoxNameTable::firstFreeNumber;
};

namespace {

MoxNameStore& store() {
    // Never destroyed: static objects may still use names while the process ends.
    static MoxNameStore& theStore = *new MoxNameStore;
    return theStore;
}

const MoxNameTable::Entry& emptyEntry() {
    static const MoxNameTable::Entry& entry = *new MoxNameTable::Entry;
    return entry;
}

} // namespace

constinit std::array<std::atomic<MoxNameTable::Slot*>, MoxNameTable::blockCount>
    MoxNameTable::blocks = {};

const UnicodeString& MoxNameTable::getSharedNameString(MoxName name) { return getEntry(name).text; }

const MoxNameTable::Entry& MoxNameTable::findOutside(std::uint32_t number) {
    store();
    const Entry* entry = find(number);
    return entry ? *entry : emptyEntry();
}

MoxName MoxNameTable::intern(const UnicodeString& text) {
    return text.isEmpty() ? MoxName() : MoxName::fromNumber(store().intern(text));
}

} // namespace MoxCommonNS
