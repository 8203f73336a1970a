/// Random drawing calls: any order, any argument, the same for the same seed.
#pragma once

#include "Drawmere.h"
#include "tests/support/TempDir.h"

#include <cstddef>
#include <iosfwd>
#include <random>
#include <type_traits>

namespace DrawmereTest {

using namespace DrawmereNS;

/// Makes calls with arguments that no careful caller would choose, and catches what they throw.
class RandomCalls {
public:
    explicit RandomCalls(unsigned seed) : numbers(seed) {}

    /// Sets the options of a document to something, also to what means nothing.
    void configure(SVGConfig& config);

    /// Makes `count` calls; then finishes the run, which writes its first document to `stream`.
    void draw(Drawmere& page, std::ostream& stream, int count);

    /// Returns: a number from 0 to `limit` - 1.
    unsigned below(unsigned limit) { return static_cast<unsigned>(numbers() % limit); }

    /// Returns: a row of the table.
    template <typename T, std::size_t count> T pick(const T (&table)[count]) {
        return table[below(count)];
    }

    bool flag() { return below(2) == 0; }

    /// Returns: an argument of this type. Half of the integers and enumerators are small numbers,
    /// the others are anything.
    template <typename T> T make() {
        static_assert(std::is_enum_v<T> || std::is_integral_v<T>, "other types have their own");
        return static_cast<T>(flag() ? static_cast<int>(below(7)) - 2
                                     : static_cast<int>(numbers()));
    }

    /// Returns: up to 7 of them.
    template <typename T> std::vector<T> makeList() {
        std::vector<T> list(below(8));
        for (T& item : list) {
            item = make<T>();
        }
        return list;
    }

private:
    std::mt19937 numbers;
    TempDir directory;
};

template <> bool RandomCalls::make<bool>();
template <> float RandomCalls::make<float>();
template <> UnicodeString RandomCalls::make<UnicodeString>();
template <> MoxLength RandomCalls::make<MoxLength>();
template <> MoxPointT<MoxLength> RandomCalls::make<MoxPointT<MoxLength>>();
template <> MoxRectT<MoxLength> RandomCalls::make<MoxRectT<MoxLength>>();
template <> MoxColor RandomCalls::make<MoxColor>();
template <> MoxName RandomCalls::make<MoxName>();
template <> MoxValue RandomCalls::make<MoxValue>();
template <> SVGMatrix RandomCalls::make<SVGMatrix>();
template <> SVGFont RandomCalls::make<SVGFont>();

} // namespace DrawmereTest
