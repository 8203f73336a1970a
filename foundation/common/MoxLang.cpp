#include "foundation/common/MoxLang.h"

namespace MoxCommonNS {

MoxLang::MoxLang() : locale(icu::Locale::getRoot()) {}

MoxLang::MoxLang(const icu::Locale& icuLocale) : locale(icuLocale) {}

const icu::Locale& MoxLang::getLocale() const { return locale; }

bool MoxLang::isRoot() const { return locale.isBogus() || locale == icu::Locale::getRoot(); }

bool MoxLang::operator==(const MoxLang& other) const { return locale == other.locale; }

} // namespace MoxCommonNS
