#include "post/QuilletExtention.h"

#include "foundation/common/MoxParser.h"
#include "foundation/common/MoxTokenizer.h"
#include "post/ElementWalk.h"
#include "tree/SVGUtil.h"

#include <algorithm>
#include <string_view>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxParser;
using MoxCommonNS::MoxTokenizer;

constexpr char16_t blank = u' ';
constexpr char16_t zero[] = u"0";
constexpr char16_t none[] = u"none";
constexpr char16_t transparent[] = u"transparent";

/// Passes that one walk can do together.
constexpr unsigned PASS_LINKS = 1;
constexpr unsigned PASS_TEXTS = 2;
constexpr unsigned PASS_COLORS = 4;

UnicodeString readText(const MoxElement& element, MoxName name) {
    return element.getAttribute(name).toString();
}

void removeTexts(MoxElement& element) {
    MoxNode* child = element.firstLink();
    while (child) {
        MoxNode* const next = child->nextLink();
        if (!toElement(child)) {
            element.removeChild(child);
        }
        child = next;
    }
}

/// Makes a `g` of `link` where it stands, so that its content need not move.
void turnIntoGroup(MoxElement& link) {
    const MoxName transform = SVGName(SVGName::transform);
    const MoxValue kept = link.getAttribute(transform);
    for (int i = link.attributeLinks().getLength(); i > 0; --i) {
        link.removeAttribute(link.attributeLinks().item(i - 1).getNodeName());
    }
    link.setAttribute(transform, kept);
    link.setName(MoxName(), MoxName(), SVGName(SVGName::g));
    removeTexts(link);
}

UnicodeString joinTexts(const MoxElement& element) {
    UnicodeString text;
    for (const MoxNode* child = element.firstLink(); child; child = child->nextLink()) {
        text += child->getText();
    }
    return text;
}

UnicodeString takeToken(const std::vector<UnicodeString>& list, int index) {
    const int last = static_cast<int>(list.size()) - 1;
    return last < 0 ? UnicodeString() : list[static_cast<std::size_t>(std::clamp(index, 0, last))];
}

UnicodeString readRotation(const MoxElement& text) {
    const MoxValue& rotation = text.getAttribute(SVGName(SVGName::rotate));
    return rotation.getKey() ? rotation.toString() : UnicodeString(zero);
}

std::vector<UnicodeString> readRotations(const MoxElement& text) {
    std::vector<UnicodeString> list;
    MoxTokenizer tokens(readText(text, SVGName(SVGName::rotate)));
    for (UnicodeString token = tokens.nextTokenValue(false).toString(); !token.isEmpty();
         token = tokens.nextTokenValue(false).toString()) {
        list.push_back(token);
    }
    return list;
}

/// Returns: whether the value is one coordinate, in whatever form.
bool isOneCoordinate(const MoxValue& value) {
    if (value.getType() != MoxCommonNS::MOXVALUE_STRING) {
        return value.getType() == MoxCommonNS::MOXVALUE_REAL;
    }
    const bool isPlain = !value.isWideText() && !value.getAsciiText().empty();
    return isPlain && value.getAsciiText().find(' ') == std::string_view::npos;
}

/// Returns: whether `paint` is "none", or a colour in the form that it would get.
bool isSpeltOut(std::string_view paint) {
    const auto isDigit = [](char c) { return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f'); };
    if (paint == "none") {
        return true;
    }
    if (paint.empty() || paint[0] != '#' || !std::all_of(paint.begin() + 1, paint.end(), isDigit)) {
        return false;
    }
    const bool isPaired = paint.size() == 7 && paint[1] == paint[2] && paint[3] == paint[4] &&
                          paint[5] == paint[6]; // which a shorter form says as well
    return paint.size() == 4 || (paint.size() == 7 && !isPaired);
}

void spellOutColor(MoxElement& element, MoxName name) {
    const MoxValue& paint = element.getAttribute(name);
    const bool isString = paint.getType() == MoxCommonNS::MOXVALUE_STRING;
    if (!paint.getKey() || (isString && !paint.isWideText() && isSpeltOut(paint.getAsciiText()))) {
        return;
    }
    const UnicodeString before = paint.toString();
    const MoxColor color(MoxParser::parseColor(before, true).getColorValue().getPacked());
    const UnicodeString text = SVGUtil::getColorString(color, false);
    if (before != none && text != transparent) {
        element.setAttribute(name, MoxValue(text));
    }
}

} // namespace

QuilletExtention::TextCoordVector::TextCoordVector(const UnicodeString& x, const UnicodeString& y) {
    setCoord(x, &xList);
    setCoord(y, &yList);
    isSinglePoint = size() == 1 && !x.isEmpty() && !y.isEmpty();
}

void QuilletExtention::TextCoordVector::setCoord(const UnicodeString& text,
                                                 std::vector<UnicodeString>* list) {
    if (!list) {
        return;
    }
    list->clear();
    if (text.isEmpty()) {
        list->emplace_back(zero);
    }
    for (std::int32_t begin = 0; begin < text.length();) {
        const std::int32_t found = text.indexOf(blank, begin);
        const std::int32_t end = found < 0 ? text.length() : found;
        list->emplace_back(text, begin, end - begin);
        begin = end + 1;
    }
}

int QuilletExtention::TextCoordVector::size() const {
    return static_cast<int>(std::max(xList.size(), yList.size()));
}

UnicodeString QuilletExtention::TextCoordVector::getX(int index) const {
    return takeToken(xList, index);
}

UnicodeString QuilletExtention::TextCoordVector::getY(int index) const {
    return takeToken(yList, index);
}

void QuilletExtention::optimizeQuillet(MoxElement* root) {
    // Images and the rest don't touch each other, so one walk does for the rest, and finds out on
    // its way whether there is a place for images.
    if (rewrite(root, PASS_LINKS | PASS_TEXTS | PASS_COLORS)) {
        embedImageDirect(root);
    }
}

void QuilletExtention::removeAElement(MoxElement* element) { rewrite(element, PASS_LINKS); }

void QuilletExtention::textCoordinate(MoxElement* element) { rewrite(element, PASS_TEXTS); }

void QuilletExtention::setRGBColor(MoxElement* element) { rewrite(element, PASS_COLORS); }

/// Takes `element` and what is below it through some passes.
/// Returns: whether there are definitions below it.
bool QuilletExtention::rewrite(MoxElement* element, unsigned passes) {
    if (!element) {
        return false;
    }
    if ((passes & PASS_COLORS) != 0) {
        spellOutColors(*element);
    }
    return rewriteBelow(*element, hasName(*element, SVGName::defs) ? passes & PASS_COLORS : passes);
}

/// Takes what is below `root` through some passes in one walk. Where fewer of them go on, in a
/// definition and in a text, a walk of its own does it; these don't nest any deeper.
bool QuilletExtention::rewriteBelow(MoxElement& root, unsigned passes) {
    bool hasDefs = false;
    MoxElement* child = findNext(&root, &root, /*below=*/passes != 0);
    while (child) {
        // Before the text is split, so that each colour is spelled out once for all its parts.
        if ((passes & PASS_COLORS) != 0) {
            spellOutColors(*child);
        }
        if ((passes & PASS_LINKS) != 0 && hasName(*child, SVGName::a)) {
            turnIntoGroup(*child);
        }
        const bool isText = (passes & PASS_TEXTS) != 0 && hasName(*child, SVGName::text);
        unsigned inside = isText ? passes & ~PASS_TEXTS : passes;
        if (hasName(*child, SVGName::defs)) {
            hasDefs = true;
            inside = passes & PASS_COLORS;
        }
        if (inside != passes) {
            rewriteBelow(*child, inside);
        }
        MoxElement* const next = findNext(child, &root, /*below=*/inside == passes);
        if (isText) {
            splitText(*child);
        }
        child = next;
    }
    return hasDefs;
}

void QuilletExtention::spellOutColors(MoxElement& element) const {
    if (paintableElements.contains(element.localLink())) {
        for (const MoxName name : paintAttributes) {
            spellOutColor(element, name);
        }
    }
}

void QuilletExtention::splitText(MoxElement& text) {
    if (isOneCoordinate(text.getAttribute(SVGName(SVGName::x))) &&
        isOneCoordinate(text.getAttribute(SVGName(SVGName::y)))) {
        return; // what the lists below would say too
    }
    const TextCoordVector points(readText(text, SVGName(SVGName::x)),
                                 readText(text, SVGName(SVGName::y)));
    MoxNode* const parent = text.getParentNode();
    if (points.isSinglePoint || !text.getOwnerDocument()) {
        return;
    }
    const UnicodeString content = joinTexts(text);
    if (points.size() < 2) {
        parent->replaceChild(
            createSplitTextNode(points.getX(0), points.getY(0), readRotation(text), content, &text)
                .get(),
            &text);
        return;
    }
    const std::vector<UnicodeString> rotations = readRotations(text);
    // On purpose: units, not characters, so a surrogate pair becomes two texts. The positions count
    // units too. Of too few rotations the last one repeats, as positions do.
    for (std::int32_t i = 0; i < content.length(); ++i) {
        const UnicodeString rotation = rotations.empty() ? zero : takeToken(rotations, i);
        parent->insertBefore(createSplitTextNode(points.getX(i), points.getY(i), rotation,
                                                 UnicodeString(content.charAt(i)), &text)
                                 .get(),
                             &text);
    }
    parent->removeChild(&text);
}

MoxPtr<MoxElement> QuilletExtention::createSplitTextNode(const UnicodeString& x,
                                                         const UnicodeString& y,
                                                         const UnicodeString& rotate,
                                                         const UnicodeString& text,
                                                         MoxElement* source) {
    const MoxPtr<MoxElement> split =
        source ? makeElement(*source, SVGName::text) : MoxPtr<MoxElement>();
    if (!split) {
        return split;
    }
    const SVGName own[] = {SVGName::x, SVGName::y, SVGName::rotate};
    split->setAttribute(own[0], MoxValue(x));
    split->setAttribute(own[1], MoxValue(y));
    if (rotate != zero) {
        split->setAttribute(own[2], MoxValue(rotate));
    }
    for (const MoxValue& attribute : source->attributeLinks()) {
        const MoxName name = attribute.getKey();
        if (std::none_of(std::begin(own), std::end(own),
                         [name](SVGName known) { return name == MoxName(known); })) {
            split->setAttribute(name, attribute);
        }
    }
    split->appendChildText(text);
    return split;
}

} // namespace DrawmereNS
