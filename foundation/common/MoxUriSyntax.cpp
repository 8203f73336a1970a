#include "foundation/common/MoxUriSyntax.h"

#include "foundation/common/MoxCStr.h"

#include <cctype>
#include <cstring>
#include <string>
#include <string_view>

#include <unicode/uchar.h>
#include <uriparser/Uri.h>

namespace MoxCommonNS {
namespace {

// The parser calls itself for each character and relies on the compiler to make a loop of that; no
// URI worth resolving is longer.
constexpr std::size_t longestParsed = 1 << 16;

constexpr std::string_view uriMarks = "-._~:/?#@!$&'()*+,;=";

bool isAsciiLetter(char16_t unit) {
    return (unit >= u'a' && unit <= u'z') || (unit >= u'A' && unit <= u'Z');
}

bool isSchemeUnit(char16_t unit) {
    return isAsciiLetter(unit) || (unit >= u'0' && unit <= u'9') || unit == u'+' || unit == u'-' ||
           unit == u'.';
}

/// Returns: the index of the colon behind the scheme, 0 when there is no scheme.
std::int32_t findSchemeEnd(const UnicodeString& text) {
    if (!isAsciiLetter(text.charAt(0))) {
        return 0;
    }
    std::int32_t end = 1;
    while (isSchemeUnit(text.charAt(end))) {
        ++end;
    }
    return text.charAt(end) == u':' ? end : 0;
}

/// Returns: the first index from `begin` on with a unit of `stops`, or the length of `text`.
std::int32_t findAny(const UnicodeString& text, std::int32_t begin, std::u16string_view stops) {
    std::int32_t index = begin;
    while (index < text.length() && stops.find(text.charAt(index)) == stops.npos) {
        ++index;
    }
    return index;
}

/// Returns: where the authority that may begin at `begin` ends, or `begin` when there is none.
std::int32_t findAuthorityEnd(const UnicodeString& text, std::int32_t begin) {
    const bool isThere = text.compare(begin, 2, u"//", 0, 2) == 0;
    return isThere ? findAny(text, begin + 2, u"/?#") : begin;
}

bool isEscape(std::string_view bytes, std::size_t index) {
    return bytes[index] == '%' && index + 2 < bytes.size() &&
           std::isxdigit(static_cast<unsigned char>(bytes[index + 1])) != 0 &&
           std::isxdigit(static_cast<unsigned char>(bytes[index + 2])) != 0;
}

bool mayStandInUri(unsigned char byte) {
    const char character = static_cast<char>(byte);
    return byte < 0x80 && (std::isalnum(byte) != 0 || uriMarks.find(character) != uriMarks.npos);
}

/// Appends `text` to `uri`, with what may not stand there as escapes; `alsoLegal` may stand there.
void appendEscaped(std::string& uri, const UnicodeString& text, std::string_view alsoLegal) {
    static constexpr char hexDigits[] = "0123456789ABCDEF";
    const MoxCStr utf8(text);
    const std::string& bytes = utf8.toBytes();
    for (std::size_t index = 0; index < bytes.size(); ++index) {
        const auto byte = static_cast<unsigned char>(bytes[index]);
        if (mayStandInUri(byte) || isEscape(bytes, index) ||
            alsoLegal.find(bytes[index]) != alsoLegal.npos) {
            uri += bytes[index];
        } else {
            uri += {'%', hexDigits[byte >> 4], hexDigits[byte & 15]};
        }
    }
}

std::string escapeUri(const UnicodeString& text) {
    const std::int32_t schemeEnd = findSchemeEnd(text);
    const std::int32_t split = findAuthorityEnd(text, schemeEnd > 0 ? schemeEnd + 1 : 0);
    std::string uri;
    // Brackets enclose a numeric host, and are ordinary characters of file names everywhere else.
    appendEscaped(uri, text.tempSubString(0, split), "[]");
    appendEscaped(uri, text.tempSubString(split), "");
    return uri;
}

/// A URI as the parser sees it; it refers to the text it was made from.
class ParsedUri {
public:
    ParsedUri() = default;
    ParsedUri(const ParsedUri&) = delete;
    ParsedUri& operator=(const ParsedUri&) = delete;

    ~ParsedUri() {
        if (isHeld) {
            uriFreeUriMembersA(&uri);
        }
    }

    bool parse(const std::string& text) {
        const char* const end = text.data() + text.size();
        isHeld = text.size() <= longestParsed &&
                 uriParseSingleUriExA(&uri, text.data(), end, nullptr) == URI_SUCCESS;
        return isHeld;
    }

    bool resolve(const ParsedUri& base, const ParsedUri& reference) {
        // A failed call frees what it made.
        isHeld = uriAddBaseUriA(&uri, &reference.uri, &base.uri) == URI_SUCCESS;
        return isHeld;
    }

    std::string toText() const {
        int size = 0;
        if (uriToStringCharsRequiredA(&uri, &size) != URI_SUCCESS) {
            return std::string();
        }
        std::string text(static_cast<std::size_t>(size) + 1, '\0');
        const bool isDone = uriToStringA(text.data(), &uri, size + 1, nullptr) == URI_SUCCESS;
        text.resize(isDone ? static_cast<std::size_t>(size) : 0);
        return text;
    }

private:
    UriUriA uri = {};
    bool isHeld = false;
};

/// Returns: the resolved text, empty when one of the two is broken.
std::string resolveParsed(const std::string& base, const std::string& reference) {
    ParsedUri parsedBase;
    ParsedUri parsedReference;
    ParsedUri resolved;
    if (!parsedBase.parse(base) || !parsedReference.parse(reference) ||
        !resolved.resolve(parsedBase, parsedReference)) {
        return std::string();
    }
    return resolved.toText();
}

/// Returns: `reference` behind the directory part of `base`, or behind its host when it begins with
/// a slash.
UnicodeString joinTexts(const UnicodeString& base, const UnicodeString& reference) {
    const MoxUriParts parts = splitUri(base);
    const std::int32_t begin = parts.pathBegin();
    const std::int32_t last = base.lastIndexOf(u'/', begin, parts.pathEnd - begin);
    const bool isRooted = reference.charAt(0) == u'/';
    if (!isRooted && last >= begin) {
        return UnicodeString(base, 0, last + 1) + reference;
    }
    UnicodeString result(base, 0, begin);
    if (!isRooted && parts.hasAuthority()) {
        result += u'/'; // or the name would run on from the host
    }
    return result += reference;
}

bool isLocalHost(const UnicodeString& text, const MoxUriParts& parts) {
    if (!parts.hasAuthority()) {
        return true;
    }
    const UnicodeString host =
        text.tempSubStringBetween(parts.authorityBegin() + 2, parts.authorityEnd);
    return host.isEmpty() || host.caseCompare(u"localhost", U_FOLD_CASE_DEFAULT) == 0;
}

} // namespace

MoxUriParts splitUri(const UnicodeString& text) {
    MoxUriParts parts;
    parts.schemeEnd = findSchemeEnd(text);
    parts.pathEnd = text.length();
    if (parts.hasScheme()) {
        parts.authorityEnd = findAuthorityEnd(text, parts.authorityBegin());
        parts.pathEnd = findAny(text, parts.pathBegin(), u"?#");
    }
    return parts;
}

bool isFileUri(const UnicodeString& text, const MoxUriParts& parts) {
    return text.tempSubString(0, parts.schemeEnd).caseCompare(u"file", U_FOLD_CASE_DEFAULT) == 0;
}

UnicodeString resolveUri(const UnicodeString& base, const UnicodeString& reference) {
    const std::string resolved = resolveParsed(escapeUri(base), escapeUri(reference));
    return resolved.empty() ? joinTexts(base, reference) : UnicodeString::fromUTF8(resolved);
}

bool readFileUri(const UnicodeString& text, const MoxUriParts& parts, UnicodeString& path) {
    const bool hasNull = text.indexOf(char16_t(0)) >= 0; // it would end the path early
    if (hasNull || !isLocalHost(text, parts)) {
        return false;
    }
    const MoxCStr encoded(text.tempSubStringBetween(parts.pathBegin(), parts.pathEnd));
    std::string bytes = encoded.toBytes();
    const char* const end = uriUnescapeInPlaceExA(bytes.data(), URI_FALSE, URI_BR_DONT_TOUCH);
    bytes.resize(static_cast<std::size_t>(end - bytes.data()));
    const UnicodeString decoded = UnicodeString::fromUTF8(bytes);
    // What is not UTF-8 does not come back the same from the round trip.
    const bool isPath = decoded.indexOf(char16_t(0)) < 0 && MoxCStr(decoded).toBytes() == bytes;
    if (isPath) {
        path = decoded;
    }
    return isPath;
}

} // namespace MoxCommonNS
