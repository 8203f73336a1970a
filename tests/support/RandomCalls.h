/// Random drawing calls: any order, any argument, the same for the same choices.
#pragma once

#include "Drawmere.h"
#include "tests/support/Choices.h"
#include "tests/support/TempDir.h"

#include <cstddef>
#include <iosfwd>
#include <string_view>
#include <type_traits>
#include <vector>

namespace DrawmereTest {

using namespace DrawmereNS;

/// Makes calls with arguments that no careful caller would choose, and catches what they throw.
class RandomCalls : public Choices {
public:
    /// What arguments are made of.
    enum Temper {
        WILD, ///< any number and any text
        TAME, ///< numbers of the size of a page, listed enumerators, words and ids that were made
        /// Tame, and as the header asks: nothing but its parts in a path or a gradient, states that
        /// all end, a new name for each destination and a new number for each page, words of SVG
        /// where they are wanted.
        ORDERLY,
    };

    explicit RandomCalls(unsigned seed, Temper kind = WILD) : Choices(seed), temper(kind) {}

    explicit RandomCalls(std::string_view text, Temper kind = WILD) : Choices(text), temper(kind) {}

    /// Sets the options of a document to something, also to what means nothing. It leaves alone
    /// where the output goes and whether it is compressed.
    void configure(SVGConfig& config);

    /// Makes up to `count` calls, fewer when the bytes are used up; then finishes the run. Its
    /// documents go to `stream` with `SVGConfig::streamOutput`, to the page URI otherwise.
    void draw(Drawmere& page, std::ostream& stream, int count);

    /// Returns: an argument of this type. Half of the integers and enumerators are small numbers,
    /// the others are anything, or small too where they are tame.
    template <typename T> T make() {
        static_assert(std::is_enum_v<T> || std::is_integral_v<T>, "other types have their own");
        if (temper != WILD) {
            return static_cast<T>(below(3));
        }
        return static_cast<T>(flag() ? static_cast<int>(below(7)) - 2 : static_cast<int>(number()));
    }

    /// Returns: up to 7 of them.
    template <typename T> std::vector<T> makeList() {
        std::vector<T> list(below(8));
        for (T& item : list) {
            item = make<T>();
        }
        return list;
    }

    const Temper temper;
    bool unpacks = false; ///< whether what is packed in the tree becomes nodes before most calls
    const TempDir directory;              ///< where images are copied to
    std::vector<UnicodeString> ids;       ///< of definitions in the open document, in order
    std::vector<UnicodeString> lostIds;   ///< of those whose start call wrote no definition
    std::vector<UnicodeString> madeTexts; ///< what was made as an argument, in order
    int newNumber = 0;                    ///< of the last page or name that had to be a new one

private:
    using Call = void (*)(RandomCalls& any, Drawmere& page);

    void makeCall(Drawmere& page);
    bool keepOrder(Call picked);
    void finishDocument(Drawmere& page);

    unsigned unpackCount = 0;
    std::vector<Call> openStates; ///< what ends each of them, where order is kept
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
