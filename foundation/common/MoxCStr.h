/// Texts for interfaces that take bytes: file names, above all.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

#include <string>

namespace MoxCommonNS {

/// A text that also gives itself as bytes in a named encoding.
/// The bytes are made when they are first asked for, and again only when the text or the encoding
/// has changed since. One object belongs to one thread, constant or not, as asking fills it.
class DRAWMERE_API MoxCStr : public UnicodeString {
public:
    MoxCStr() = default;

    /// Takes a copy of `text`; the bytes are UTF-8 until `setEncoding` says something else.
    MoxCStr(const UnicodeString& text); // NOLINT(google-explicit-constructor): any text is one

    /// A copy.
    MoxCStr(const MoxCStr& other) = default;
    /// Copies everything.
    MoxCStr& operator=(const MoxCStr& other) = default;
    ~MoxCStr() override;

    /// Replaces the text and leaves the encoding.
    MoxCStr& operator=(const UnicodeString& text);

    /// Names the encoding of the bytes, any that ICU knows; a null or unknown one reads as UTF-8.
    void setEncoding(const char* name);
    /// Returns: the name of the encoding.
    const std::string& getEncoding() const;

    /// Returns: the text in the encoding.
    /// A lone surrogate becomes U+FFFD, and what the encoding lacks the encoding's substitute. The
    /// bytes hold until the object is next asked after a change, or dies.
    const std::string& toBytes() const;

    /// Returns: the start of `toBytes()`; a U+0000 in the text ends it early for a reader of C
    /// strings.
    const char* toCStr() const;

private:
    void convert() const;

    std::string encoding = "UTF-8";
    mutable std::string bytes;
    mutable std::string convertedEncoding; // of `bytes`, empty before the first conversion
    mutable UnicodeString convertedText;   // of `bytes`
};

} // namespace MoxCommonNS
