// Links and their destinations.
#include "draw/DrawmereImpl.h"
#include "foundation/common/MoxNameTable.h"
#include "refs/SVGReferenceId.h"

namespace DrawmereNS {
namespace {

UnicodeString toText(float number) { return MoxValue(number).toString(); }

} // namespace

void DrawmereImpl::startLink(const UnicodeString& href, const MoxName& show) {
    const MoxPtr<SVGElement> link = createElement(SVGName::a);
    link->setAttribute(MoxName(u"xlink:href"), MoxValue(href));
    if (show == MoxName(MoxCommonNS::MOXNAME_NEW)) {
        link->setAttribute(MoxName(u"xlink:show"),
                           MoxValue(MoxCommonNS::MoxNameTable::getSharedNameString(show)));
        link->setAttribute(MoxName(MoxCommonNS::MOXNAME_TARGET), MoxValue(u"_blank"));
    }
    hasLinks = true;
    pushState(ELEMENT_TYPE_LINK);
    addElement(link.get(), /*direct=*/true, /*makeCurrent=*/true);
}

void DrawmereImpl::endLink() { popState(ELEMENT_TYPE_LINK); }

void DrawmereImpl::setInternalView(UnicodeString id, float x, float y, float width, float height) {
    const MoxPtr<SVGElement> view = createElement(SVGName::view);
    UnicodeString box = toText(x);
    for (const float number : {y, width, height}) {
        box.append(u' ').append(toText(number));
    }
    view->setSVGAttribute(SVGName::viewBox, box);
    view->setSVGAttribute(SVGName::id, id);
    addElement(view.get(), /*direct=*/false, /*makeCurrent=*/false);
}

void DrawmereImpl::setInternalLinkAnchor(UnicodeString id, float /*x*/, float y) {
    const MoxPtr<SVGElement> group = createElement(SVGName::g);
    // On purpose: the translation holds y alone, which SVG takes as the horizontal offset. With
    // both numbers every page would begin with another text.
    UnicodeString translation(u"translate(");
    translation.append(toText(y)).append(u')');
    group->setSVGAttribute(SVGName::transform, translation);
    const MoxPtr<SVGElement> anchor = createElement(SVGName::text);
    anchor->setSVGAttribute(SVGName::id, id);
    if (SVGReferenceId::isPageReferenceId(id)) {
        pageAnchors.emplace_back(anchor.get());
    }
    group->appendChild(anchor.get());
    addElement(group.get(), /*direct=*/false, /*makeCurrent=*/false);
}

} // namespace DrawmereNS
