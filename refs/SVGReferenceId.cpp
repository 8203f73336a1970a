#include "refs/SVGReferenceId.h"

#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxParser.h"
#include "foundation/common/MoxUtil.h"
#include "foundation/names/SVGName.h"
#include "refs/SVGRefIDManager.h"

#include <iterator>

namespace DrawmereNS {

using MoxCommonNS::MoxName;
using MoxCommonNS::MoxNameTable;
using MoxCommonNS::MoxNode;
using MoxCommonNS::MoxParser;
using MoxCommonNS::MoxTokenizer;
using MoxCommonNS::MoxUtil;
using MoxCommonNS::MoxValue;
using TalCommon::SVGName;

namespace {

constexpr char16_t marker[] = u"Mox-SVG-page-";
constexpr std::int32_t markerLength = std::size(marker) - 1;
constexpr char16_t hash = u'#';

MoxName getHrefName() {
    static const MoxName name(UnicodeString(u"xlink:href"));
    return name;
}

/// Returns: the text of a name or of a string; empty for every other value.
UnicodeString getText(const MoxValue& value) {
    const bool isText = value.getType() == MoxCommonNS::MOXVALUE_NAME ||
                        value.getType() == MoxCommonNS::MOXVALUE_STRING;
    return isText ? value.toString() : UnicodeString();
}

UnicodeString getAttributeText(const MoxElement& element, MoxName name) {
    return getText(element.getAttribute(name));
}

bool isNamed(const MoxElement& element, SVGName::Number name) {
    return element.localLink() == MoxName(SVGName(name));
}

MoxElement* toElement(MoxNode* node) {
    return node && node->kindLink() == MoxCommonNS::MOXNODE_ELEMENT ? static_cast<MoxElement*>(node)
                                                                    : nullptr;
}

MoxElement* findFirstChild(const MoxElement& element) {
    MoxNode* child = element.firstLink();
    while (child && child->kindLink() != MoxCommonNS::MOXNODE_ELEMENT) {
        child = child->nextLink();
    }
    return toElement(child);
}

/// What is packed holds neither links nor anchors.
MoxElement* findNextSibling(const MoxElement& element) {
    MoxNode* next = element.nextLink();
    while (next && next->kindLink() == MoxCommonNS::MOXNODE_PACKED) {
        next = next->nextLink();
    }
    return toElement(next);
}

/// Returns: the element after `element` in document order, within the subtree of `root`, or null.
/// On purpose: a text between two elements ends the row of siblings, as it does for all walks over
/// them; links behind it stay as they are.
MoxElement* findFollowing(MoxElement* element, const MoxElement* root, bool enterChildren) {
    MoxElement* next = enterChildren ? findFirstChild(*element) : nullptr;
    while (!next && element && element != root) {
        next = findNextSibling(*element);
        element = toElement(element->parentLink());
    }
    return next;
}

} // namespace

UnicodeString SVGReferenceId::getPageReferenceMark(int page) {
    return UnicodeString(marker) + MoxUtil::toString(page);
}

bool SVGReferenceId::isPageReferenceId(const UnicodeString& reference) {
    return reference.startsWith(marker, markerLength);
}

bool SVGReferenceId::isInternalDestination(const UnicodeString& reference) {
    return !reference.isEmpty() && reference.charAt(0) == hash;
}

UnicodeString SVGReferenceId::getDestinationId(const UnicodeString& reference) {
    return isInternalDestination(reference) ? UnicodeString(reference, 1) : reference;
}

int SVGReferenceId::getReferencePageNo(const UnicodeString& mark) const {
    const UnicodeString number(mark, markerLength);
    return MoxParser::parse(number, 0, MoxTokenizer::TOKENIZER_DEFAULT).getIntegerValue();
}

UnicodeString SVGReferenceId::getInternalPageRefernceId(const UnicodeString& mark) const {
    return SVGRefIDManager::getReferencePrefix(SVGRefIDManager::REFPAGE) +
           UnicodeString(mark, markerLength);
}

bool SVGReferenceId::isSolvedId(const UnicodeString& reference) const {
    return findTarget(reference).isSolved;
}

bool SVGReferenceId::isSolvedReferenceId(int, MoxElement* element) const {
    const MoxElement* const root = element;
    while (element) {
        if (isNamed(*element, SVGName::a) &&
            !isSolvedId(getAttributeText(*element, getHrefName()))) {
            return false;
        }
        element = findFollowing(element, root, /*enterChildren=*/true);
    }
    return true;
}

UnicodeString SVGReferenceId::getDestination(const UnicodeString& reference) const {
    const UnicodeString* const file = findTarget(reference).file;
    return file ? *file : reference;
}

void SVGReferenceId::solveReferenceId(int, MoxElement* element) {
    const MoxElement* const root = element;
    while (element) {
        const bool enterChildren = solveElement(*element);
        element = findFollowing(element, root, enterChildren);
    }
}

void SVGReferenceId::solvePageAnchor(MoxElement* text) {
    const MoxName idName(MoxCommonNS::MOXNAME_ID);
    const UnicodeString id = text ? getAttributeText(*text, idName) : UnicodeString();
    if (isPageReferenceId(id)) {
        currentPage = getReferencePageNo(id);
        text->setAttribute(idName, getInternalPageRefernceId(id));
    }
}

void SVGReferenceId::setRefernceIdInfo(bool isSingleFile, const std::set<UnicodeString>& anchors,
                                       const std::map<UnicodeString, int>& pagesOfAnchors,
                                       const std::map<int, UnicodeString>& filesOfPages) {
    singleFile = isSingleFile;
    allAnchors = &anchors;
    anchorPages = &pagesOfAnchors;
    pageFiles = &filesOfPages;
}

SVGReferenceId::Target SVGReferenceId::findTarget(const UnicodeString& reference) const {
    // On purpose: "#" and the mark of a page is an id like any other. The library makes marks
    // without a "#", and they count as solved since they are no internal destinations.
    if (!isInternalDestination(reference) || singleFile) {
        return {.isSolved = true};
    }
    const int* const page = findPage(reference);
    if (page && *page == currentPage) {
        return {.isSolved = true};
    }
    const UnicodeString* const file = page ? findFile(*page) : nullptr;
    return {.isSolved = file != nullptr, .file = file};
}

/// Returns: the page of an internal destination, null when it is not known.
const int* SVGReferenceId::findPage(const UnicodeString& reference) const {
    if (!anchorPages) {
        return nullptr;
    }
    const auto found = anchorPages->find(getDestinationId(reference));
    return found == anchorPages->end() ? nullptr : &found->second;
}

/// Returns: the file name of a page, null when it is not known.
const UnicodeString* SVGReferenceId::findFile(int page) const {
    if (!pageFiles) {
        return nullptr;
    }
    const auto found = pageFiles->find(page);
    return found == pageFiles->end() ? nullptr : &found->second;
}

/// Returns: whether the link is solved now.
bool SVGReferenceId::solveLink(MoxElement& link) const {
    const Target target = findTarget(getAttributeText(link, getHrefName()));
    if (target.file) {
        link.setAttribute(getHrefName(), *target.file);
    }
    return target.isSolved;
}

/// Returns: whether the children of the element are to be solved too.
bool SVGReferenceId::solveElement(MoxElement& element) {
    if (isNamed(element, SVGName::a)) {
        return solveLink(element);
    }
    if (isNamed(element, SVGName::text)) {
        solvePageAnchor(&element);
    }
    return true;
}

} // namespace DrawmereNS
