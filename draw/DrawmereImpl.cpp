#include "draw/DrawmereImpl.h"

#include "SVGConfig.h"
#include "fonts/SVGFontManager.h"
#include "foundation/common/MoxUtil.h"
#include "post/QuilletExtention.h"
#include "post/SVGOptimizer.h"
#include "refs/SVGRefIDManager.h"
#include "state/SVGGManager.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGTreeManager.h"
#include "tree/SVGUtil.h"

#include <memory>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MOXUNIT_POINT;
using MoxCommonNS::MoxUtil;
using MoxCommonNS::narrow;

UnicodeString toText(MoxLength length, MoxUnitType unit) {
    return MoxUtil::toString(static_cast<double>(length.getRealValue(unit)));
}

SVGElement* findRoot(const SVGTreeManager& tree) {
    return narrow<SVGElement>(tree.document->getDocumentElement());
}

/// The fill that every root carries.
std::u16string_view getDefaultColorText(bool colorFlag) {
    static const UnicodeString texts[] = {SVGUtil::getColorString(MoxColor(), false),
                                          SVGUtil::getColorString(MoxColor(), true)};
    return viewOf(texts[colorFlag ? 1 : 0]);
}

/// What the small-device mode looks at: colours of these elements, in these attributes.
QuilletExtention makeQuillet() {
    constexpr SVGName::Number elements[] = {
        SVGName::circle,  SVGName::ellipse,  SVGName::line, SVGName::path,
        SVGName::polygon, SVGName::polyline, SVGName::rect, SVGName::text,
    };
    QuilletExtention quillet;
    for (const SVGName::Number element : elements) {
        quillet.paintableElements.insert(SVGName(element));
    }
    quillet.paintAttributes = {SVGName(SVGName::fill), SVGName(SVGName::stroke)};
    return quillet;
}

/// Where a comment goes: the child of `root` that it precedes, null for the end.
MoxElement* findCommentSuccessor(const MoxElement& root) {
    auto* first = narrow<MoxElement>(root.getFirstChild());
    return SVGUtil::getSVGLocalName(first) == SVGName::defs ? SVGUtil::getNextSiblingElement(first)
                                                            : first;
}

} // namespace

DrawmereImpl::DrawmereImpl(SVGConfig* options) : config(options) {
    auto tree = std::make_unique<SVGTreeManager>();
    auto groups = std::make_unique<SVGGManager>(config);
    auto ids = std::make_unique<SVGRefIDManager>();
    groups->treeManager = tree.get();
    tree->context = groups->getGContext(); // for a clip ahead of any saved state
    fontManager = new SVGFontManager(tree.get());
    treeManager = tree.release();
    groupManager = groups.release();
    refIdManager = ids.release();
}

DrawmereImpl::~DrawmereImpl() {
    delete fontManager;
    delete treeManager;
    delete groupManager;
    delete savedGroupManager;
    delete refIdManager;
}

void DrawmereImpl::setErrorHandler(const DrawmereErrHandler* /*handler*/) {}

void DrawmereImpl::outputStream(MoxDocument* document, const UnicodeString& encoding,
                                std::ostream* stream, const UnicodeString& saveOptions) {
    if (document && stream) {
        document->save(encoding, UnicodeString(), *stream, nullptr, saveOptions, UnicodeString());
    }
}

void DrawmereImpl::pushState(ELEMENT_TYPE type) {
    groupManager->push(type);
    treeManager->push(type, getGContext());
}

void DrawmereImpl::popState(ELEMENT_TYPE type) {
    groupManager->pop(type);
    SVGFont font;
    treeManager->pop(type, &font);
    getGContext()->setFont(font);
}

void DrawmereImpl::setScale(float scale) { groupManager->setScale(scale); }

void DrawmereImpl::setCanvasSize(MoxLength width, MoxLength height) {
    SVGElement* root = findRoot(*treeManager);
    if (!root) {
        return;
    }
    root->setSVGAttribute(SVGName::width, width);
    root->setSVGAttribute(SVGName::height, height);
    setViewBox(root, width, height);
}

void DrawmereImpl::setCanvasSize(MoxLength width, MoxLength height, MoxUnitType unit) {
    SVGElement* root = findRoot(*treeManager);
    if (!root) {
        return;
    }
    const UnicodeString suffix = MoxValue::getUnitString(unit);
    root->setSVGAttribute(SVGName::width, toText(width, unit) + suffix);
    root->setSVGAttribute(SVGName::height, toText(height, unit) + suffix);
    setViewBox(root, width, height);
}

void DrawmereImpl::setViewBox(SVGElement* root, MoxLength width, MoxLength height) const {
    UnicodeString box(u"0 0 ");
    box.append(toText(width, MOXUNIT_POINT)).append(u' ').append(toText(height, MOXUNIT_POINT));
    root->setSVGAttribute(SVGName::viewBox, box);
}

void DrawmereImpl::addElement(SVGElement* element, bool direct, bool makeCurrent) {
    if (!element) {
        return;
    }
    const ELEMENT_TYPE type = static_cast<ELEMENT_TYPE>(getGContext()->getType());
    if (config->svgType == SVGConfig::SVGTYPE_TINY) {
        const bool inDefinition = type >= ELEMENT_TYPE_PATTERN && type <= ELEMENT_TYPE_CLIP;
        if (inDefinition) {
            return;
        }
    } else if (type == ELEMENT_TYPE_CLIP) {
        if (SVGUtil::getSVGLocalName(element) != SVGName::clipPath) {
            getGContext()->setClipRule(getGContext()->getCurrentGC()->clipRule, element);
        }
        treeManager->addElement(element, makeCurrent);
        return;
    }
    if (direct) {
        treeManager->addElement(element, makeCurrent);
    } else {
        groupManager->addElement(element);
    }
}

void DrawmereImpl::initDOM(const UnicodeString& version) {
    treeManager->setSVGDocProp(version, config);
}

void DrawmereImpl::initRootSvg() {
    initDOM(config->svgVersion);
    graphicManager.init(groupManager, refIdManager, config, config->imageBaseUri,
                        config->imageBaseUri, config->imageConversionName, config->jpegQuality,
                        true, UnicodeString());
}

void DrawmereImpl::finishRootSvg() {
    fontManager->doEmbedFonts();
    if (savedGroupManager) {
        // A path that nobody ended is lost; the group that was open before it is not.
        closePathManager();
    }
    groupManager->appendToTree();
    MoxElement* root = treeManager->document->getDocumentElement();
    if (wantsWalk || treeManager->hasEmptyGroup()) {
        SVGOptimizer::optimize(root);
    }
    if (config->svgType == SVGConfig::SVGTYPE_TINY && config->wispMode) {
        treeManager->stopPacking(nullptr);
        makeQuillet().optimizeQuillet(root);
        // Anchors are texts, which the passes replace: those noted stand in the tree no longer.
        wantsWalk = true;
    }
}

SVGDocument* DrawmereImpl::getDocument() {
    wantsWalk = true;
    const SVGGroupManager* page = savedGroupManager ? savedGroupManager : groupManager;
    treeManager->stopPacking(page->getGroupRootNode());
    return treeManager->document.get();
}

SVGGraphicContext* DrawmereImpl::getGContext() const { return groupManager->getGContext(); }

void DrawmereImpl::setPaintAttr(SVGElement* element, PAINTMODE mode) {
    if (!element) {
        return;
    }
    if (inClipDef) {
        if (!element->hasAttribute(SVGName(SVGName::fill))) {
            element->setSVGAttribute(SVGName::fill, u"none");
        }
        return;
    }
    const GraphicContext& state = *getGContext()->getCurrentGC();
    const std::u16string_view stroke = viewOf(state.strokeColor);
    if ((mode & PAINTMODE_STROKE) != 0 && !stroke.empty() && stroke != u"none") {
        element->setSVGAttribute(SVGName::stroke, MoxValue(stroke));
    }
    setFillAttr(*element, state, mode);
}

void DrawmereImpl::setFillAttr(SVGElement& element, const GraphicContext& state,
                               PAINTMODE mode) const {
    const std::u16string_view fill = viewOf(state.fillColor);
    if ((mode & PAINTMODE_FILL) == 0 || fill == u"none") {
        element.setSVGAttribute(SVGName::fill, u"none");
        return;
    }
    // The root carries the default colour and "evenodd", so both are left out here.
    if (fill != getDefaultColorText(config->colorFlag)) {
        element.setSVGAttribute(SVGName::fill, MoxValue(fill));
    }
    if (viewOf(state.fillRule) != u"evenodd") {
        element.setSVGAttribute(SVGName::fill_rule, state.fillRule);
    }
}

void DrawmereImpl::setComment() {
    SVGElement* root = findRoot(*treeManager);
    if (!root) {
        return;
    }
    const MoxPtr<SVGElement> comment = createElement(SVGName::desc);
    comment->appendChildText(UnicodeString());
    root->insertBefore(comment.get(), findCommentSuccessor(*root));
}

MoxValue DrawmereImpl::getInheritAttribute(const MoxElement* element, const MoxName& name,
                                           bool stopAtRoot) const {
    while (element && !element->hasAttribute(name)) {
        const bool atRoot = SVGUtil::getSVGLocalName(element) == SVGName::svg;
        element = stopAtRoot && atRoot ? nullptr : narrow<MoxElement>(element->getParentNode());
    }
    return element ? element->getAttribute(name) : MoxValue::NULL_VALUE;
}

MoxPtr<SVGElement> DrawmereImpl::createElement(SVGName name) const {
    if (getGContext()->getType() < ELEMENT_TYPE_PATTERN) { // definitions hold little
        treeManager->packFinished(groupManager->getGroupRootNode());
    }
    return treeManager->document->createSVGElement(name);
}

MoxPtr<SVGElement> DrawmereImpl::createDrawing(SVGName name, int geometry, PAINTMODE mode) const {
    MoxPtr<SVGElement> element = createElement(name);
    const bool isStroked = (mode & PAINTMODE_STROKE) != 0;
    const bool isMoved =
        !SVGGraphicContext::IsUnitMatrix(getGContext()->getCurrentGC()->transMatrix);
    element->reserveAttributes(geometry + 1 + (isStroked ? 1 : 0) + (isMoved ? 1 : 0));
    return element;
}

} // namespace DrawmereNS
