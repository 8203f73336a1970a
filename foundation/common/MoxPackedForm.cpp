#include "foundation/common/MoxPackedForm.h"

#include "foundation/common/MoxDigitPairs.h"
#include "foundation/common/MoxElement.h"
#include "foundation/common/MoxFewBytes.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxPackedNode.h"
#include "foundation/common/MoxText.h"

#include <algorithm>
#include <bit>
#include <limits>

namespace MoxCommonNS {
namespace {

constexpr std::uint32_t maxName = std::numeric_limits<std::uint16_t>::max();
constexpr int maxAttributes = std::numeric_limits<std::uint8_t>::max();
constexpr std::size_t maxShort = std::numeric_limits<std::uint8_t>::max();
/// A longer text is not copied: it stays in the tree, in memory of its own.
constexpr std::size_t maxText = 32768;
/// Shorter texts gain little by packing.
constexpr std::size_t minPairs = 128;
/// Packed children that are copied with their parent; more stay where they are.
constexpr std::size_t maxCopied = 2048;
/// What consists of more nodes stays as it is: its children were packed as they came, where that
/// could be. Without an end, parts that can't be packed would be walked for each of their parents.
constexpr int maxNodes = 64;

template <typename T> char* writeNumber(char* out, T number) {
    std::memcpy(out, &number, sizeof(number));
    return out + sizeof(number);
}

/// Writes the form of a text and its length. Returns: the end of what was written.
char* writeHead(char* out, MoxPackedValue::Form form, std::size_t length) {
    *out++ = static_cast<char>(form);
    return form == MoxPackedValue::shortText ? writeNumber(out, static_cast<std::uint8_t>(length))
                                             : writeNumber(out, static_cast<std::uint32_t>(length));
}

bool fitsIntoBits(const MoxValue& value) {
    constexpr unsigned int types = 1U << MOXVALUE_INTEGER | 1U << MOXVALUE_REAL |
                                   1U << MOXVALUE_NAME | 1U << MOXVALUE_LENGTH |
                                   1U << MOXVALUE_COLOR;
    return (types >> value.getType() & 1U) != 0;
}

/// The most bytes that `writeSmall` writes.
constexpr std::size_t smallSize = 2 + maxFewBytes;

/// Returns: the end of what was written, null for a value that is not small.
[[gnu::always_inline]] inline char* writeSmall(char* out, const MoxValue& value) {
    if (fitsIntoBits(value)) {
        *out = static_cast<char>(value.getType());
        return writeNumber(out + 1, value.getBits());
    }
    if (value.getType() != MOXVALUE_STRING || value.isWideText() || value.hasOwnMemory()) {
        return nullptr;
    }
    const std::string_view text = value.getAsciiText();
    if (text.size() > maxFewBytes) {
        return nullptr;
    }
    out = writeHead(out, MoxPackedValue::shortText, text.size());
    copyFewBytes(out, text.data(), text.size());
    return out + text.size();
}

/// Returns: the end of what was written, null for a text that is no list of numbers.
char* writePairs(char* out, std::string_view text) {
    char* const count = writeHead(out, MoxPackedValue::pairText, text.size());
    char* const pairs = count + sizeof(std::uint32_t);
    const auto size = static_cast<std::uint32_t>(MoxDigitPairs::pack(text, pairs));
    writeNumber(count, size);
    return size == 0 ? nullptr : pairs + size;
}

bool appendAscii(MoxPackedBytes& out, std::string_view text) {
    constexpr std::size_t maxHead = 1 + 2 * sizeof(std::uint32_t);
    if (text.size() > maxText) {
        return false;
    }
    char* const place = out.room(maxHead + text.size());
    char* end = text.size() >= minPairs ? writePairs(place, text) : nullptr;
    if (!end) {
        const bool isShort = text.size() <= maxShort;
        end = writeHead(place, isShort ? MoxPackedValue::shortText : MoxPackedValue::longText,
                        text.size());
        std::memcpy(end, text.data(), text.size());
        end += text.size();
    }
    out.advance(end);
    return true;
}

bool appendWide(MoxPackedBytes& out, std::u16string_view text) {
    constexpr std::size_t maxHead = 1 + sizeof(std::uint32_t);
    if (text.size() > maxText) {
        return false;
    }
    const std::size_t size = text.size() * sizeof(char16_t);
    char* const place = out.room(maxHead + size);
    char* const end = writeHead(place, MoxPackedValue::wideText, text.size());
    std::memcpy(end, text.data(), size);
    out.advance(end + size);
    return true;
}

bool hasManyChildren(const MoxElement& element) {
    const MoxNode* child = element.firstLink();
    for (int i = 0; child && i < maxNodes; ++i) {
        child = child->nextLink();
    }
    return child != nullptr;
}

std::uint8_t findMark(const MoxElement& element) {
    unsigned int mark = MoxPackedHead::element;
    for (const MoxNode* child = element.firstLink(); child; child = child->nextLink()) {
        mark |= MoxPackedHead::hasChildren;
        if (child->kindLink() == MOXNODE_TEXT) {
            mark |= MoxPackedHead::holdsText;
        }
    }
    return static_cast<std::uint8_t>(mark);
}

bool isKept(const MoxElement& element, const MoxPackRules& rules) {
    const MoxName name = element.localLink();
    return name == rules.keptElement || (name == rules.neverEmpty && !element.firstLink()) ||
           element.getNamespaceURI() || element.prefixLink() || name.number > maxName ||
           element.attributeLinks().getLength() > maxAttributes || hasManyChildren(element);
}

bool isKept(MoxName key, const MoxPackRules& rules) {
    // What is no plain name may declare a namespace or need a look at its neighbours.
    return key == rules.keptAttribute || key.number > maxName ||
           !MoxNameTable::getEntry(key).isPlain;
}

/// Looks ahead where bytes would grow for an element that is kept: the row ends there, and it may
/// be a short one.
bool wouldGrowInVain(const MoxPackedBytes& out, std::size_t count,
                     const MoxAttributeMap& attributes, const MoxPackRules& rules) {
    return !out.hasRoom(count) &&
           std::any_of(attributes.begin(), attributes.end(), [&rules](const MoxValue& attribute) {
               return isKept(attribute.getKey(), rules);
           });
}

bool appendElement(MoxPackedBytes& out, const MoxElement& element, const MoxPackRules& rules) {
    constexpr std::size_t headSize = 2 + sizeof(std::uint16_t);
    constexpr std::size_t keySize = sizeof(std::uint16_t);
    if (isKept(element, rules)) {
        return false;
    }
    const MoxAttributeMap attributes = element.attributeLinks();
    const auto count = static_cast<std::uint8_t>(attributes.getLength());
    const std::size_t allSmall = count * (keySize + smallSize);
    if (wouldGrowInVain(out, headSize + allSmall, attributes, rules)) {
        return false;
    }
    char* end = out.room(headSize + allSmall);
    *end++ = static_cast<char>(findMark(element));
    *end++ = static_cast<char>(count);
    end = writeNumber(end, static_cast<std::uint16_t>(element.localLink().number));
    for (const MoxValue& attribute : attributes) {
        const MoxName key = attribute.getKey();
        if (isKept(key, rules)) {
            return false;
        }
        char* const place = writeNumber(end, static_cast<std::uint16_t>(key.number));
        end = writeSmall(place, attribute);
        if (!end) {
            out.advance(place);
            if (!MoxPackedValue::append(out, attribute)) {
                return false;
            }
            end = out.room(allSmall);
        }
    }
    out.advance(end);
    return true;
}

bool appendNode(MoxPackedBytes& out, const MoxNode& node, const MoxPackRules& rules) {
    if (node.getReferenceCount() != 1) {
        return false;
    }
    switch (node.kindLink()) {
    case MOXNODE_ELEMENT:
        return appendElement(out, static_cast<const MoxElement&>(node), rules);
    case MOXNODE_TEXT:
        out.appendNumber<std::uint8_t>(MoxPackedHead::text);
        return MoxPackedValue::append(out, static_cast<const MoxText&>(node).getContent());
    case MOXNODE_PACKED: {
        const std::string_view bytes = static_cast<const MoxPackedNode&>(node).getBytes();
        if (bytes.size() > maxCopied) {
            return false;
        }
        out.append(bytes);
        return true;
    }
    default:
        return false;
    }
}

bool appendSubtree(MoxPackedBytes& out, const MoxNode& root, const MoxPackRules& rules) {
    const MoxNode* node = &root;
    for (int i = 0; i < maxNodes && appendNode(out, *node, rules); ++i) {
        if (node->firstLink()) {
            node = node->firstLink();
            continue;
        }
        while (node != &root && !node->nextLink()) {
            node = node->parentLink();
            out.appendNumber<std::uint8_t>(MoxPackedHead::end);
        }
        if (node == &root) {
            return true;
        }
        node = node->nextLink();
    }
    return false;
}

} // namespace

bool MoxPackedValue::append(MoxPackedBytes& out, const MoxValue& value) {
    if (const char* end = writeSmall(out.room(smallSize), value)) {
        out.advance(end);
        return true;
    }
    if (value.getType() != MOXVALUE_STRING || value.hasOwnMemory()) {
        return false;
    }
    return value.isWideText() ? appendWide(out, value.getWideText())
                              : appendAscii(out, value.getAsciiText());
}

MoxValue MoxPackedValue::toValue() const {
    switch (form) {
    case MOXVALUE_INTEGER:
        return {static_cast<int>(number)};
    case MOXVALUE_REAL:
        return {std::bit_cast<float>(number)};
    case MOXVALUE_NAME:
        return {MoxName::fromNumber(number)};
    case MOXVALUE_LENGTH:
        return {MoxLength::fromRaw(std::bit_cast<float>(number))};
    case MOXVALUE_COLOR:
        return {MoxColor(number)};
    case pairText: {
        std::string text(number + 1, '\0');
        MoxDigitPairs::unpack(bytes.data(), number, text.data());
        return MoxValue::fromAscii({text.data(), number});
    }
    case wideText: {
        std::u16string text(number, u'\0');
        std::memcpy(text.data(), bytes.data(), bytes.size());
        return {std::u16string_view(text)};
    }
    default:
        return MoxValue::fromAscii(bytes);
    }
}

bool MoxPacker::append(MoxPackedBytes& out, const MoxNode& root, const MoxPackRules& rules) {
    const std::size_t before = out.size();
    try {
        if (appendSubtree(out, root, rules)) {
            return true;
        }
    } catch (...) { // no memory
        out.cut(before);
        throw;
    }
    out.cut(before);
    return false;
}

} // namespace MoxCommonNS
