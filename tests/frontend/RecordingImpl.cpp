#include "tests/frontend/RecordingImpl.h"

#include "foundation/common/MoxNameTable.h"
#include "tests/support/Utf8.h"

namespace DrawmereTest {

using namespace DrawmereNS;

namespace {

std::string toText(float number) { return utf8(MoxValue(number).toString()); }

std::string toText(int number) { return std::to_string(number); }

std::string toText(bool flag) { return flag ? "yes" : "no"; }

std::string toText(MoxLength length) { return toText(length.getRawValue()); }

std::string toText(const UnicodeString& text) { return "'" + utf8(text) + "'"; }

std::string toText(const MoxName& name) {
    return toText(MoxCommonNS::MoxNameTable::getSharedNameString(name));
}

std::string toText(const MoxColor& color) { return utf8(color.toString(true, false, true)); }

std::string toText(const SVGMatrix& matrix) {
    std::string text = "[";
    for (const float number : {matrix.a, matrix.b, matrix.c, matrix.d, matrix.e}) {
        text += toText(number) + ",";
    }
    return text + toText(matrix.f) + "]";
}

std::string toText(const MoxRectT<MoxLength>& rect) {
    return "[" + toText(rect.x1) + "," + toText(rect.y1) + "," + toText(rect.x2) + "," +
           toText(rect.y2) + "]";
}

template <typename Number> std::string toText(const std::vector<Number>& numbers) {
    std::string text = "[";
    for (const Number number : numbers) {
        text += (text.size() > 1 ? "," : "") + toText(number);
    }
    return text + "]";
}

std::string toText(const void* pointer) { return pointer ? "one" : "null"; }

template <typename... Arguments> std::string line(const char* name, const Arguments&... arguments) {
    std::string text = name;
    ((text += " " + toText(arguments)), ...);
    return text + "\n";
}

} // namespace

RecordingImpl::~RecordingImpl() = default;

void RecordingImpl::setInternalView(Text id, float x, float y, float width, float height) {
    told += line("setInternalView", id, x, y, width, height);
}

void RecordingImpl::setInternalLinkAnchor(Text id, float x, float y) {
    told += line("setInternalLinkAnchor", id, x, y);
}

void RecordingImpl::setErrorHandler(const DrawmereErrHandler* handler) {
    told += line("setErrorHandler", static_cast<const void*>(handler));
}

void RecordingImpl::pushState(ELEMENT_TYPE type) { told += line("pushState", int{type}); }

void RecordingImpl::popState(ELEMENT_TYPE type) { told += line("popState", int{type}); }

void RecordingImpl::setScale(float scale) { told += line("setScale", scale); }

void RecordingImpl::setCanvasSize(Length width, Length height) {
    told += line("setCanvasSize", width, height);
}

void RecordingImpl::setCanvasSize(Length width, Length height, MoxUnitType unit) {
    told += line("setCanvasSize", width, height, int{unit});
}

void RecordingImpl::startClipDef(Units units) { told += line("startClipDef", int{units}); }

void RecordingImpl::startClipRect(Units units) { told += line("startClipRect", int{units}); }

void RecordingImpl::endClipDef() { told += line("endClipDef"); }

void RecordingImpl::doClip() { told += line("doClip"); }

void RecordingImpl::drawRect(Length x, Length y, Length width, Length height, Length rx, Length ry,
                             Mode mode) {
    told += line("drawRect", x, y, width, height, rx, ry, int{mode});
}

void RecordingImpl::drawCircle(Length cx, Length cy, Length r, Mode mode) {
    told += line("drawCircle", cx, cy, r, int{mode});
}

void RecordingImpl::drawEllipse(Length cx, Length cy, Length rx, Length ry, Mode mode) {
    told += line("drawEllipse", cx, cy, rx, ry, int{mode});
}

void RecordingImpl::drawLine(Length x1, Length y1, Length x2, Length y2, Mode mode) {
    told += line("drawLine", x1, y1, x2, y2, int{mode});
}

void RecordingImpl::drawPoly(float* coordinates, int count, bool open, Mode mode) {
    const std::vector<float> list(coordinates, coordinates + count);
    told += line("drawPoly", list, open, int{mode});
}

void RecordingImpl::drawText(const Text& text, const Length& x, const Length& y, Mode mode,
                             TLStringWithGlyphInfo* glyphs, bool wholeRun, bool leftToRight) {
    const void* const info = glyphs;
    told += line("drawText(one)", text, x, y, int{mode}, info, wholeRun, leftToRight);
}

void RecordingImpl::drawText(const Text& text, const Lengths& x, const Lengths& y,
                             const std::vector<float>& rotation, Mode mode,
                             TLStringWithGlyphInfo* glyphs, bool wholeRun, bool leftToRight) {
    const void* const info = glyphs;
    told += line("drawText", text, x, y, rotation, int{mode}, info, wholeRun, leftToRight);
}

void RecordingImpl::drawImage(TLGraphicImage* image, const Length& width, const Length& height,
                              const Length& x, const Length& y) {
    told += line("drawImage", static_cast<const void*>(image), width, height, x, y);
}

void RecordingImpl::startLink(const Text& href, const MoxName& show) {
    told += line("startLink", href, show);
}

void RecordingImpl::endLink() { told += line("endLink"); }

UnicodeString RecordingImpl::startMask(Length x, Length y, Length width, Length height,
                                       Units maskUnits, Units contentUnits) {
    told += line("startMask", x, y, width, height, int{maskUnits}, int{contentUnits});
    return u"mask";
}

void RecordingImpl::endMask() { told += line("endMask"); }

UnicodeString RecordingImpl::startLinearGradient(Length x1, Length y1, Length x2, Length y2,
                                                 SVGMatrix matrix, Units units,
                                                 GRADSPERADMOD spread) {
    told += line("startLinearGradient", x1, y1, x2, y2, matrix, int{units}, int{spread});
    return u"linear";
}

UnicodeString RecordingImpl::startRadialGradient(Length cx, Length cy, Length r, Length fx,
                                                 Length fy, SVGMatrix matrix, Units units,
                                                 GRADSPERADMOD spread) {
    told += line("startRadialGradient", cx, cy, r, fx, fy, matrix, int{units}, int{spread});
    return u"radial";
}

void RecordingImpl::endGradiant() { told += line("endGradiant"); }

void RecordingImpl::setStopColor(const MoxColor& color, float offset, float opacity) {
    told += line("setStopColor", color, offset, opacity);
}

UnicodeString RecordingImpl::startPattern(const MoxRectT<Length>& area,
                                          const MoxRectT<Length>& viewArea, SVGMatrix matrix,
                                          Units patternUnits, Units contentUnits) {
    told += line("startPattern", area, viewArea, matrix, int{patternUnits}, int{contentUnits});
    return u"pattern";
}

void RecordingImpl::endPattern() { told += line("endPattern"); }

} // namespace DrawmereTest
