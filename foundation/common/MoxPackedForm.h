/// The form of packed nodes: elements and texts one behind the other, in document order.
#pragma once

#include "foundation/common/MoxPackedBytes.h"
#include "foundation/common/MoxValue.h"

namespace MoxCommonNS {

class MoxElement;
class MoxNode;

/// A packed value: a name or a number in four bytes, or a text in one of four ways.
struct MoxPackedValue {
    enum Form : std::uint8_t {
        // Below: the types of values that fit into four bytes, as they are.
        shortText = 16, ///< ASCII, its length in a byte
        longText = 17,  ///< ASCII, its length in four bytes
        pairText = 18,  ///< packed by `MoxDigitPairs`: its length, and that of the bytes
        wideText = 19,  ///< UTF-16, its length in units
    };

    std::uint8_t form;
    std::uint32_t number;   ///< what stands in four bytes, or the characters of a text
    std::string_view bytes; ///< of a text

    /// Appends `value`. Returns: false for a value that is better kept, with nothing appended: a
    /// map, and a long text in memory of its own.
    static bool append(MoxPackedBytes& out, const MoxValue& value);

    /// Reads the next value. Borrows: the bytes that `cursor` reads.
    static MoxPackedValue take(MoxPackedCursor& cursor) {
        const auto form = cursor.take<std::uint8_t>();
        if (form == shortText) {
            const auto length = cursor.take<std::uint8_t>();
            return {form, length, cursor.takeBytes(length)};
        }
        const auto number = cursor.take<std::uint32_t>();
        return {form, number,
                form < shortText ? std::string_view() : takeLong(cursor, form, number)};
    }

    /// Returns: what was appended.
    MoxValue toValue() const;

private:
    static std::string_view takeLong(MoxPackedCursor& cursor, std::uint8_t form,
                                     std::uint32_t length) {
        switch (form) {
        case pairText:
            return cursor.takeBytes(cursor.take<std::uint32_t>());
        case wideText:
            return cursor.takeBytes(length * sizeof(char16_t));
        default:
            return cursor.takeBytes(length);
        }
    }
};

/// The head of a packed node. The head of an element has its attributes behind it, that of a text
/// its value.
struct MoxPackedHead {
    enum Kind : std::uint8_t {
        end = 0, ///< closes an element that has children
        text = 1,
        element = 2,
    };

    static constexpr std::uint8_t kindBits = 3;
    static constexpr std::uint8_t hasChildren = 4;
    static constexpr std::uint8_t holdsText = 8; ///< a child is a text

    std::uint8_t mark = end;
    std::uint8_t attributeCount = 0;
    MoxName name; ///< the local name; a packed element has no prefix and no namespace of its own

    static MoxPackedHead take(MoxPackedCursor& cursor) {
        MoxPackedHead head;
        head.mark = cursor.take<std::uint8_t>();
        if (head.kind() == element) {
            head.attributeCount = cursor.take<std::uint8_t>();
            head.name = takeKey(cursor);
        }
        return head;
    }

    static MoxName takeKey(MoxPackedCursor& cursor) {
        return MoxName::fromNumber(cursor.take<std::uint16_t>());
    }

    Kind kind() const { return static_cast<Kind>(mark & kindBits); }

    bool has(std::uint8_t bit) const { return (mark & bit) != 0; }
};

/// What is not packed, since walks look for it.
struct MoxPackRules {
    MoxName keptElement;   ///< elements of this name
    MoxName keptAttribute; ///< elements with this attribute
    MoxName neverEmpty;    ///< elements of this name without children
};

/// Packs subtrees.
class MoxPacker {
public:
    MoxPacker() = delete;

    /// Appends `root` and all below it. Returns: false, with nothing appended, when a node is held
    /// by others than its parent, is kept by `rules`, or doesn't fit into the form, and when there
    /// are many nodes.
    static bool append(MoxPackedBytes& out, const MoxNode& root, const MoxPackRules& rules);
};

} // namespace MoxCommonNS
