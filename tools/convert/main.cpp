// Converts every page of a document: drawmere-convert FILE OUT.svg

#include "tools/convert/DocumentConverter.h"

#include <cstdio>
#include <cstdlib>

namespace {

using namespace DrawmereConvert; // NOLINT(google-build-using-namespace): its own program
using DrawmereNS::SVGConfig;
using DrawmereNS::SVGPageUri;

bool convertPage(DocumentConverter& converter, int page, const PageTargets& targets,
                 Drawmere& drawmere) {
    try {
        converter.loadPage(page);
        drawmere.initRootSvg(UnicodeString());
        PagePlace place;
        place.number = page + 1;
        const PageReport report = converter.drawPage(place, targets, drawmere);
        drawmere.finishRootSvg();
        for (const std::string& message : report.messages) {
            std::fprintf(stderr, "page %d: %s\n", page + 1, message.c_str());
        }
        return report.isComplete;
    } catch (const std::exception& error) {
        std::fprintf(stderr, "page %d: %s\n", page + 1, error.what());
        return false;
    }
}

int convert(const char* input, const char* output) {
    ConvertOptions options;
    const char* mode = std::getenv("DRAWMERE_TEXT");
    options.textMode = !mode || mode[0] == 'o' ? TEXTMODE_OUTLINES
                       : mode[0] == 'f'        ? TEXTMODE_FONTS
                                               : TEXTMODE_PLAIN;
    DocumentConverter converter(options);
    converter.open(input, "");
    SVGConfig config;
    config.streamOutput = false;
    config.saveOption = u"decimals=3";
    config.keepPageNumber = true;
    config.svgOutputUri = UnicodeString::fromUTF8(output);
    SVGPageUri uri(UnicodeString::fromUTF8(output));
    Drawmere drawmere(&config, &uri);
    PageTargets targets;
    for (int page = 0; page < converter.getPageCount(); ++page) {
        targets.files.push_back(u"p" + UnicodeString::fromUTF8(std::to_string(page + 1)) + u".svg");
    }
    converter.findDestinations(targets);
    bool isComplete = true;
    for (int page = 0; page < converter.getPageCount(); ++page) {
        isComplete = convertPage(converter, page, targets, drawmere) && isComplete;
    }
    drawmere.finish();
    return isComplete ? 0 : 1;
}

} // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::fprintf(stderr, "drawmere-convert FILE OUT.svg\n");
        return 2;
    }
    try {
        return convert(argv[1], argv[2]);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "%s: %s\n", argv[1], error.what());
        return 3;
    }
}
