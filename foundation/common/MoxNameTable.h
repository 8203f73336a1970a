/// The process-wide table of interned names.
#pragma once

#include "foundation/common/MoxName.h"

#include <array>
#include <atomic>
#include <bit>
#include <cstddef>
#include <string>

namespace MoxCommonNS {

/// Gives names their texts. Safe for any number of threads; names are never dropped.
/// The names of `MoxNameEnum` have their fixed numbers; all others start at `firstFreeNumber`, the
/// names of SVG 1.1 first, in their alphabetical order.
class DRAWMERE_API MoxNameTable {
public:
    /// Texts without a fixed number get numbers from here on.
    static constexpr std::uint32_t firstFreeNumber = 4096;

    /// What the table holds for one name.
    struct Entry {
        /// A blank, `xmlName`, an equals sign and a quote, ready to be written.
        std::string attributeStart;
        /// The text in UTF-8, made safe to stand as a name in XML 1.0: what may not stand there is
        /// replaced by an underscore.
        std::string xmlName;
        /// Whether `xmlName` is the text itself, of ASCII characters only, and declares no
        /// namespace. Every other name needs a closer look before it is written.
        bool isPlain = false;
        UnicodeString text; ///< one interned text
    };

    /// Returns: the text of `name`, empty for 0 and for a number that was never given out.
    static const UnicodeString& getSharedNameString(MoxName name);

    /// Returns: the entry of `name`, an empty one where `getSharedNameString` is empty.
    static const Entry& getEntry(MoxName name) {
        const Entry* entry = find(name.number);
        return entry ? *entry : findOutside(name.number);
    }

    /// Returns: the name of `text`, 0 for the empty text.
    static MoxName intern(const UnicodeString& text);

private:
    friend class MoxNameStore;

    using Slot = std::atomic<const Entry*>;

    struct Place {
        std::size_t block;
        std::size_t index;
    };

    static constexpr std::size_t blockCount = 21; // blocks double in size: 2^32 numbers in all

    static constexpr Place placeOf(std::uint32_t number) {
        const std::uint64_t shifted = std::uint64_t{number} + firstFreeNumber;
        const std::size_t top = std::bit_width(shifted) - 1;
        return {top - (std::bit_width(firstFreeNumber) - 1),
                static_cast<std::size_t>(shifted - (std::uint64_t{1} << top))};
    }

    /// Reaches an entry without a lock: a slot is published once and never changes.
    static const Entry* find(std::uint32_t number) {
        const Place place = placeOf(number);
        const Slot* slots = blocks[place.block].load(std::memory_order_acquire);
        return slots ? slots[place.index].load(std::memory_order_acquire) : nullptr;
    }

    /// Fills the table if nobody has used it yet, and looks again.
    static const Entry& findOutside(std::uint32_t number);

    static std::array<std::atomic<Slot*>, blockCount> blocks; // owned, for the life of the process
};

} // namespace MoxCommonNS
