/// Where the output of a run goes.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxUri.h"

namespace DrawmereNS {

/// The place of a run's output, and how pages are numbered in the names of their files: page 3 of
/// "dir/out.svg" goes to "dir/out3.svg".
class DRAWMERE_API SVGPageUri : public MoxCommonNS::MoxUri {
public:
    /// Shape: `uri`, a local path or a URI; `format`, the number format of `MoxUtil::formatNumber`.
    explicit SVGPageUri(const UnicodeString& uri, const UnicodeString& format = UnicodeString());

    UnicodeString numberFormat; ///< of page numbers in file names, "01" for instance; empty as "1"
};

} // namespace DrawmereNS
