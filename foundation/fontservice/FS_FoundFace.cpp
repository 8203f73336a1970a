#include "foundation/fontservice/FS_FoundFace.h"

#include "foundation/fontservice/FS_FaceCache.h"

namespace MoxFontService_NS {

namespace {

UnicodeString makeFamilyName(const FS_FoundName& name, const FS_FoundFace& found) {
    if (name.familyName.isEmpty()) {
        return found.face->familyName;
    }
    UnicodeString family = name.familyName;
    if (name.tellsWidth && found.style.widthClass != FS_FaceStyle::normalWidth) {
        family.append(u' ').append(widthWordOf(found.style.widthClass), -1);
    }
    return family;
}

} // namespace

FS_FaceStyle FS_StatedStyle::applyTo(FS_FaceStyle style) const {
    if (weight > 0) {
        style.weight = weight;
    }
    if (slant != FSSLANT_UNSTATED) {
        style.italic = slant == FSSLANT_ITALIC;
    }
    if (widthClass > 0) {
        style.widthClass = widthClass;
    }
    return style;
}

std::shared_ptr<const FS_FoundFace> FS_FoundFace::open(const FS_FoundName& name) {
    auto found = std::make_shared<FS_FoundFace>();
    found->face = FS_FaceCache::shared().find(name.request);
    if (!found->face) {
        return nullptr;
    }
    found->style = name.stated.applyTo(found->face->style);
    found->familyName = makeFamilyName(name, *found);
    return found;
}

} // namespace MoxFontService_NS
