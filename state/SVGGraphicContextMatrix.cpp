// The part of the graphic state that accumulates matrices and writes them.
#include "foundation/common/MoxNumberText.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGUtil.h"

#include <cmath>
#include <numbers>
#include <string_view>

namespace DrawmereNS {
namespace {

using MoxCommonNS::narrow;

/// The largest number either way that Basic and Tiny promise to read in a matrix.
constexpr float smallProfileLimit = 32768.0F;

constexpr std::size_t maxNumbers = 6;

/// The numbers of a transform; an empty list is no transform.
struct Numbers {
    float values[maxNumbers] = {};
    std::size_t count = 0;
};

Numbers listMatrix(const SVGMatrix& m) { return {{m.a, m.b, m.c, m.d, m.e, m.f}, maxNumbers}; }

Numbers listShift(const SVGMatrix& m) { return {{m.e, m.f}, 2}; }

Numbers listFactors(const SVGMatrix& m) {
    return m.a == 0.0F && m.d == 0.0F ? Numbers() : Numbers{{m.a, m.d}, 2};
}

Numbers listAngle(double radians) {
    const auto degrees = static_cast<float>(radians * 180.0 / std::numbers::pi);
    return degrees == 0.0F ? Numbers() : Numbers{{degrees}, 1};
}

Numbers listRotation(const SVGMatrix& m) {
    const double angle = std::acos(static_cast<double>(m.a));
    return listAngle(m.b >= 0.0F ? angle : -angle);
}

Numbers listSkewX(const SVGMatrix& m) { return listAngle(std::atan(static_cast<double>(m.c))); }

Numbers listSkewY(const SVGMatrix& m) { return listAngle(std::atan(static_cast<double>(m.b))); }

struct TransformForm {
    MATRIXTYPE type;
    std::string_view function;
    Numbers (*list)(const SVGMatrix&);
};

constexpr TransformForm transformForms[] = {
    {MATRIXTYPE_GENERAL, "matrix(", listMatrix},
    {MATRIXTYPE_TRANSLATE, "translate(", listShift},
    {MATRIXTYPE_SCALE, "scale(", listFactors},
    {MATRIXTYPE_SCALENONUNIFORM, "scale(", listFactors},
    {MATRIXTYPE_ROTATE, "rotate(", listRotation},
    {MATRIXTYPE_SKEWX, "skewX(", listSkewX},
    {MATRIXTYPE_SKEWY, "skewY(", listSkewY},
};

/// A transform in the making, in place.
class TransformText {
public:
    explicit TransformText(SVGMatrix m) {
        m.setType();
        for (const TransformForm& form : transformForms) {
            if (form.type == m.type) {
                write(form.function, form.list(m));
            }
        }
    }

    /// Returns: the text, valid as long as this; empty when there is nothing to write.
    std::string_view get() const { return {text, length}; }

private:
    void write(std::string_view function, const Numbers& numbers) {
        if (numbers.count == 0) {
            return;
        }
        length = function.copy(text, function.size());
        for (std::size_t i = 0; i < numbers.count; ++i) {
            length += MoxCommonNS::writeReal(numbers.values[i], text + length);
            text[length++] = i + 1 < numbers.count ? ',' : ')';
        }
    }

    static constexpr std::size_t maxFunction = 16;

    char text[maxFunction +
              maxNumbers * (MoxCommonNS::maxRealText + 1)]; // filled as far as `length`
    std::size_t length = 0;
};

void writeTransform(SVGElement* element, SVGName attribute, const SVGMatrix& m) {
    if (SVGGraphicContext::IsUnitMatrix(m)) {
        return;
    }
    const TransformText text(m);
    if (!text.get().empty()) {
        element->setSVGAttribute(attribute, MoxValue::fromAscii(text.get()));
    }
}

/// Of all kinds only a scaling can say nothing: every other one has a number that made it what it
/// is.
bool saysNothing(const SVGMatrix& m) {
    return m.type == MATRIXTYPE_SCALE && m.a == 0.0F && m.d == 0.0F;
}

bool isBeyond(float number) { return number > smallProfileLimit || number < -smallProfileLimit; }

bool standsUnderRoot(const SVGElement& element) {
    const auto* parent = narrow<MoxElement>(element.getParentNode());
    return SVGUtil::getSVGLocalName(parent) == SVGName::svg;
}

} // namespace

bool SVGGraphicContext::IsUnitMatrix(const SVGMatrix& m) {
    return m.a == 1.0F && m.d == 1.0F && m.b == 0.0F && m.c == 0.0F && m.e == 0.0F && m.f == 0.0F;
}

UnicodeString SVGGraphicContext::convertMatrixToString(const SVGMatrix& m) {
    if (IsUnitMatrix(m)) {
        return {};
    }
    const TransformText text(m);
    return UnicodeString::fromUTF8({text.get().data(), static_cast<int>(text.get().size())});
}

bool SVGGraphicContext::isBeyondProfile(const SVGMatrix& m) const {
    const bool isSmall = svgType == SVGConfig::SVGTYPE_BASIC || isTiny();
    return isSmall && (isBeyond(m.a) || isBeyond(m.b) || isBeyond(m.c) || isBeyond(m.d) ||
                       isBeyond(m.e) || isBeyond(m.f));
}

void SVGGraphicContext::setTransMatrix(SVGMatrix m) {
    m.setType();
    if (isBeyondProfile(m) || saysNothing(m)) {
        return;
    }
    currentGC.transMatrix = currentGC.transMatrix.multiply(m);
}

void SVGGraphicContext::setTransformAttr(SVGElement* element, int mode) {
    if (!element) {
        return;
    }
    switch (mode) {
    case TRANSFORMMODE_ROOT:
        writeTransform(element, SVGName::transform, rootMatrix);
        break;
    case TRANSFORMMODE_GROUP:
        writeTransform(element, SVGName::transform, groupGC.transMatrix);
        break;
    case TRANSFORMMODE_CURRENT:
        writeTransform(element, SVGName::transform, currentGC.transMatrix);
        break;
    case TRANSFORMMODE_NESTEDCLIP:
        writeTransform(element, SVGName::transform, currentGC.transMatrix);
        moveCurrentToGroup();
        break;
    case TRANSFORMMODE_CLIP:
        writeClip(element);
        break;
    case TRANSFORMMODE_GRADIENT:
        writeTransform(element, SVGName::gradientTransform, currentGC.transMatrix);
        break;
    default:
        break;
    }
}

void SVGGraphicContext::writeClip(SVGElement* element) {
    if (standsUnderRoot(*element)) {
        writeTransform(element, SVGName::transform, rootMatrix);
        // On purpose: the current matrix moves nowhere. Kept, it would apply to what follows too.
        currentGC.transMatrix = SVGMatrix();
        return;
    }
    moveCurrentToGroup();
    writeTransform(element, SVGName::transform, groupGC.transMatrix);
    rootMatrix = rootMatrix.multiply(groupGC.transMatrix);
    groupGC.transMatrix = SVGMatrix();
}

} // namespace DrawmereNS
