/// Numbers as text.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxLang.h"
#include "foundation/common/MoxNameEnum.h"
#include "foundation/common/MoxString.h"

namespace MoxCommonNS {

/// Writes numbers, the same way under every locale.
class DRAWMERE_API MoxUtil {
public:
    /// Returns: `value` in decimal digits.
    static UnicodeString toString(int value);

    /// Returns: the shortest decimal text that reads back as the same number, without an exponent.
    /// A double that is exactly a float is written as that float, one that is not finite as "0".
    static UnicodeString toString(double value);

    /// Makes sure that numbers are written as in the "C" locale. They always are, whatever locale
    /// the process has set, so this does nothing: a library that set the locale would change it
    /// under the feet of its caller and of other threads.
    static void setLocaleC();

    /// Writes `number` as the format attribute of xsl:number asks (XSLT 1.0).
    /// Shape: the first run of letters and digits in `format` is its token: "1", "01" and longer
    /// ones for the least count of digits, also in the decimal digits of other scripts; "a", "A"
    /// for letters; "i", "I" for Roman numerals. What stands before the first and behind the last
    /// run is kept around the number. An unknown token, or none, reads as "1". `separator` parts
    /// each `groupSize` digits from the right, when it is not empty and `groupSize` is above 0. A
    /// number that letters or Roman numerals can't express, below 1 or above 3999 for the latter,
    /// is written in plain digits. A minus sign adds to the least count of digits.
    /// Ignores: `lang` and `letterValue`, which choose between sequences this one set doesn't have.
    static UnicodeString formatNumber(long long number, const UnicodeString& format,
                                      const UnicodeString& separator, int groupSize,
                                      const MoxLang& lang, MoxNameEnum letterValue);
};

} // namespace MoxCommonNS
