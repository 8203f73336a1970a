#include "tests/convert/DrawnPage.h"

#include "Drawmere.h"
#include "tests/support/TempDir.h"
#include "tools/convert/DocumentConverter.h"

#include <algorithm>
#include <iterator>
#include <regex>
#include <sstream>

namespace DrawmereTest {
namespace {

using DrawmereConvert::ConvertOptions;
using DrawmereConvert::DocumentConverter;
using DrawmereConvert::PagePlace;
using DrawmereConvert::PageTargets;
using DrawmereNS::Drawmere;
using DrawmereNS::SVGConfig;
using DrawmereNS::SVGPageUri;

std::string makeStream(const std::string& entries, const std::string& bytes) {
    return "<<" + entries + "/Length " + std::to_string(bytes.size()) + ">>stream\n" + bytes +
           "\nendstream";
}

std::vector<std::string> listObjects(const PageSource& source) {
    std::vector<std::string> objects = {
        "<</Type/Catalog/Pages 2 0 R>>",
        "<</Type/Pages/Count 1/Kids[3 0 R]>>",
        "<</Type/Page/Parent 2 0 R/MediaBox[0 0 200 100]/Contents 4 0 R/Resources<<" +
            source.resources + ">>>>",
        makeStream("", source.content),
    };
    for (const auto& [entries, bytes] : source.objects) {
        objects.push_back(bytes.empty() ? "<<" + entries + ">>" : makeStream(entries, bytes));
    }
    return objects;
}

std::string writePdf(const PageSource& source) {
    std::string file = "%PDF-1.4\n";
    std::string table;
    const std::vector<std::string> objects = listObjects(source);
    for (std::size_t i = 0; i < objects.size(); ++i) {
        const std::string place = std::to_string(file.size());
        table += std::string(10 - place.size(), '0') + place + " 00000 n \n";
        file += std::to_string(i + 1) + " 0 obj\n" + objects[i] + "\nendobj\n";
    }
    const std::string count = std::to_string(objects.size() + 1);
    return file + "xref\n0 " + count + "\n0000000000 65535 f \n" + table +
           "trailer\n<</Root 1 0 R/Size " + count + ">>\nstartxref\n" +
           std::to_string(file.size()) + "\n%%EOF\n";
}

} // namespace

std::string makeNobodysFont(int width) {
    std::string widths;
    for (int code = ' '; code < 127; ++code) {
        widths += std::to_string(width) + " ";
    }
    return "/Font<</F<</Type/Font/Subtype/TrueType/BaseFont/Nobodys/Encoding/WinAnsiEncoding"
           "/FirstChar 32/LastChar 126/Widths[" +
           widths +
           "]/FontDescriptor<</Type/FontDescriptor/FontName/Nobodys/Flags 32/StemV 80>>>>>>";
}

DrawmereConvert::ConvertOptions withText(DrawmereConvert::TEXTMODE mode) {
    DrawmereConvert::ConvertOptions options;
    options.textMode = mode;
    return options;
}

DrawnPage::DrawnPage(const PageSource& source, const ConvertOptions& options,
                     SVGConfig::SVGTYPE profile) {
    const TempDir directory;
    directory.write("page.pdf", writePdf(source));
    draw(directory.path("page.pdf"), 0, options, profile);
}

DrawnPage::DrawnPage(const std::string& path, int page, const ConvertOptions& options) {
    draw(path, page, options, SVGConfig::SVGTYPE_FULL);
}

void DrawnPage::draw(const std::string& path, int page, const ConvertOptions& options,
                     SVGConfig::SVGTYPE profile) {
    DocumentConverter converter(options);
    converter.open(path, "");
    SVGConfig config;
    config.saveOption = u"decimals=3";
    config.svgType = profile;
    SVGPageUri uri(u"");
    std::ostringstream stream;
    Drawmere drawmere(&config, &uri);
    converter.loadPage(page);
    drawmere.initRootSvg(&stream);
    report = converter.drawPage(PagePlace(), PageTargets(), drawmere);
    drawmere.finishRootSvg();
    drawmere.finish();
    svg = stream.str();
}

int DrawnPage::count(const std::string& name) const {
    const std::regex tag("<" + name + "[ />]");
    return static_cast<int>(
        std::distance(std::sregex_iterator(svg.begin(), svg.end(), tag), std::sregex_iterator()));
}

std::string DrawnPage::attribute(const std::string& element, const std::string& name) const {
    std::smatch found;
    const std::regex tag("<" + element + "[ />][^>]*>");
    if (!std::regex_search(svg, found, tag)) {
        return "(none)";
    }
    const std::string text = found.str();
    const std::regex value("[ \\n]" + name + "=\"([^\"]*)\"");
    return std::regex_search(text, found, value) ? found[1].str() : "(none)";
}

std::vector<std::string> DrawnPage::texts() const {
    const std::regex text("<text[^>]*>([^<]+)</text>");
    std::vector<std::string> found;
    for (std::sregex_iterator match(svg.begin(), svg.end(), text); match != std::sregex_iterator();
         ++match) {
        found.push_back((*match)[1].str());
    }
    return found;
}

int DrawnPage::depth() const {
    const std::regex tag("<(/?)[A-Za-z][^>]*?(/?)>");
    int now = 0;
    int deepest = 0;
    for (std::sregex_iterator match(svg.begin(), svg.end(), tag); match != std::sregex_iterator();
         ++match) {
        const bool isEnd = (*match)[1].length() > 0;
        const bool isEmpty = (*match)[2].length() > 0;
        deepest = std::max(deepest, now + (isEnd ? 0 : 1));
        now += isEmpty ? 0 : isEnd ? -1 : 1;
    }
    return deepest;
}

std::string DrawnPage::body() const {
    const std::string anchor = "<text id=\"p1\"/></g>";
    const std::size_t place = svg.find(anchor);
    return place == std::string::npos ? svg : svg.substr(place + anchor.size());
}

int DrawnPage::countNotes(DrawmereConvert::APPROXIMATION kind) const {
    return report.approximations.at(kind);
}

} // namespace DrawmereTest
