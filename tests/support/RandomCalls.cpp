#include "tests/support/RandomCalls.h"

#include "draw/DrawmereImpl.h"
#include "foundation/common/MoxUtil.h"
#include "foundation/records/TLStringWithGlyphInfo.h"
#include "state/SVGGroupManager.h"
#include "tests/fonts/EmbeddedFont.h"
#include "tests/support/AnyImage.h"
#include "tests/support/TinyImages.h"
#include "tree/SVGTreeManager.h"

#include <algorithm>
#include <tuple>

namespace DrawmereTest {
namespace {

// Between braces arguments are made in order; between parentheses compilers differ.
template <typename Result, typename... Args>
void callMember(RandomCalls& any, Drawmere& page, Result (Drawmere::*member)(Args...)) {
    std::tuple<std::decay_t<Args>...> arguments{any.make<std::decay_t<Args>>()...};
    std::apply(
        [&](auto&... values) {
            if constexpr (std::is_same_v<Result, UnicodeString>) {
                any.ids.push_back((page.*member)(values...));
            } else {
                static_cast<void>((page.*member)(values...));
            }
        },
        arguments);
}

/// Calls the member with arguments made for it.
template <auto member> void call(RandomCalls& any, Drawmere& page) {
    callMember(any, page, member);
}

/// Chooses the overload with these arguments.
template <typename... Args> struct With {
    template <typename Result> static constexpr auto of(Result (Drawmere::*member)(Args...)) {
        return member;
    }
};

/// Draws a small file, sometimes a damaged one and mostly by a name that was drawn before.
void drawFile(RandomCalls& any, Drawmere& page) {
    static const std::string files[] = {makePng(3, 2), makePng(40, 30, /*hasAlpha=*/true),
                                        makeBmp(5, 4), "<svg/>", ""};
    constexpr const char16_t* names[] = {u"", u"in/a.png", u"b.bmp", u"c"};
    constexpr TLGraphicType types[] = {TalGraphic::TLGRAPHICTYPE_OTHER,
                                       TalGraphic::TLGRAPHICTYPE_PNG};
    const std::string& file = files[any.below(5)];
    const bool isDamaged = any.below(8) == 7;
    const std::string bytes = file.substr(0, isDamaged ? file.size() / 2 : file.size());
    const bool isOdd = any.temper == RandomCalls::WILD && any.below(4) == 3;
    const auto type = isOdd ? any.make<TLGraphicType>() : any.pick(types);
    const auto name = isOdd ? any.make<UnicodeString>() : UnicodeString(any.pick(names));
    const auto size = any.make<MoxPointT<MoxLength>>();
    const auto place = any.make<MoxPointT<MoxLength>>();
    AnyImage image(type, bytes, name);
    page.drawImage(&image, type, size.x, size.y, place.x, place.y);
}

/// Sets a font that there is.
void setTestFont(RandomCalls& any, Drawmere& page) {
    constexpr const char16_t* faces[] = {uprightFace, hanFace, arabicFace, latinFace};
    SVGFont font = any.make<SVGFont>();
    const auto size = any.make<MoxLength>();
    const auto variant = any.make<UnicodeString>();
    const bool isVertical = any.flag();
    font.setFontAttribute(any.pick(faces), size, FONTWEIGHT_NORMAL, FSTYLE_NORMAL, variant,
                          isVertical);
    font.embedFont = any.below(4) != 3;
    page.setFont(&font, &testFonts());
}

void setSystemFont(RandomCalls& any, Drawmere& page) {
    SVGFont font = any.make<SVGFont>();
    page.setFont(any.flag() ? &font : nullptr, nullptr);
}

void setDashLine(RandomCalls& any, Drawmere& page) {
    const auto dashes = any.makeList<MoxLength>();
    const auto offset = any.make<MoxLength>();
    if (any.flag()) {
        page.setDashLine(dashes.data(), static_cast<int>(dashes.size()), offset);
    } else {
        page.setDashLine(nullptr, any.make<int>(), offset);
    }
}

void drawPolyline(RandomCalls& any, Drawmere& page) {
    auto points = any.makeList<float>();
    page.drawPolyline(points.data(), static_cast<int>(points.size()), any.make<PAINTMODE>());
}

void drawPolygon(RandomCalls& any, Drawmere& page) {
    if (any.flag()) {
        auto points = any.makeList<float>();
        page.drawPolygon(points.data(), static_cast<int>(points.size()), any.make<PAINTMODE>());
    } else {
        page.drawPolygon(nullptr, static_cast<int>(any.number()), PAINTMODE_FILL);
    }
}

void drawRun(RandomCalls& any, Drawmere& page) {
    const auto text = any.make<UnicodeString>();
    const auto x = any.makeList<MoxLength>();
    const auto y = any.makeList<MoxLength>();
    const auto rotate = any.makeList<float>();
    const auto mode = any.make<PAINTMODE>();
    const bool hasGlyphs = any.flag();
    const bool isWhole = any.flag();
    std::vector<TalFont::TLGlyphEntry> entries;
    for (unsigned count = hasGlyphs ? any.below(4) : 0; count > 0; --count) {
        const auto place = static_cast<std::int32_t>(entries.size());
        const bool isOrderly = any.temper == RandomCalls::ORDERLY;
        const std::int16_t charCount =
            isOrderly ? (place < text.length() ? 1 : 0) : any.make<std::int16_t>();
        entries.push_back({charCount, any.make<std::uint16_t>()});
    }
    TalFont::TLStringWithGlyphInfo glyphs(entries);
    page.drawText(text, x, y, rotate, mode, hasGlyphs ? &glyphs : nullptr, isWhole, any.flag());
}

void drawText(RandomCalls& any, Drawmere& page) {
    const auto text = any.make<UnicodeString>();
    const auto place = any.make<MoxPointT<MoxLength>>();
    const auto mode = any.make<PAINTMODE>();
    const bool isWhole = any.flag();
    page.drawText(text, place.x, place.y, mode, nullptr, isWhole, any.flag());
}

void drawNoImage(RandomCalls& any, Drawmere& page) {
    const auto length = any.make<MoxLength>();
    page.drawImage(nullptr, any.make<TLGraphicType>(), length, length, length, length);
}

UnicodeString makeNewName(RandomCalls& any) {
    return any.temper == RandomCalls::ORDERLY
               ? u"n" + MoxCommonNS::MoxUtil::toString(++any.newNumber)
               : any.make<UnicodeString>();
}

void setView(RandomCalls& any, Drawmere& page) {
    const UnicodeString name = makeNewName(any);
    const auto x = any.make<float>();
    const auto y = any.make<float>();
    const auto width = any.make<float>();
    page.setInternalView(name, x, y, width, any.make<float>());
}

void setAnchor(RandomCalls& any, Drawmere& page) {
    const UnicodeString name = makeNewName(any);
    const auto x = any.make<float>();
    page.setInternalLinkAnchor(name, x, any.make<float>());
}

void startPage(RandomCalls& any, Drawmere& page) {
    const int number = any.temper == RandomCalls::ORDERLY ? ++any.newNumber : any.make<int>();
    page.startPage(number, any.make<MoxRectT<MoxLength>>());
}

void setWritingMode(RandomCalls& any, Drawmere& page) {
    constexpr const char16_t* modes[] = {u"lr-tb", u"rl-tb", u"tb-rl", u"lr", u"rl", u"tb"};
    page.setWritingMode(any.temper == RandomCalls::ORDERLY ? MoxName(any.pick(modes))
                                                           : any.make<MoxName>());
}

void openDocument(Drawmere& page, std::ostream& stream) {
    if (page.config->streamOutput) {
        page.initRootSvg(&stream);
    } else {
        page.initRootSvg(page.pageUri->getText());
    }
}

using Length = MoxLength;
using Point = const MoxPointT<MoxLength>&;

constexpr auto startGradient =
    call<With<Length, Length, Length, Length, SVGMatrix, UNITSTYPE, GRADSPERADMOD>::of(
        &Drawmere::startLinearGradient)>;
constexpr auto startGradientBetween =
    call<With<Point, Point, const SVGMatrix&, UNITSTYPE, GRADSPERADMOD>::of(
        &Drawmere::startLinearGradient)>;
constexpr auto startLink =
    call<With<const UnicodeString&, const MoxName&>::of(&Drawmere::startLink)>;
constexpr auto startLinkOfValue = call<With<const MoxValue&>::of(&Drawmere::startLink)>;

/// Calls that take pointers stand at the end, those that begin and end documents in `draw`.
constexpr void (*calls[])(RandomCalls& any, Drawmere& page) = {
    call<&Drawmere::pushState>,
    call<&Drawmere::popState>,
    call<&Drawmere::setScale>,
    call<With<Length, Length>::of(&Drawmere::setCanvasSize)>,
    call<With<Length, Length, MoxUnitType>::of(&Drawmere::setCanvasSize)>,
    call<&Drawmere::setTransMatrix>,
    call<&Drawmere::setFillColor>,
    call<&Drawmere::setFillColorId>,
    call<&Drawmere::setFillColorName>,
    call<&Drawmere::setStrokeColor>,
    call<&Drawmere::setStrokeColorName>,
    call<&Drawmere::setStrokeColorId>,
    call<&Drawmere::setStrokeWidth>,
    call<&Drawmere::setFillRule>,
    call<&Drawmere::setOpacity>,
    call<&Drawmere::setMaskReference>,
    call<&Drawmere::setTextAnchor>,
    call<&Drawmere::setTextDecoration>,
    call<&Drawmere::setLetterSpacing>,
    call<&Drawmere::setWordSpacing>,
    call<&Drawmere::setLineCap>,
    call<&Drawmere::setLineJoin>,
    call<&Drawmere::setMiterLimit>,
    setWritingMode,
    call<&Drawmere::setClipRuleAttrVal>,
    call<&Drawmere::startPathData>,
    call<&Drawmere::endPathData>,
    call<&Drawmere::setPathMoveTo>,
    call<&Drawmere::setPathLineTo>,
    call<&Drawmere::setPathCubicBezierCurveTo>,
    call<&Drawmere::setPathQuadraticBezierCurveTo>,
    call<&Drawmere::setPathClosepath>,
    call<&Drawmere::startClipDef>,
    call<&Drawmere::startClipRect>,
    call<&Drawmere::endClipDef>,
    call<&Drawmere::doClip>,
    call<&Drawmere::drawLine>,
    call<&Drawmere::drawRect>,
    call<&Drawmere::drawCircle>,
    call<&Drawmere::drawEllipse>,
    call<&Drawmere::startPattern>,
    call<&Drawmere::startMask>,
    startGradient,
    startGradientBetween,
    call<&Drawmere::startRadialGradient>,
    call<&Drawmere::setStopColor>,
    call<&Drawmere::endGradiant>,
    call<&Drawmere::endMask>,
    call<&Drawmere::endPattern>,
    startLink,
    startLinkOfValue,
    call<&Drawmere::endLink>,
    setView,
    setAnchor,
    startPage,
    call<&Drawmere::endPage>,
    call<&Drawmere::hasError>,
    call<&Drawmere::popError>,
    setSystemFont,
    setDashLine,
    drawPolyline,
    drawPolygon,
    drawRun,
    drawText,
    drawNoImage,
    drawFile,
    setTestFont,
};

/// What ends whatever may be open. They are called more often than their like, so that less is
/// lost in a path or a gradient that nothing ends.
constexpr void (*ends[])(RandomCalls& any, Drawmere& page) = {
    call<&Drawmere::popState>, call<&Drawmere::endPathData>, call<&Drawmere::endClipDef>,
    call<&Drawmere::endMask>,  call<&Drawmere::endPattern>,  call<&Drawmere::endGradiant>,
    call<&Drawmere::endLink>,
};

constexpr void (*pathCalls[])(RandomCalls& any, Drawmere& page) = {
    call<&Drawmere::endPathData>,
    call<&Drawmere::setPathMoveTo>,
    call<&Drawmere::setPathLineTo>,
    call<&Drawmere::setPathCubicBezierCurveTo>,
    call<&Drawmere::setPathQuadraticBezierCurveTo>,
    call<&Drawmere::setPathClosepath>,
};

constexpr void (*gradientCalls[])(RandomCalls& any, Drawmere& page) = {
    call<&Drawmere::setStopColor>,
    call<&Drawmere::setStopColor>,
    call<&Drawmere::endGradiant>,
};

/// Returns: one of the calls that can be made now.
auto pickCall(RandomCalls& any, const DrawmereImpl& impl) {
    if (any.temper == RandomCalls::ORDERLY && impl.savedGroupManager) {
        return any.pick(pathCalls);
    }
    if (any.temper == RandomCalls::ORDERLY && !impl.treeManager->unlocked) {
        return any.pick(gradientCalls);
    }
    return any.below(4) == 3 ? any.pick(ends) : any.pick(calls);
}

/// How a state is opened and how it ends.
struct Bracket {
    void (*open)(RandomCalls& any, Drawmere& page);
    void (*close)(RandomCalls& any, Drawmere& page);
};

constexpr Bracket brackets[] = {
    {call<&Drawmere::pushState>, call<&Drawmere::popState>},
    {call<&Drawmere::startPattern>, call<&Drawmere::endPattern>},
    {startGradient, call<&Drawmere::endGradiant>},
    {startGradientBetween, call<&Drawmere::endGradiant>},
    {call<&Drawmere::startRadialGradient>, call<&Drawmere::endGradiant>},
    {call<&Drawmere::startMask>, call<&Drawmere::endMask>},
    {call<&Drawmere::startClipDef>, call<&Drawmere::endClipDef>},
    {call<&Drawmere::startClipRect>, call<&Drawmere::endClipDef>},
    {startLink, call<&Drawmere::endLink>},
    {startLinkOfValue, call<&Drawmere::endLink>},
};

/// The id of the definition that is written now, empty when none is.
UnicodeString getOpenDefinition(const DrawmereImpl& impl) {
    const SVGElement* node = impl.treeManager->getCurrentNode();
    const MoxCommonNS::MoxNode* top = node;
    while (top && top->parentLink()) {
        top = top->parentLink();
    }
    const bool isInDocument = top == impl.treeManager->document.get();
    return isInDocument ? node->getAttribute(MoxName(u"id")).toString() : UnicodeString();
}

void unpack(const DrawmereImpl& impl) {
    const SVGGroupManager* page =
        impl.savedGroupManager ? impl.savedGroupManager : impl.groupManager;
    impl.treeManager->stopPacking(page->getGroupRootNode());
}

} // namespace

void RandomCalls::makeCall(Drawmere& page) {
    if (unpacks) {
        unpack(*page.impl);
        page.impl->treeManager->packsFinished = ++unpackCount % 4 != 0;
    }
    const std::size_t idCount = ids.size();
    const UnicodeString clip = page.impl->clipPathId;
    const auto picked = pickCall(*this, *page.impl);
    if (temper == ORDERLY && !keepOrder(picked)) {
        return;
    }
    picked(*this, page);
    if (!page.impl) {
        return;
    }
    if (page.impl->clipPathId != clip) {
        ids.push_back(page.impl->clipPathId);
    }
    if (ids.size() > idCount && getOpenDefinition(*page.impl) != ids.back()) {
        lostIds.push_back(ids.back());
    }
}

void RandomCalls::draw(Drawmere& page, std::ostream& stream, int count) {
    constexpr unsigned callsOfADocument = 240;
    for (; count > 0 && !isUsedUp(); --count) {
        try {
            if (!page.impl) {
                ids.clear();
                openDocument(page, stream);
            } else if (below(callsOfADocument) == callsOfADocument - 1) {
                finishDocument(page);
            } else {
                makeCall(page);
            }
        } catch (const MoxError&) { // NOLINT(bugprone-empty-catch): calls in no order throw
        }
    }
    finishDocument(page);
    page.finish();
}

bool RandomCalls::keepOrder(Call picked) {
    for (const Bracket& bracket : brackets) {
        if (picked == bracket.open) {
            openStates.push_back(bracket.close);
            return true;
        }
    }
    const bool isEnd = std::ranges::find(brackets, picked, &Bracket::close) != std::end(brackets);
    if (isEnd && (openStates.empty() || openStates.back() != picked)) {
        return false;
    }
    if (isEnd) {
        openStates.pop_back();
    }
    return true;
}

void RandomCalls::finishDocument(Drawmere& page) {
    if (page.impl && page.impl->savedGroupManager && temper == ORDERLY) {
        page.endPathData(PAINTMODE_FILL);
    }
    for (; page.impl && !openStates.empty(); openStates.pop_back()) {
        openStates.back()(*this, page);
    }
    page.finishRootSvg();
}

} // namespace DrawmereTest
