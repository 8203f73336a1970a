/// The fonts of the example `page` and how wide their characters are, so that it can set lines
/// without reading a font file.
#pragma once

#include <algorithm>
#include <array>
#include <cstdint>
#include <span>

/// Two neighbours that stand closer together than their advances say.
struct KernPair {
    char16_t left;
    char16_t right;
    std::int16_t shift;
};

/// A font family. Advances are those of U+0020 to U+007E, in `unitsPerEm`.
struct Face {
    const char16_t* name;
    const char16_t* families; ///< a list for font-family, the last a generic name
    std::array<std::int16_t, 95> advances;
    std::span<const KernPair> pairs;

    /// Returns: how far `letter` moves the text on before `next`; a character that is not in the
    /// table counts as wide as a question mark.
    int getAdvance(char16_t letter, char16_t next) const {
        const bool listed = letter >= u' ' && letter <= u'~';
        const auto pair = std::find_if(pairs.begin(), pairs.end(), [=](const KernPair& candidate) {
            return candidate.left == letter && candidate.right == next;
        });
        const int shift = pair == pairs.end() ? 0 : pair->shift;
        return advances.at((listed ? letter : u'?') - u' ') + shift;
    }
};

inline constexpr int unitsPerEm = 2048;

// All numbers were measured in the fonts of DejaVu 2.37. Of the pairs only those are here that the
// page has. The pair "fi" of the serif face is a ligature there.

inline constexpr KernPair serifPairs[] = {
    {u'A', u't', -36},  {u'T', u'w', -73},  {u'f', u'i', -47},
    {u'r', u',', -225}, {u'r', u'.', -225}, {u'y', u',', -272},
};

inline constexpr KernPair sansPairs[] = {
    {u'F', u'i', -149}, {u'W', u'i', -45}, {u'f', u't', -36}, {u'k', u'e', -73},
    {u'r', u'e', -45},  {u'r', u'o', -45}, {u'r', u'r', -36},
};

// Sixteen advances a row; the rows begin with the blank, 0, @, P, ` and p.
// clang-format off
inline constexpr Face serifFace = {u"DejaVu Serif", u"'DejaVu Serif',serif", {
    651, 823, 942, 1716, 1303, 1946, 1823, 563, 799, 799, 1024, 1716, 651, 692, 651, 690,
    1303, 1303, 1303, 1303, 1303, 1303, 1303, 1303, 1303, 1303, 690, 690, 1716, 1716, 1716, 1098,
    2048, 1479, 1505, 1567, 1642, 1495, 1421, 1636, 1786, 809, 821, 1530, 1360, 2097, 1792, 1679,
    1378, 1679, 1542, 1403, 1366, 1726, 1479, 2105, 1458, 1352, 1423, 799, 690, 799, 1716, 1024,
    1024, 1221, 1311, 1147, 1311, 1212, 758, 1311, 1319, 655, 635, 1241, 655, 1942, 1319, 1233,
    1311, 1311, 979, 1051, 823, 1319, 1157, 1753, 1155, 1157, 1079, 1303, 690, 1303, 1716,
}, serifPairs};

inline constexpr Face sansFace = {u"DejaVu Sans", u"'DejaVu Sans',sans-serif", {
    651, 821, 942, 1716, 1303, 1946, 1597, 563, 799, 799, 1024, 1716, 651, 739, 651, 690,
    1303, 1303, 1303, 1303, 1303, 1303, 1303, 1303, 1303, 1303, 690, 690, 1716, 1716, 1716, 1087,
    2048, 1401, 1405, 1430, 1577, 1294, 1178, 1587, 1540, 604, 604, 1343, 1141, 1767, 1532, 1612,
    1235, 1612, 1423, 1300, 1251, 1499, 1401, 2025, 1403, 1251, 1403, 799, 690, 799, 1716, 1024,
    1024, 1255, 1300, 1126, 1300, 1260, 721, 1300, 1298, 569, 569, 1186, 569, 1995, 1298, 1253,
    1300, 1300, 842, 1067, 803, 1298, 1212, 1675, 1212, 1212, 1075, 1303, 690, 1303, 1716,
}, sansPairs};
// clang-format on
