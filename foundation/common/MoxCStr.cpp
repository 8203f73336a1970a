#include "foundation/common/MoxCStr.h"

#include <cstdint>
#include <memory>
#include <utility>

#include <unicode/ucnv.h>

namespace MoxCommonNS {
namespace {

constexpr char utf8Name[] = "UTF-8";

struct ConverterCloser {
    void operator()(UConverter* converter) const { ucnv_close(converter); }
};

using ConverterPtr = std::unique_ptr<UConverter, ConverterCloser>;

/// Returns: null for UTF-8, which needs none, and for what ICU doesn't know.
ConverterPtr openConverter(const std::string& encoding) {
    if (ucnv_compareNames(encoding.c_str(), utf8Name) == 0) {
        return nullptr;
    }
    UErrorCode status = U_ZERO_ERROR;
    ConverterPtr converter(ucnv_open(encoding.c_str(), &status));
    return U_SUCCESS(status) ? std::move(converter) : nullptr;
}

std::string toUtf8(const UnicodeString& text) {
    std::string bytes;
    return text.toUTF8String(bytes);
}

std::string encode(const UnicodeString& text, UConverter* converter) {
    // By way of UTF-8, where every lone surrogate turns into U+FFFD.
    const UnicodeString wellFormed = UnicodeString::fromUTF8(toUtf8(text));
    UErrorCode status = U_ZERO_ERROR;
    const std::int32_t size = wellFormed.extract(nullptr, 0, converter, status);
    if (status != U_BUFFER_OVERFLOW_ERROR) {
        return std::string();
    }
    status = U_ZERO_ERROR;
    std::string bytes(static_cast<std::size_t>(size), '\0');
    wellFormed.extract(bytes.data(), size, converter, status);
    return U_SUCCESS(status) ? bytes : std::string();
}

} // namespace

MoxCStr::MoxCStr(const UnicodeString& text) : UnicodeString(text) {}

MoxCStr::~MoxCStr() = default;

MoxCStr& MoxCStr::operator=(const UnicodeString& text) {
    UnicodeString::operator=(text);
    return *this;
}

void MoxCStr::setEncoding(const char* name) { encoding = name && *name ? name : utf8Name; }

const std::string& MoxCStr::getEncoding() const { return encoding; }

const std::string& MoxCStr::toBytes() const {
    const UnicodeString& text = *this;
    if (convertedEncoding != encoding || convertedText != text) {
        convert();
    }
    return bytes;
}

const char* MoxCStr::toCStr() const { return toBytes().c_str(); }

void MoxCStr::convert() const {
    const ConverterPtr converter = openConverter(encoding);
    bytes = converter ? encode(*this, converter.get()) : toUtf8(*this);
    convertedText = *this;
    convertedEncoding = encoding;
}

} // namespace MoxCommonNS
