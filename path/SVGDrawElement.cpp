#include "path/SVGDrawElement.h"

#include "path/SVGNumberRule.h"

#include <algorithm>
#include <cmath>
#include <cstring>

namespace DrawmereNS {
namespace {

static_assert(1 + 3 * maxRulePoint + 2 <= SVGDrawElement::maxText);

void makeRelativeTo(MoxLength& coordinate, MoxLength origin) {
    if (!std::isnan(coordinate.getRawValue())) {
        coordinate = MoxLength::fromRaw(coordinate.getRawValue() - origin.getRawValue());
    }
}

void makeRelativeTo(MoxPointT<MoxLength>& point, const MoxPointT<MoxLength>& origin) {
    makeRelativeTo(point.x, origin.x);
    makeRelativeTo(point.y, origin.y);
}

void copyCut(const char* text, const char* end, char* buffer, unsigned long size) {
    if (!buffer || size == 0) {
        return;
    }
    const auto length = std::min<std::size_t>(end - text, size - 1);
    std::memcpy(buffer, text, length);
    buffer[length] = '\0';
}

} // namespace

SVGDrawElement::~SVGDrawElement() = default;

std::uint32_t SVGDrawElement::getTypeID() const { return typeId; }

bool SVGDrawElement::isA(std::uint32_t id) const { return id == typeId || MoxRCObject::isA(id); }

const char* SVGDrawElement::getTypeName() const { return "SVGDrawElement"; }

void SVGDrawElement::setPoint(const MoxPointT<MoxLength>& /*newPoint*/) {}

MoxPointT<MoxLength> SVGDrawElement::getPoint() const { return {}; }

void SVGDrawElement::setPoint1(const MoxPointT<MoxLength>& /*newPoint*/) {}

MoxPointT<MoxLength> SVGDrawElement::getPoint1() const { return {}; }

void SVGDrawElement::setPoint2(const MoxPointT<MoxLength>& /*newPoint*/) {}

MoxPointT<MoxLength> SVGDrawElement::getPoint2() const { return {}; }

void SVGDrawElement::makeRelative(const MoxPointT<MoxLength>& /*origin*/) {}

const char* SVGDrawElement::toString() { return nullptr; }

char* SVGDrawElement::writeText(char* out) const { return out; }

bool SVGDrawElement::isAbsolute() const {
    return drawName >= DRAWELEMENT_MOVE && drawName <= DRAWELEMENT_QUADRATIC && drawName % 2 == 1;
}

const char* SVGDrawElement::makeText() {
    if (!text) {
        text = std::make_unique<char[]>(maxText + 1);
    }
    *writeText(text.get()) = '\0';
    return text.get();
}

void SVGDrawElement::makeLengthToStringValue(const MoxLength& length, char* buffer,
                                             unsigned long size) {
    char digits[maxRuleText];
    copyCut(digits, writeRuleNumber(length, digits), buffer, size);
}

void SVGDrawElement::makePointToStringValue(const MoxPointT<MoxLength>& point, char* buffer,
                                            unsigned long size) {
    char digits[maxRulePoint];
    copyCut(digits, writeRulePoint(point, digits), buffer, size);
}

UnicodeString SVGDrawElement::makeLengthToStringValue(const MoxLength& length) {
    char16_t digits[maxRuleText];
    const auto* end = writeRuleNumber(length, digits);
    return {digits, static_cast<std::int32_t>(end - digits)};
}

UnicodeString SVGDrawElement::makePointToStringValue(const MoxPointT<MoxLength>& point) {
    char16_t digits[maxRulePoint];
    const auto* end = writeRulePoint(point, digits);
    return {digits, static_cast<std::int32_t>(end - digits)};
}

SVGDrawElementClose::SVGDrawElementClose() : SVGDrawElement('Z') {}

std::uint32_t SVGDrawElementClose::getTypeID() const { return typeId; }

bool SVGDrawElementClose::isA(std::uint32_t id) const {
    return id == typeId || SVGDrawElement::isA(id);
}

const char* SVGDrawElementClose::getTypeName() const { return "SVGDrawElementClose"; }

void SVGDrawElementClose::makeRelative(const MoxPointT<MoxLength>& /*origin*/) {
    drawName = DRAWELEMENT_CLOSE_RELATIVE;
    letter = 'z';
}

const char* SVGDrawElementClose::toString() { return makeText(); }

char* SVGDrawElementClose::writeText(char* out) const {
    *out = letter;
    return out + 1;
}

std::uint32_t SVGDrawElementPointTo::getTypeID() const { return typeId; }

bool SVGDrawElementPointTo::isA(std::uint32_t id) const {
    return id == typeId || SVGDrawElement::isA(id);
}

const char* SVGDrawElementPointTo::getTypeName() const { return "SVGDrawElementPointTo"; }

void SVGDrawElementPointTo::setPoint(const MoxPointT<MoxLength>& newPoint) { point = newPoint; }

MoxPointT<MoxLength> SVGDrawElementPointTo::getPoint() const { return point; }

SVGDrawElementMoveTo::SVGDrawElementMoveTo(const MoxPointT<MoxLength>& target)
    : SVGDrawElementPointTo('M', target) {}

std::uint32_t SVGDrawElementMoveTo::getTypeID() const { return typeId; }

bool SVGDrawElementMoveTo::isA(std::uint32_t id) const {
    return id == typeId || SVGDrawElementPointTo::isA(id);
}

const char* SVGDrawElementMoveTo::getTypeName() const { return "SVGDrawElementMoveTo"; }

void SVGDrawElementMoveTo::makeRelative(const MoxPointT<MoxLength>& origin) {
    drawName = DRAWELEMENT_MOVE_RELATIVE;
    letter = 'm';
    makeRelativeTo(point, origin);
}

const char* SVGDrawElementMoveTo::toString() { return makeText(); }

char* SVGDrawElementMoveTo::writeText(char* out) const {
    *out = letter;
    return writeRulePoint(point, out + 1);
}

SVGDrawElementLineTo::SVGDrawElementLineTo(const MoxPointT<MoxLength>& target)
    : SVGDrawElementPointTo('L', target) {}

std::uint32_t SVGDrawElementLineTo::getTypeID() const { return typeId; }

bool SVGDrawElementLineTo::isA(std::uint32_t id) const {
    return id == typeId || SVGDrawElementPointTo::isA(id);
}

const char* SVGDrawElementLineTo::getTypeName() const { return "SVGDrawElementLineTo"; }

void SVGDrawElementLineTo::makeRelative(const MoxPointT<MoxLength>& origin) {
    drawName = DRAWELEMENT_LINE_RELATIVE;
    letter = 'l';
    makeRelativeTo(point, origin);
}

const char* SVGDrawElementLineTo::toString() { return makeText(); }

char* SVGDrawElementLineTo::writeText(char* out) const {
    if (drawName == DRAWELEMENT_LINE) {
        *out = 'L';
        return writeRulePoint(point, out + 1);
    }
    if (isRuleZero(point.x)) {
        *out = 'v';
        return writeRuleNumber(point.y, out + 1);
    }
    if (isRuleZero(point.y)) {
        *out = 'h';
        return writeRuleNumber(point.x, out + 1);
    }
    *out = 'l';
    return writeRulePoint(point, out + 1);
}

SVGDrawElementCubicBezierCurveTo::SVGDrawElementCubicBezierCurveTo(
    const MoxPointT<MoxLength>& control1, const MoxPointT<MoxLength>& control2,
    const MoxPointT<MoxLength>& target)
    : SVGDrawElement('C'), point1(control1), point2(control2), point(target) {}

std::uint32_t SVGDrawElementCubicBezierCurveTo::getTypeID() const { return typeId; }

bool SVGDrawElementCubicBezierCurveTo::isA(std::uint32_t id) const {
    return id == typeId || SVGDrawElement::isA(id);
}

const char* SVGDrawElementCubicBezierCurveTo::getTypeName() const {
    return "SVGDrawElementCubicBezierCurveTo";
}

MoxPointT<MoxLength> SVGDrawElementCubicBezierCurveTo::getPoint() const { return point; }

void SVGDrawElementCubicBezierCurveTo::setPoint1(const MoxPointT<MoxLength>& newPoint) {
    point1 = newPoint;
}

MoxPointT<MoxLength> SVGDrawElementCubicBezierCurveTo::getPoint1() const { return point1; }

void SVGDrawElementCubicBezierCurveTo::setPoint2(const MoxPointT<MoxLength>& newPoint) {
    point2 = newPoint;
}

MoxPointT<MoxLength> SVGDrawElementCubicBezierCurveTo::getPoint2() const { return point2; }

void SVGDrawElementCubicBezierCurveTo::makeRelative(const MoxPointT<MoxLength>& origin) {
    drawName = DRAWELEMENT_CUBIC_RELATIVE;
    letter = 'c';
    makeRelativeTo(point1, origin);
    makeRelativeTo(point2, origin);
    makeRelativeTo(point, origin);
}

const char* SVGDrawElementCubicBezierCurveTo::toString() { return makeText(); }

char* SVGDrawElementCubicBezierCurveTo::writeText(char* out) const {
    *out = letter;
    out = writeRulePoint(point1, out + 1);
    *out = ' ';
    out = writeRulePoint(point2, out + 1);
    *out = ' ';
    return writeRulePoint(point, out + 1);
}

SVGDrawElementQuadraticBezierCurveTo::SVGDrawElementQuadraticBezierCurveTo(
    const MoxPointT<MoxLength>& control, const MoxPointT<MoxLength>& target)
    : SVGDrawElement('Q'), point1(control), point2(target) {}

std::uint32_t SVGDrawElementQuadraticBezierCurveTo::getTypeID() const { return typeId; }

bool SVGDrawElementQuadraticBezierCurveTo::isA(std::uint32_t id) const {
    return id == typeId || SVGDrawElement::isA(id);
}

const char* SVGDrawElementQuadraticBezierCurveTo::getTypeName() const {
    return "SVGDrawElementQuadraticBezierCurveTo";
}

void SVGDrawElementQuadraticBezierCurveTo::setPoint2(const MoxPointT<MoxLength>& newPoint) {
    point1 = newPoint;
}

MoxPointT<MoxLength> SVGDrawElementQuadraticBezierCurveTo::getPoint2() const { return point1; }

void SVGDrawElementQuadraticBezierCurveTo::makeRelative(const MoxPointT<MoxLength>& origin) {
    letter = 'q';
    makeRelativeTo(point1, origin);
    makeRelativeTo(point2, origin);
}

const char* SVGDrawElementQuadraticBezierCurveTo::toString() { return makeText(); }

char* SVGDrawElementQuadraticBezierCurveTo::writeText(char* out) const {
    *out = letter;
    out = writeRulePoint(point1, out + 1);
    *out = ' ';
    return writeRulePoint(point2, out + 1);
}

} // namespace DrawmereNS
