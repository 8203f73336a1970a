/// The texts of all errors, and the throwing of the fatal ones.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxError.h"
#include "foundation/common/MoxString.h"

namespace DrawmereNS {

using MoxCommonNS::MoxError;

/// Gives errors their texts. Thrown records carry the code of their text; queued ones carry another
/// code, that of their text plus 512 (16417 is queued as 16929), and 17320 for 16424.
class DRAWMERE_API DrawmereError {
public:
    DrawmereError() = delete;

    /// Returns: the text of `code`, one of 16404 to 16431; any other code, and the unused ones
    /// between them, give "Drawmere error!". A text that speaks of a path or an image shows
    /// `argument` in brackets unless that is empty; other texts leave it out.
    static UnicodeString getErrorMessage(unsigned short code, const UnicodeString& argument);

    /// Throws: a `MoxError` with this code and its text.
    [[noreturn]] static void throwError(unsigned short code,
                                        const UnicodeString& argument = UnicodeString());
};

} // namespace DrawmereNS
