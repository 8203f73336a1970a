/// Why a document or a page can't be converted.
#pragma once

#include <cstdint>
#include <stdexcept>
#include <string>

namespace DrawmereConvert {

enum CONVERTERROR : std::int32_t {
    CONVERTERROR_UNREADABLE = 0, ///< there is no such file, or it is no document
    CONVERTERROR_PASSWORD = 1,   ///< the document needs a password, or another one
    CONVERTERROR_NOPAGES = 2,    ///< the document has no pages
    CONVERTERROR_PAGE = 3,       ///< one page can't be read
};

/// Carries the parser's own words, without the name of the file.
class ConvertError : public std::runtime_error {
public:
    ConvertError(CONVERTERROR errorKind, const std::string& text)
        : std::runtime_error(text), kind(errorKind) {}

    CONVERTERROR kind;
};

} // namespace DrawmereConvert
