/// The language of a text or of a number.
#pragma once

#include "DrawmereExport.h"

#include <cstdint>

#include <unicode/locid.h>

namespace MoxCommonNS {

/// A language, made from an ICU locale and passed by value.
class DRAWMERE_API MoxLang {
public:
    /// Numbers of languages for the font service.
    enum LanguageID : std::int32_t {
        LANGUAGE_UNSTATED = 0, // the one a face itself prefers
    };

    /// Makes the root language, which is none in particular.
    MoxLang();

    /// Makes the language of `icuLocale`.
    MoxLang(const icu::Locale& icuLocale); // NOLINT(google-explicit-constructor): a locale is one

    /// Returns: the locale the language was made from.
    const icu::Locale& getLocale() const;

    /// Returns: true for the root language, and for a locale that ICU holds for broken.
    bool isRoot() const;

    /// True when both are the same.
    bool operator==(const MoxLang& other) const;

private:
    icu::Locale locale;
};

} // namespace MoxCommonNS
