#include "foundation/common/MoxXmlOptions.h"

#include <algorithm>

namespace MoxCommonNS {
namespace {

constexpr std::u16string_view decimalsKey = u"decimals=";
/// More digits than any single-precision number has behind its point.
constexpr int maxDecimals = 160;

int readDecimals(const UnicodeString& text) {
    int number = 0;
    for (std::int32_t i = 0; i < text.length(); ++i) {
        if (text[i] < u'0' || text[i] > u'9') {
            return MoxXmlOptions::allDecimals;
        }
        number = std::min(number * 10 + (text[i] - u'0'), maxDecimals);
    }
    return text.isEmpty() ? MoxXmlOptions::allDecimals : number;
}

void readEntry(const UnicodeString& entry, MoxXmlOptions& options) {
    const auto keyLength = static_cast<std::int32_t>(decimalsKey.size());
    if (entry == u"indent") {
        options.indent = true;
    } else if (entry.startsWith(decimalsKey.data(), keyLength)) {
        const int decimals = readDecimals(entry.tempSubString(keyLength));
        options.decimals = decimals == MoxXmlOptions::allDecimals ? options.decimals : decimals;
    }
}

} // namespace

MoxXmlOptions MoxXmlOptions::parse(const UnicodeString& list) {
    MoxXmlOptions options;
    std::int32_t start = 0;
    while (start < list.length()) {
        const std::int32_t comma = list.indexOf(u',', start);
        const std::int32_t end = comma < 0 ? list.length() : comma;
        UnicodeString entry(list, start, end - start);
        readEntry(entry.trim(), options);
        start = end + 1;
    }
    return options;
}

} // namespace MoxCommonNS
