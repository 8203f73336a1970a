#include "foundation/fontservice/FS_VerticalForms.h"

#include <hb-ot.h>

#include <memory>
#include <new>

namespace MoxFontService_NS {

namespace {

struct SetDestroyer {
    void operator()(hb_set_t* set) const { hb_set_destroy(set); }
};

using SetPtr = std::unique_ptr<hb_set_t, SetDestroyer>;

// A set that could not grow goes on without what it was given.
void requireMemory(const hb_set_t* set) {
    if (!hb_set_allocation_successful(set)) {
        throw std::bad_alloc();
    }
}

void appendLookups(hb_face_t* face, hb_tag_t feature, std::vector<unsigned>& lookups) {
    const hb_tag_t features[] = {feature, HB_TAG_NONE};
    const SetPtr found(hb_set_create());
    hb_ot_layout_collect_lookups(face, HB_OT_TAG_GSUB, nullptr, nullptr, features, found.get());
    requireMemory(found.get());
    hb_codepoint_t lookup = HB_SET_VALUE_INVALID;
    while (hb_set_next(found.get(), &lookup)) {
        lookups.push_back(lookup);
    }
}

} // namespace

// Where a font has vrt2, that feature holds all that vert does, and more.
FS_VerticalForms::FS_VerticalForms(hb_face_t* fontFace) : face(fontFace) {
    appendLookups(face, HB_TAG('v', 'r', 't', '2'), lookups);
    appendLookups(face, HB_TAG('v', 'e', 'r', 't'), lookups);
}

unsigned FS_VerticalForms::find(unsigned glyphId) const {
    for (const unsigned lookup : lookups) {
        if (!hb_ot_layout_lookup_would_substitute(face, lookup, &glyphId, 1, 1)) {
            continue;
        }
        const SetPtr glyphs(hb_set_create());
        hb_set_add(glyphs.get(), glyphId);
        hb_ot_layout_lookup_substitute_closure(face, lookup, glyphs.get());
        requireMemory(glyphs.get());
        hb_set_del(glyphs.get(), glyphId);
        if (hb_set_get_population(glyphs.get()) > 0) {
            return hb_set_get_min(glyphs.get());
        }
    }
    return glyphId;
}

} // namespace MoxFontService_NS
