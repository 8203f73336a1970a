/// What a search for a face has found.
#pragma once

namespace MoxFontService_NS {

/// A face and what is known of it.
struct FS_FoundFace {};

} // namespace MoxFontService_NS
