// The order of members, of virtual operations and of numbers: callers and derived classes that
// were compiled before rely on it.
#include "Drawmere.h"
#include "draw/DrawmereImpl.h"
#include "draw/SVGTinyImpl.h"
#include "draw/SVGWispImpl.h"
#include "tree/SVGTreeManager.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstring>
#include <string>
#include <vector>

namespace DrawmereTest {
namespace {

using namespace DrawmereNS;
using MoxCommonNS::MoxNode;

constexpr std::size_t destructorSlots = 2; // one that frees the memory, one that doesn't

/// Returns: the slot of a virtual operation, as the C++ ABI of Linux keeps it in the pointer.
template <typename Operation> std::size_t slotOf(Operation operation) {
    std::size_t words[2] = {};
    static_assert(sizeof words == sizeof operation);
    std::memcpy(words, &operation, sizeof words);
    return words[0] / sizeof(void*);
}

std::string describe(const std::vector<std::size_t>& numbers, std::size_t first) {
    std::string text;
    for (std::size_t i = 0; i < numbers.size(); ++i) {
        if (numbers[i] != first + i) {
            text += "place " + std::to_string(i) + " has " + std::to_string(numbers[i]) + "; ";
        }
    }
    return text;
}

TEST(InterfaceOrder, VirtualOperationsOfTheImplementationKeepTheirSlots) {
    using I = DrawmereImpl;
    const std::vector<std::size_t> slots = {
        slotOf(&I::setInternalView),
        slotOf(&I::setInternalLinkAnchor),
        slotOf(&I::setErrorHandler),
        slotOf(&I::outputStream),
        slotOf(&I::pushState),
        slotOf(&I::popState),
        slotOf(&I::setScale),
        slotOf(static_cast<void (I::*)(MoxLength, MoxLength)>(&I::setCanvasSize)),
        slotOf(static_cast<void (I::*)(MoxLength, MoxLength, MoxUnitType)>(&I::setCanvasSize)),
        slotOf(&I::ellipticalArcTo),
        slotOf(&I::closePath),
        slotOf(&I::startClipDef),
        slotOf(&I::startClipRect),
        slotOf(&I::endClipDef),
        slotOf(&I::doClip),
        slotOf(&I::drawRect),
        slotOf(&I::drawCircle),
        slotOf(&I::drawEllipse),
        slotOf(&I::drawLine),
        slotOf(&I::drawPoly),
        slotOf(
            static_cast<void (I::*)(const UnicodeString&, const MoxLength&, const MoxLength&,
                                    PAINTMODE, TLStringWithGlyphInfo*, bool, bool)>(&I::drawText)),
        slotOf(
            static_cast<void (I::*)(const UnicodeString&, const std::vector<MoxLength>&,
                                    const std::vector<MoxLength>&, const std::vector<float>&,
                                    PAINTMODE, TLStringWithGlyphInfo*, bool, bool)>(&I::drawText)),
        slotOf(&I::drawImage),
        slotOf(&I::copyImage),
        slotOf(&I::startLink),
        slotOf(&I::endLink),
        slotOf(&I::startMask),
        slotOf(&I::endMask),
        slotOf(&I::startLinearGradient),
        slotOf(&I::startRadialGradient),
        slotOf(&I::endGradiant),
        slotOf(&I::setStopColor),
        slotOf(&I::startPattern),
        slotOf(&I::endPattern),
        slotOf(&I::addElement),
    };
    EXPECT_EQ(describe(slots, destructorSlots), "");
}

TEST(InterfaceOrder, TextOfTinyFollowsTheVirtualOperationsOfItsBases) {
    using T = SVGTinyImpl;
    EXPECT_EQ(
        slotOf(static_cast<void (T::*)(const UnicodeString&, const MoxLength&, const MoxLength&,
                                       PAINTMODE, TLStringWithGlyphInfo*, bool)>(&T::drawText)),
        slotOf(&DrawmereImpl::addElement) + 1);
}

TEST(InterfaceOrder, VirtualOperationsOfTheHandlerKeepTheirSlots) {
    using H = DrawmereErrHandler;
    EXPECT_EQ(slotOf(static_cast<void (H::*)(const MoxError&)>(&H::handleError)), destructorSlots);
    EXPECT_EQ(slotOf(static_cast<void (H::*)()>(&H::handleError)), destructorSlots + 1);
}

TEST(InterfaceOrder, VirtualOperationsOfNodesKeepTheirSlots) {
    using N = MoxNode;
    const std::vector<std::size_t> slots = {
        slotOf(&N::getTypeID),      slotOf(&N::isA),
        slotOf(&N::getTypeName),    slotOf(&N::getNodeName),
        slotOf(&N::getLocalName),   slotOf(&N::getPrefix),
        slotOf(&N::getNodeValue),   slotOf(&N::getNodeType),
        slotOf(&N::getParentNode),  slotOf(&N::hasChildNodes),
        slotOf(&N::getFirstChild),  slotOf(&N::getPreviousSibling),
        slotOf(&N::getNextSibling), slotOf(&N::getOwnerDocument),
        slotOf(&N::insertBefore),   slotOf(&N::replaceChild),
        slotOf(&N::removeChild),    slotOf(&N::appendChild),
        slotOf(&N::getAttributes),  slotOf(&N::cloneNode),
        slotOf(&N::isElementNode),  slotOf(&N::isText),
        slotOf(&N::saveTextTag),    slotOf(&N::getText),
        slotOf(&N::setText),        slotOf(&N::appendChildText),
    };
    EXPECT_EQ(describe(slots, destructorSlots), "");
}

TEST(InterfaceOrder, VirtualOperationsOfElementsAndDocumentsFollowEachOther) {
    using E = MoxElement;
    const std::vector<std::size_t> elementSlots = {
        slotOf(&E::getAttribute),
        slotOf(&E::getAttributeNS),
        slotOf(static_cast<void (E::*)(MoxName, const MoxValue&)>(&E::setAttribute)),
        slotOf(&E::removeAttribute),
        slotOf(&E::hasAttribute),
    };
    EXPECT_EQ(describe(elementSlots, elementSlots[0]), "");
    const std::vector<std::size_t> documentSlots = {
        slotOf(&MoxDocument::getDocumentElement),
        slotOf(&MoxDocument::createElement),
        slotOf(&MoxDocument::createElementNS),
    };
    EXPECT_EQ(describe(documentSlots, documentSlots[0]), "");
    EXPECT_EQ(documentSlots[0], elementSlots[0]); // both begin where those of nodes end
}

/// Returns: the first place at which a member does not lie behind the one before it, -1 for none.
int findDisorder(const std::vector<const void*>& members) {
    for (std::size_t i = 1; i < members.size(); ++i) {
        if (!std::less<>()(members[i - 1], members[i])) {
            return static_cast<int>(i);
        }
    }
    return -1;
}

TEST(InterfaceOrder, MembersOfTheFrontClassKeepTheirOrder) {
    const Drawmere d(nullptr, nullptr);
    EXPECT_EQ(
        findDisorder({&d, &d.config, &d.pageUri, &d.outputPath, &d.outputStream, &d.impl,
                      &d.errorHandler, &d.currentPage, &d.firstPage, &d.pageCount, &d.pageAnchors,
                      &d.allAnchors, &d.anchorPages, &d.pageFiles, &d.documents}),
        -1);
}

TEST(InterfaceOrder, MembersOfTheImplementationKeepTheirOrder) {
    SVGConfig config;
    const DrawmereImpl i(&config);
    EXPECT_EQ(findDisorder({&i, &i.groupManager, &i.treeManager, &i.savedGroupManager,
                            &i.refIdManager, &i.clipPathId, &i.inClipDef, &i.lastPathPaintMode,
                            &i.graphicManager, &i.fontManager, &i.config}),
              -1);
}

template <typename Impl> int findDisorderInGradient() {
    SVGConfig config;
    const Impl i(&config);
    return findDisorder({&i, &i.config, &i.gradientId, &i.lowStopColor, &i.highStopColor,
                         &i.noStopYet, &i.highStopOffset, &i.lowStopOffset});
}

TEST(InterfaceOrder, MembersOfTinyAndWispKeepTheirOrder) {
    EXPECT_EQ(findDisorderInGradient<SVGTinyImpl>(), -1);
    EXPECT_EQ(findDisorderInGradient<SVGWispImpl>(), -1);
}

TEST(InterfaceOrder, MembersOfTheTreeManagerKeepTheirOrder) {
    const SVGTreeManager t;
    EXPECT_EQ(findDisorder({&t, &t.document, &t.currentNode, &t.nodeStack, &t.fontStack, &t.context,
                            &t.unlocked, &t.defsElement}),
              -1);
}

TEST(InterfaceOrder, MembersOfTheConfigurationKeepTheirOrder) {
    const SVGConfig c;
    EXPECT_EQ(findDisorder({&c,
                            &c.encoding,
                            &c.svgType,
                            &c.svgVersion,
                            &c.gzip,
                            &c.imageProcessingName,
                            &c.imageProcessing,
                            &c.numberFormatDefault,
                            &c.embedAllFonts,
                            &c.embedFontNames,
                            &c.keepGroups,
                            &c.imageConversionName,
                            &c.imageConversion,
                            &c.jpegQuality,
                            &c.unsetText,
                            &c.imageBaseUri,
                            &c.imageCopyUri,
                            &c.streamOutput,
                            &c.checkPaths,
                            &c.svgOutputUri,
                            &c.singleFile,
                            &c.saveOption,
                            &c.wispMode,
                            &c.wispOptions,
                            &c.downsampleDpi,
                            &c.downsampleThreshold,
                            &c.downsampleType,
                            &c.reservedFlag,
                            &c.copyNamePrefix,
                            &c.keepPageNumber,
                            &c.enteredImageNames,
                            &c.imageNameMap,
                            &c.copyNameCounter,
                            &c.ownedObject,
                            &c.ownsObject,
                            &c.streamsByName,
                            &c.namesByStream,
                            &c.errors,
                            &c.createdFiles,
                            &c.maxLength,
                            &c.limitValue,
                            &c.colorFlag}),
              -1);
}

TEST(InterfaceOrder, EnumeratorsKeepTheirNumbers) {
    const struct {
        int enumerator;
        int number;
    } rows[] = {
        {PAINTMODE_NONE, 0},
        {PAINTMODE_FILL, 1},
        {PAINTMODE_STROKE, 2},
        {PAINTMODE_FILLSTROKE, 3},
        {PAINTMODE_TEXT, 4},
        {FILLRULE_NONZERO, 0},
        {FILLRULE_EVENODD, 1},
        {CLIPRULE_NONZERO, 0},
        {CLIPRULE_EVENODD, 1},
        {LINECAP_UNSTATED, -1},
        {LINECAP_BUTT, 0},
        {LINECAP_ROUND, 1},
        {LINECAP_SQUARE, 2},
        {LINEJOIN_UNSTATED, -1},
        {LINEJOIN_MITER, 0},
        {LINEJOIN_ROUND, 1},
        {LINEJOIN_BEVEL, 2},
        {TEXTANCHOR_START, 0},
        {TEXTANCHOR_MIDDLE, 1},
        {TEXTANCHOR_END, 2},
        {TEXTANCHOR_UNSTATED, 3},
        {TEXTDECORATION_NONE, 0},
        {TEXTDECORATION_UNDERLINE, 1},
        {TEXTDECORATION_OVERLINE, 2},
        {TEXTDECORATION_LINETHROUGH, 3},
        {TEXTDECORATION_BLINK, 4},
        {OPACITYDEST_ELEMENT, 0},
        {OPACITYDEST_STROKE, 1},
        {OPACITYDEST_FILL, 2},
        {ELEMENT_TYPE_NONE, -2},
        {ELEMENT_TYPE_PLAIN, -1},
        {ELEMENT_TYPE_PATTERN, 0},
        {ELEMENT_TYPE_GRADIENT, 1},
        {ELEMENT_TYPE_MASK, 2},
        {ELEMENT_TYPE_CLIP, 3},
        {ELEMENT_TYPE_LINK, 5},
        {ELEMENTTYPE_SHAPE, 0},
        {ELEMENTTYPE_IMAGE, 1},
        {ELEMENTTYPE_TEXT, 2},
        {USERSPACEONUSE, 0},
        {OBJECTBOUNDINGBOX, 1},
        {GRADPAD, 0},
        {GRADREFLECT, 1},
        {GRADREPEAT, 2},
        {MoxCommonNS::MOXUNIT_NONE, 0},
        {MoxCommonNS::MOXUNIT_CM, 6},
        {MoxCommonNS::MOXUNIT_MM, 7},
        {MoxCommonNS::MOXUNIT_INCH, 8},
        {MoxCommonNS::MOXUNIT_POINT, 9},
        {MoxCommonNS::MOXUNIT_PICA, 10},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(row.enumerator, row.number) << "row " << &row - rows;
    }
    EXPECT_EQ(sizeof(PAINTMODE), sizeof(std::int32_t));
    EXPECT_EQ(sizeof(MoxUnitType), sizeof(std::int32_t));
}

} // namespace
} // namespace DrawmereTest
