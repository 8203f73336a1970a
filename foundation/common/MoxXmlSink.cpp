#include "foundation/common/MoxXmlSink.h"

#include "foundation/common/MoxAsciiChars.h"
#include "foundation/common/MoxNumberText.h"

#include <algorithm>
#include <new>
#include <numeric>
#include <ostream>
#include <string>
#include <unicode/ucnv.h>
#include <unicode/ucnv_cb.h>
#include <unicode/ucnv_err.h>
#include <unicode/uniset.h>
#include <unicode/uset.h>
#include <utility>

namespace MoxCommonNS {
namespace {

/// ICU tells of a lack of memory like of any other failure, but its results are worth nothing then.
void requireMemory(UErrorCode status) {
    if (status == U_MEMORY_ALLOCATION_ERROR) {
        throw std::bad_alloc();
    }
}

/// An encoding name as an XML declaration takes it (XML 1.0, production 81).
bool isEncodingName(std::string_view name) {
    return !name.empty() && isAsciiLetter(name[0]) &&
           std::all_of(name.begin(), name.end(), [](char c) {
               return isAsciiLetter(c) || isAsciiDigit(c) || c == '.' || c == '_' || c == '-';
           });
}

/// The name that XML readers know: the preferred MIME name where there is one, null when there is
/// none that an XML declaration could hold.
const char* findDeclaredName(const char* name) {
    for (const char* standard : {"MIME", "IANA"}) {
        UErrorCode status = U_ZERO_ERROR;
        const char* declared = ucnv_getStandardName(name, standard, &status);
        if (U_SUCCESS(status) && declared) {
            return declared;
        }
    }
    return isEncodingName(name) ? name : nullptr;
}

/// Writes a character reference for what the encoding lacks. ICU's own way to do so drops soft
/// hyphens, joiners and other invisible characters.
void writeReference(const void* /*context*/, UConverterFromUnicodeArgs* arguments,
                    const char16_t* /*units*/, std::int32_t /*length*/, UChar32 codePoint,
                    UConverterCallbackReason reason, UErrorCode* status) {
    if (reason > UCNV_IRREGULAR) {
        return; // not about a character
    }
    char digits[maxIntegerText];
    const std::size_t count = writeInteger(codePoint, digits);
    char16_t reference[maxIntegerText + 3] = {u'&', u'#'};
    char16_t* end = std::copy(digits, digits + count, reference + 2);
    *end++ = u';';
    const char16_t* source = reference;
    *status = U_ZERO_ERROR;
    ucnv_cbFromUWriteUChars(arguments, &source, end, 0, status);
}

/// Whether the encoding has every character that markup and references are made of. Some national
/// variants of ASCII don't.
bool carriesAscii(UConverter* converter) {
    char16_t ascii[0x80 - ' '];
    std::iota(std::begin(ascii), std::end(ascii), u' ');
    constexpr auto length = static_cast<std::int32_t>(std::size(ascii));
    char bytes[16 * length];
    char16_t back[length];
    UErrorCode status = U_ZERO_ERROR;
    const std::int32_t count =
        ucnv_fromUChars(converter, bytes, sizeof(bytes), ascii, length, &status);
    const std::int32_t backLength = ucnv_toUChars(converter, back, length, bytes, count, &status);
    ucnv_reset(converter);
    return U_SUCCESS(status) && backLength == length &&
           std::equal(std::begin(ascii), std::end(ascii), back);
}

} // namespace

void MoxXmlSink::ConverterDeleter::operator()(UConverter* converter) const {
    ucnv_close(converter);
}

void MoxXmlSink::SetDeleter::operator()(USet* set) const { uset_close(set); }

MoxXmlSink::MoxXmlSink(std::ostream& output, const UnicodeString& encoding) : stream(output) {
    if (!encoding.isEmpty()) {
        openConverter(encoding);
    }
}

MoxXmlSink::~MoxXmlSink() = default;

void MoxXmlSink::openConverter(const UnicodeString& encoding) {
    std::string name;
    encoding.toUTF8String(name);
    UErrorCode status = U_ZERO_ERROR;
    target.reset(ucnv_open(name.c_str(), &status));
    requireMemory(status);
    if (U_FAILURE(status) || ucnv_getType(target.get()) == UCNV_UTF8 ||
        !carriesAscii(target.get())) {
        return;
    }
    ucnv_setFromUCallBack(target.get(), writeReference, nullptr, nullptr, nullptr, &status);
    const char* known = ucnv_getName(target.get(), &status);
    const char* declared = U_SUCCESS(status) ? findDeclaredName(known) : nullptr;
    if (declared) {
        encodingName = declared;
        source.reset(ucnv_open("UTF-8", &status));
        requireMemory(status);
    }
}

bool MoxXmlSink::canCarry(UChar32 codePoint) {
    if (!isConverting()) {
        return true;
    }
    if (!carried) {
        readCarried();
    }
    return uset_contains(carried.get(), codePoint) != 0;
}

void MoxXmlSink::readCarried() {
    std::unique_ptr<USet, SetDeleter> set(uset_openEmpty());
    UErrorCode status = set ? U_ZERO_ERROR : U_MEMORY_ALLOCATION_ERROR;
    ucnv_getUnicodeSet(target.get(), set.get(), UCNV_ROUNDTRIP_SET, &status);
    requireMemory(status);
    // Some encodings can't tell what they have.
    uset_addRange(set.get(), ' ', '~');
    if (icu::UnicodeSet::fromUSet(set.get())->isBogus()) {
        throw std::bad_alloc();
    }
    carried = std::move(set);
}

void MoxXmlSink::finish() {
    handOn(buffer.data(), cursor - buffer.data(), /*isLast=*/true);
    cursor = buffer.data();
}

void MoxXmlSink::fail() { stream.setstate(std::ios::badbit); }

void MoxXmlSink::writeLong(std::string_view bytes) {
    flushBuffer();
    handOn(bytes.data(), bytes.size(), /*isLast=*/false);
}

void MoxXmlSink::flushBuffer() {
    handOn(buffer.data(), cursor - buffer.data(), /*isLast=*/false);
    cursor = buffer.data();
}

void MoxXmlSink::handOn(const char* bytes, std::size_t count, bool isLast) {
    if (source) {
        convert(bytes, count, isLast);
    } else {
        stream.write(bytes, static_cast<std::streamsize>(count));
    }
}

void MoxXmlSink::convert(const char* bytes, std::size_t count, bool isLast) {
    char converted[8192];
    char16_t pivot[2048];
    char16_t* pivotSource = pivot;
    char16_t* pivotTarget = pivot;
    const char* end = bytes + count;
    UErrorCode status = U_BUFFER_OVERFLOW_ERROR;
    while (status == U_BUFFER_OVERFLOW_ERROR) {
        status = U_ZERO_ERROR;
        char* out = converted;
        ucnv_convertEx(target.get(), source.get(), &out, std::end(converted), &bytes, end, pivot,
                       &pivotSource, &pivotTarget, std::end(pivot), /*reset=*/false,
                       static_cast<UBool>(isLast), &status);
        requireMemory(status);
        stream.write(converted, out - converted);
    }
}

} // namespace MoxCommonNS
