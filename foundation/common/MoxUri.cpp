#include "foundation/common/MoxUri.h"

#include "foundation/common/MoxCStr.h"
#include "foundation/common/MoxUriSyntax.h"

#include <filesystem>
#include <fstream>
#include <memory>
#include <system_error>

namespace MoxCommonNS {
namespace {

constexpr char16_t slash = u'/';
constexpr char16_t dot = u'.';

/// Returns: where the extension of `name` begins, its length when it has none.
std::int32_t findExtension(const UnicodeString& name) {
    const bool isDots = name == UnicodeString(u".") || name == UnicodeString(u"..");
    const std::int32_t index = isDots ? -1 : name.lastIndexOf(dot);
    return index < 0 ? name.length() : index;
}

/// A directory opens for reading, and fails only later; a pipe may keep its opener waiting for
/// ever.
bool isDirectoryOrPipe(const MoxCStr& path) {
    std::error_code failure;
    const std::filesystem::file_status status = std::filesystem::status(path.toBytes(), failure);
    return std::filesystem::is_directory(status) || std::filesystem::is_fifo(status);
}

} // namespace

MoxUri::MoxUri(const UnicodeString& uriText, URISTRTYPE, const MoxXmlCatalogs*) : text(uriText) {}

MoxUri::MoxUri(const MoxUri& base, const UnicodeString& relative, URISTRTYPE, const MoxXmlCatalogs*)
    : text(relative) {
    if (splitUri(relative).hasScheme()) {
        return;
    }
    if (splitUri(base.text).hasScheme()) {
        text = resolveUri(base.text, relative);
    } else if (!isAbsolute()) {
        text = base.getBaseString() + relative;
    }
}

MoxUri::~MoxUri() = default;

const UnicodeString& MoxUri::getText() const { return text; }

void MoxUri::setText(const UnicodeString& newText) { text = newText; }

UnicodeString MoxUri::getLocalPath(const UnicodeString& text) {
    return MoxUri(text, URISTRTYPE_PATH_OR_URI, nullptr).getLocalPath();
}

UnicodeString MoxUri::getLocalPath() const {
    UnicodeString path;
    return readLocalFile(path) ? path : text;
}

UnicodeString MoxUri::getFileName() const {
    std::int32_t end = 0;
    const std::int32_t begin = findFileName(end);
    return UnicodeString(text, begin, end - begin);
}

UnicodeString MoxUri::getExtension() const {
    const UnicodeString name = getFileName();
    return UnicodeString(name, findExtension(name));
}

UnicodeString MoxUri::getBaseString() const {
    const MoxUriParts parts = splitUri(text);
    std::int32_t end = 0;
    const std::int32_t begin = findFileName(end);
    if (begin > parts.pathBegin()) {
        return UnicodeString(text, 0, begin);
    }
    if (parts.hasAuthority()) {
        return UnicodeString(text, 0, parts.authorityEnd) + slash;
    }
    // The scheme stays, so that a name never loses it and lands in the working directory.
    const bool keepsScheme = parts.hasScheme() && !isFileUri(text, parts);
    return keepsScheme ? UnicodeString(text, 0, parts.pathBegin()) : UnicodeString();
}

bool MoxUri::isAbsolute() const { return text.charAt(0) == slash || splitUri(text).hasScheme(); }

bool MoxUri::isFile() const {
    const MoxUriParts parts = splitUri(text);
    return !parts.hasScheme() || isFileUri(text, parts);
}

bool MoxUri::isFileExists() const {
    UnicodeString path;
    return readLocalFile(path) && isFileExists(MoxCStr(path).toCStr());
}

bool MoxUri::isFileExists(const char* path) {
    std::error_code failure;
    return path && std::filesystem::exists(path, failure);
}

const UnicodeString& MoxUri::setExtension(const UnicodeString* ext) {
    const UnicodeString name = getFileName();
    if (name.isEmpty() || name == UnicodeString(u".") || name == UnicodeString(u"..")) {
        return text;
    }
    UnicodeString extension = ext ? *ext : UnicodeString();
    if (!extension.isEmpty() && extension.charAt(0) != dot) {
        extension.insert(0, dot);
    }
    std::int32_t end = 0;
    const std::int32_t begin = findFileName(end) + findExtension(name);
    return text.replaceBetween(begin, end, extension);
}

void MoxUri::toDirectory(UnicodeString& text, char16_t separator) {
    if (!text.isEmpty() && text.charAt(text.length() - 1) != separator) {
        text += separator;
    }
}

std::ostream* MoxUri::getOStream(bool create) const {
    UnicodeString path;
    if (!readLocalFile(path)) {
        return nullptr;
    }
    const std::ios::openmode mode = create ? std::ios::trunc : std::ios::in;
    auto stream = std::make_unique<std::fstream>(MoxCStr(path).toCStr(),
                                                 std::ios::out | std::ios::binary | mode);
    return stream->is_open() ? stream.release() : nullptr;
}

std::istream* MoxUri::getIStream(ContentInfo*, UnicodeString* type) const {
    if (type) {
        type->remove();
    }
    UnicodeString path;
    if (!readLocalFile(path) || isDirectoryOrPipe(path)) {
        return nullptr;
    }
    auto stream =
        std::make_unique<std::ifstream>(MoxCStr(path).toCStr(), std::ios::in | std::ios::binary);
    return stream->is_open() ? stream.release() : nullptr;
}

/// Finds the path that can be handed to the system.
/// Returns: false for what names no local file.
bool MoxUri::readLocalFile(UnicodeString& path) const {
    const MoxUriParts parts = splitUri(text);
    if (parts.hasScheme()) {
        return isFileUri(text, parts) && readFileUri(text, parts, path);
    }
    if (text.indexOf(char16_t(0)) >= 0) {
        return false; // it would end the path early and name some other file
    }
    path = text;
    return true;
}

/// Returns: where the last segment of the path begins; `end` is where it ends.
std::int32_t MoxUri::findFileName(std::int32_t& end) const {
    const MoxUriParts parts = splitUri(text);
    const std::int32_t begin = parts.pathBegin();
    end = parts.pathEnd;
    const std::int32_t last = text.lastIndexOf(slash, begin, end - begin);
    return last < begin ? begin : last + 1;
}

} // namespace MoxCommonNS
