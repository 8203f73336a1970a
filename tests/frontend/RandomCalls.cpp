#include "tests/frontend/RandomCalls.h"

#include "foundation/records/TLMemoryImage.h"
#include "foundation/records/TLStringWithGlyphInfo.h"
#include "tests/fonts/EmbeddedFont.h"
#include "tests/support/TinyImages.h"

namespace DrawmereTest {
namespace {

template <typename Result, typename... Args>
void callMember(RandomCalls& any, Drawmere& page, Result (Drawmere::*member)(Args...)) {
    static_cast<void>((page.*member)(any.make<std::decay_t<Args>>()...));
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

/// An image of a type that its bytes don't tell.
class AnyImage : public TalGraphic::TLMemoryImage {
public:
    AnyImage(TLGraphicType imageType, std::string_view bytes, const UnicodeString& name)
        : TLMemoryImage(bytes, name), type(imageType) {}

    TLGraphicType getGraphicType() override { return type; }

private:
    TLGraphicType type;
};

/// Draws a small file, sometimes a damaged one and mostly by a name that was drawn before.
void drawFile(RandomCalls& any, Drawmere& page) {
    static const std::string files[] = {makePng(3, 2), makePng(40, 30, /*hasAlpha=*/true),
                                        makeBmp(5, 4), "<svg/>", ""};
    constexpr const char16_t* names[] = {u"", u"in/a.png", u"b.bmp", u"c"};
    constexpr TLGraphicType types[] = {TalGraphic::TLGRAPHICTYPE_OTHER,
                                       TalGraphic::TLGRAPHICTYPE_PNG};
    const std::string& file = files[any.below(5)];
    const bool isDamaged = any.below(8) == 0;
    const std::string bytes = file.substr(0, isDamaged ? file.size() / 2 : file.size());
    const bool isOdd = any.below(4) == 0;
    const auto type = isOdd ? any.make<TLGraphicType>() : any.pick(types);
    AnyImage image(type, bytes, isOdd ? any.make<UnicodeString>() : UnicodeString(any.pick(names)));
    const auto length = [&any] { return any.make<MoxLength>(); };
    page.drawImage(&image, type, length(), length(), length(), length());
}

/// Sets a font that there is.
void setTestFont(RandomCalls& any, Drawmere& page) {
    constexpr const char16_t* faces[] = {uprightFace, hanFace, arabicFace, latinFace};
    SVGFont font = any.make<SVGFont>();
    font.setFontAttribute(any.pick(faces), any.make<MoxLength>(), FONTWEIGHT_NORMAL, FSTYLE_NORMAL,
                          any.make<UnicodeString>(), any.flag());
    font.setEmbedAttribute(any.below(4) != 0, any.flag());
    page.setFont(&font, &testFonts());
}

using Length = MoxLength;
using Point = const MoxPointT<MoxLength>&;

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
    call<&Drawmere::setWritingMode>,
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
    call<With<Length, Length, Length, Length, SVGMatrix, UNITSTYPE, GRADSPERADMOD>::of(
        &Drawmere::startLinearGradient)>,
    call<With<Point, Point, const SVGMatrix&, UNITSTYPE, GRADSPERADMOD>::of(
        &Drawmere::startLinearGradient)>,
    call<&Drawmere::startRadialGradient>,
    call<&Drawmere::setStopColor>,
    call<&Drawmere::endGradiant>,
    call<&Drawmere::endMask>,
    call<&Drawmere::endPattern>,
    call<With<const UnicodeString&, const MoxName&>::of(&Drawmere::startLink)>,
    call<With<const MoxValue&>::of(&Drawmere::startLink)>,
    call<&Drawmere::endLink>,
    call<&Drawmere::setInternalView>,
    call<&Drawmere::setInternalLinkAnchor>,
    call<&Drawmere::startPage>,
    call<&Drawmere::endPage>,
    call<&Drawmere::hasError>,
    call<&Drawmere::popError>,
    [](RandomCalls& any, Drawmere& page) {
        SVGFont font = any.make<SVGFont>();
        page.setFont(any.flag() ? &font : nullptr, nullptr);
    },
    [](RandomCalls& any, Drawmere& page) {
        const auto dashes = any.makeList<MoxLength>();
        const bool isNull = any.flag();
        page.setDashLine(isNull ? nullptr : dashes.data(),
                         isNull ? any.make<int>() : static_cast<int>(dashes.size()),
                         any.make<MoxLength>());
    },
    [](RandomCalls& any, Drawmere& page) {
        auto points = any.makeList<float>();
        page.drawPolyline(points.data(), static_cast<int>(points.size()), any.make<PAINTMODE>());
    },
    [](RandomCalls& any, Drawmere& page) {
        page.drawPolygon(nullptr, any.make<int>(), any.make<PAINTMODE>());
    },
    [](RandomCalls& any, Drawmere& page) {
        TalFont::TLStringWithGlyphInfo glyphs(std::vector<TalFont::TLGlyphEntry>{
            {any.make<std::int16_t>(), any.make<std::uint16_t>()}});
        page.drawText(any.make<UnicodeString>(), any.makeList<MoxLength>(),
                      any.makeList<MoxLength>(), any.makeList<float>(), any.make<PAINTMODE>(),
                      any.flag() ? &glyphs : nullptr, any.flag(), any.flag());
    },
    [](RandomCalls& any, Drawmere& page) {
        page.drawText(any.make<UnicodeString>(), any.make<MoxLength>(), any.make<MoxLength>(),
                      any.make<PAINTMODE>(), nullptr, any.flag(), any.flag());
    },
    [](RandomCalls& any, Drawmere& page) {
        page.drawImage(nullptr, any.make<TLGraphicType>(), any.make<MoxLength>(),
                       any.make<MoxLength>(), any.make<MoxLength>(), any.make<MoxLength>());
    },
    drawFile,
    setTestFont,
};

} // namespace

void RandomCalls::draw(Drawmere& page, std::ostream& stream, int count) {
    constexpr unsigned callsOfADocument = 300;
    for (; count > 0; --count) {
        try {
            if (below(callsOfADocument) == 0) {
                page.finishRootSvg();
            } else if (!page.impl) {
                page.initRootSvg(&stream);
            } else {
                pick(calls)(*this, page);
            }
        } catch (const MoxError&) { // NOLINT(bugprone-empty-catch): calls in no order throw
        }
    }
    page.finishRootSvg();
    page.finish();
}

} // namespace DrawmereTest
