#include "tests/support/SvgPage.h"

namespace DrawmereTest {

using DrawmereNS::SVGConfig;

namespace {

constexpr char rootStart[] = "<svg";
constexpr char rootEnd[] = "</svg>";
constexpr float side = 100.0F;

} // namespace

SvgPage::SvgPage(SVGConfig::SVGTYPE profile) {
    config.svgType = profile;
    drawmere.initRootSvg(&stream);
    drawmere.setCanvasSize(pt(side), pt(side));
}

const std::string& SvgPage::document() {
    if (!finished) {
        finished = true;
        drawmere.finishRootSvg();
        drawmere.finish();
        text = stream.str();
    }
    return text;
}

std::pair<std::size_t, std::size_t> SvgPage::findRootTag() {
    const std::size_t begin = document().find(rootStart);
    if (begin == std::string::npos) {
        return {text.size(), text.size()};
    }
    return {begin, text.find('>', begin) + 1};
}

std::string SvgPage::rootTag() {
    const auto [begin, end] = findRootTag();
    return text.substr(begin, end - begin);
}

std::string SvgPage::body() {
    const std::size_t begin = findRootTag().second;
    const std::size_t end = text.rfind(rootEnd);
    // A root without content is closed by its start tag.
    return end == std::string::npos ? std::string() : splitTags(text.substr(begin, end - begin));
}

std::string splitTags(const std::string& xml) {
    std::string lines;
    for (std::size_t i = 0; i < xml.size(); ++i) {
        lines += xml[i];
        if (xml[i] == '>' && i + 1 < xml.size() && xml[i + 1] == '<') {
            lines += '\n';
        }
    }
    return lines;
}

} // namespace DrawmereTest
