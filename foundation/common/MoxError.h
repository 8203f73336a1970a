/// The error record: what is queued, handed to an error handler, or thrown.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

#include <exception>
#include <memory>
#include <string>

namespace MoxCommonNS {

/// One error, with its code, its message and, where it is known, its place in a source.
/// A copy shares its texts with the original, so records are passed and queued by value.
class DRAWMERE_API MoxError : public std::exception {
public:
    /// Makes an empty record: code 0, empty texts, no place.
    MoxError() = default;

    /// Makes a record. `sourceName` names where the fault lies, a file for instance; lines and
    /// columns count from 1 in it and are -1 when unknown; `extraText` is anything more that there
    /// is to say.
    MoxError(unsigned short errorCode, const UnicodeString& messageText,
             const UnicodeString& sourceName, int lineNumber, int columnNumber,
             const UnicodeString& extraText);

    /// A copy.
    MoxError(const MoxError& other) = default;
    /// Copies everything.
    MoxError& operator=(const MoxError& other) = default;
    ~MoxError() override;

    /// Replaces the message.
    void setMessage(const UnicodeString& text);

    /// Throws: a copy of this record, as a `MoxError` whatever the record's own class is.
    [[noreturn]] void throwFatalError() const;

    /// Returns: the code, 0 for an empty record.
    unsigned short getCode() const;
    /// Returns: the message.
    const UnicodeString& getMessage() const;
    /// Returns: the name of what the fault lies in, empty when unknown.
    const UnicodeString& getSource() const;
    /// Returns: the line, -1 when unknown.
    int getLine() const;
    /// Returns: the column, -1 when unknown.
    int getColumn() const;
    /// Returns: what more there is to say.
    const UnicodeString& getExtra() const;

    /// Returns: the message in UTF-8, valid until the record dies or its message is replaced.
    const char* what() const noexcept override;

private:
    unsigned short code = 0;
    int line = -1;
    int column = -1;
    UnicodeString message;
    UnicodeString source;
    UnicodeString extra;
    std::shared_ptr<const std::string> utf8Message; // null for the empty message
};

} // namespace MoxCommonNS
