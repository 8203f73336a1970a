/// The grammar of URI texts: where their pieces lie, how they resolve, which file they mean.
#pragma once

#include "foundation/common/MoxString.h"

#include <cstdint>

namespace MoxCommonNS {

/// Where the pieces of a URI lie in its text, found as RFC 3986 splits any text, so that a broken
/// URI has pieces too. Indices are code units; each end is one past the last.
struct MoxUriParts {
    /// The colon; 0 without a scheme, when the whole text is the path.
    std::int32_t schemeEnd = 0;
    /// Of "//" and what follows it; without these, where the path begins.
    std::int32_t authorityEnd = 0;
    std::int32_t pathEnd = 0;

    bool hasScheme() const { return schemeEnd > 0; }

    /// Returns: where the authority begins, its two slashes included, in a text with a scheme.
    std::int32_t authorityBegin() const { return schemeEnd + 1; }

    bool hasAuthority() const { return hasScheme() && authorityEnd > authorityBegin(); }

    std::int32_t pathBegin() const { return authorityEnd; }
};

/// Returns: the pieces of `text`; one without a scheme is all path, '?' and '#' included.
MoxUriParts splitUri(const UnicodeString& text);

/// Returns: true when `text`, split into `parts`, has the scheme "file".
bool isFileUri(const UnicodeString& text, const MoxUriParts& parts);

/// Resolves the URI reference `reference` against `base`, which has a scheme, by RFC 3986.
/// Characters that can't stand in a URI become percent escapes of their UTF-8 form. When either
/// text is broken nevertheless, `reference` is joined to the directory part of `base` as it stands.
UnicodeString resolveUri(const UnicodeString& base, const UnicodeString& reference);

/// Finds the local path of a URI of the scheme "file", percent escapes read as UTF-8. A percent
/// sign that begins no escape stands for itself; query and fragment are left out.
/// Returns: false, with `path` as it was, for a host other than localhost, and for a path that is
/// not UTF-8 or has a null byte.
bool readFileUri(const UnicodeString& text, const MoxUriParts& parts, UnicodeString& path);

} // namespace MoxCommonNS
