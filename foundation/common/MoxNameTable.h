/// The process-wide table of interned names.
#pragma once

#include "foundation/common/MoxName.h"

#include <string>

namespace MoxCommonNS {

/// Gives names their texts. Safe for any number of threads; names are never dropped.
/// The names of `MoxNameEnum` have their fixed numbers; all others start at `firstFreeNumber`, the
/// names of SVG 1.1 first, in their alphabetical order.
class DRAWMERE_API MoxNameTable {
public:
    static constexpr std::uint32_t firstFreeNumber = 4096;

    /// What the table holds for one name.
    struct Entry {
        /// The text in UTF-8, made safe to stand as a name in XML 1.0: what may not stand there is
        /// replaced by an underscore.
        std::string xmlName;
        /// Whether `xmlName` is the text itself, of ASCII characters only, and declares no
        /// namespace. Every other name needs a closer look before it is written.
        bool isPlain = false;
        UnicodeString text;
    };

    /// Returns: the text of `name`, empty for 0 and for a number that was never given out.
    static const UnicodeString& getSharedNameString(MoxName name);

    /// Returns: the entry of `name`, an empty one where `getSharedNameString` is empty.
    static const Entry& getEntry(MoxName name);

    /// Returns: the name of `text`, 0 for the empty text.
    static MoxName intern(const UnicodeString& text);
};

} // namespace MoxCommonNS
