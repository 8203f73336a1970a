/// A URI or a local path, as text.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

#include <cstdint>
#include <iosfwd>

namespace MoxCommonNS {

class MoxXmlCatalogs;
struct ContentInfo;

/// How a text that becomes a URI is read. Every number reads like the one that is listed.
enum URISTRTYPE : std::int32_t {
    URISTRTYPE_PATH_OR_URI = 4, // a local path, or a URI when it begins with a scheme
};

/// One text that names a place: a local path, or a URI (RFC 3986) when it begins with a scheme.
/// A local path is never escaped nor tidied up; '#', '?' and '%' are ordinary characters in it. A
/// broken URI is no error: it keeps its text, names no local file and opens as null.
class DRAWMERE_API MoxUri {
public:
    /// Takes `uriText` as it is. The catalogues are not asked; null is what to pass.
    MoxUri(const UnicodeString& uriText, URISTRTYPE type, const MoxXmlCatalogs* catalogs);

    /// Resolves `relative` against `base`.
    /// With a scheme it stays as it is. Against a local path it stays too when it begins with a
    /// slash, and is joined behind the last slash otherwise, so an empty name gives the directory.
    /// Against a base with a scheme it is a URI reference, resolved by RFC 3986; characters that
    /// can't stand in a URI are escaped then.
    MoxUri(const MoxUri& base, const UnicodeString& relative, URISTRTYPE type,
           const MoxXmlCatalogs* catalogs);

    /// A copy.
    MoxUri(const MoxUri& other) = default;
    /// Copies everything.
    MoxUri& operator=(const MoxUri& other) = default;
    virtual ~MoxUri();

    /// Returns: the text.
    const UnicodeString& getText() const;
    /// Replaces the text.
    void setText(const UnicodeString& newText);

    /// Returns: the local path of `text`; see the other form.
    static UnicodeString getLocalPath(const UnicodeString& text);

    /// Returns: the path of a URI with the scheme "file", its percent escapes read as UTF-8 and
    /// without query and fragment. Any other text is given back unchanged, and so is a URI that
    /// can't name a local file: one with a foreign host, a null character or escapes that are not
    /// UTF-8.
    UnicodeString getLocalPath() const;

    /// Returns: the last segment of the path as it is written, extension included; empty behind a
    /// slash.
    UnicodeString getFileName() const;

    /// Returns: what the file name has from its last dot on, the whole of ".svg" for instance;
    /// empty without a dot, and for "." and "..".
    UnicodeString getExtension() const;

    /// Returns: the text up to the last slash of the path, ready to be a base; empty when the path
    /// has none. A host without a path gets the slash.
    UnicodeString getBaseString() const;

    /// Returns: true with a scheme or a leading slash.
    bool isAbsolute() const;

    /// Returns: true without a scheme or with the scheme "file".
    bool isFile() const;

    /// Returns: whether there is a file or directory at the local path.
    bool isFileExists() const;

    /// Returns: the same for a local path in UTF-8; false for null.
    static bool isFileExists(const char* path);

    /// Replaces the extension of the file name, or removes it when `ext` is null or empty. An `ext`
    /// that lacks its leading dot gets one.
    /// Ignores: a text without a file name, "." and "..".
    /// Returns: the text that results.
    const UnicodeString& setExtension(const UnicodeString* ext);

    /// Makes `text` end in `separator`. The empty text stays empty, so that what is joined to it
    /// stays relative.
    static void toDirectory(UnicodeString& text, char16_t separator);

    /// Opens the local file for writing: emptied or newly made when `create` is true, otherwise one
    /// that is there, from its start and with its content kept.
    /// Owns: the caller deletes the stream; its class is `std::fstream`.
    /// Returns: null on failure, for a directory and for what is no local file.
    std::ostream* getOStream(bool create) const;

    /// Opens the local file for reading.
    /// Shape: both arguments may be null; `info` is left alone, `type` is emptied, as a file
    /// doesn't tell its media type.
    /// Owns: the caller deletes the stream.
    /// Returns: null on failure, for a directory, a pipe and what is no local file.
    std::istream* getIStream(ContentInfo* info, UnicodeString* type) const;

private:
    bool readLocalFile(UnicodeString& path) const;
    std::int32_t findFileName(std::int32_t& end) const;

    UnicodeString text;
};

} // namespace MoxCommonNS
