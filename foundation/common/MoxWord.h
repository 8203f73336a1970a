/// Tables of keywords.
#pragma once

#include <cstddef>
#include <type_traits>

namespace MoxCommonNS {

/// One row of a keyword table: what stands for `key` in a document.
template <typename Key> struct MoxWord {
    Key key;
    const char16_t* word; // borrowed: a literal
};

/// Returns: the word of the first row for `key`, null when there is none.
template <typename Key, std::size_t count>
constexpr const char16_t* findWord(const MoxWord<Key> (&table)[count],
                                   std::type_identity_t<Key> key) {
    for (const MoxWord<Key>& row : table) {
        if (row.key == key) {
            return row.word;
        }
    }
    return nullptr;
}

} // namespace MoxCommonNS
