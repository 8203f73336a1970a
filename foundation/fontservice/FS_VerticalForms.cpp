#include "foundation/fontservice/FS_VerticalForms.h"

#include <hb-ot.h>

namespace MoxFontService_NS {

namespace {

void appendLookups(hb_face_t* face, hb_tag_t feature, std::vector<unsigned>& lookups) {
    const hb_tag_t features[] = {feature, HB_TAG_NONE};
    hb_set_t* found = hb_set_create();
    hb_ot_layout_collect_lookups(face, HB_OT_TAG_GSUB, nullptr, nullptr, features, found);
    hb_codepoint_t lookup = HB_SET_VALUE_INVALID;
    while (hb_set_next(found, &lookup)) {
        lookups.push_back(lookup);
    }
    hb_set_destroy(found);
}

} // namespace

// Where a font has vrt2, that feature holds all that vert does, and more.
FS_VerticalForms::FS_VerticalForms(hb_face_t* fontFace) : face(fontFace), glyphs(hb_set_create()) {
    appendLookups(face, HB_TAG('v', 'r', 't', '2'), lookups);
    appendLookups(face, HB_TAG('v', 'e', 'r', 't'), lookups);
}

FS_VerticalForms::~FS_VerticalForms() { hb_set_destroy(glyphs); }

unsigned FS_VerticalForms::find(unsigned glyphId) const {
    for (const unsigned lookup : lookups) {
        if (!hb_ot_layout_lookup_would_substitute(face, lookup, &glyphId, 1, 1)) {
            continue;
        }
        hb_set_clear(glyphs);
        hb_set_add(glyphs, glyphId);
        hb_ot_layout_lookup_substitute_closure(face, lookup, glyphs);
        hb_set_del(glyphs, glyphId);
        if (hb_set_get_population(glyphs) > 0) {
            return hb_set_get_min(glyphs);
        }
    }
    return glyphId;
}

} // namespace MoxFontService_NS
