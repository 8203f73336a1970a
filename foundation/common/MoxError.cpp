#include "foundation/common/MoxError.h"

namespace MoxCommonNS {
namespace {

std::shared_ptr<const std::string> makeUtf8(const UnicodeString& text) {
    if (text.isEmpty()) {
        return nullptr;
    }
    auto bytes = std::make_shared<std::string>();
    text.toUTF8String(*bytes);
    return bytes;
}

} // namespace

MoxError::MoxError(unsigned short errorCode, const UnicodeString& messageText,
                   const UnicodeString& sourceName, int lineNumber, int columnNumber,
                   const UnicodeString& extraText)
    : code(errorCode), line(lineNumber), column(columnNumber), message(messageText),
      source(sourceName), extra(extraText), utf8Message(makeUtf8(messageText)) {}

MoxError::~MoxError() = default;

void MoxError::setMessage(const UnicodeString& text) {
    utf8Message = makeUtf8(text);
    message = text;
}

void MoxError::throwFatalError() const { throw MoxError(*this); }

unsigned short MoxError::getCode() const { return code; }

const UnicodeString& MoxError::getMessage() const { return message; }

const UnicodeString& MoxError::getSource() const { return source; }

int MoxError::getLine() const { return line; }

int MoxError::getColumn() const { return column; }

const UnicodeString& MoxError::getExtra() const { return extra; }

const char* MoxError::what() const noexcept { return utf8Message ? utf8Message->c_str() : ""; }

} // namespace MoxCommonNS
