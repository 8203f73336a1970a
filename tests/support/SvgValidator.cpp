#include "tests/support/SvgValidator.h"

#include <algorithm>
#include <cstring>
#include <regex>
#include <stdexcept>

#include <libxml/parser.h>
#include <libxml/valid.h>

namespace DrawmereTest {

using DrawmereNS::SVGConfig;

namespace {

using Faults = std::vector<std::string>;

const char* findPublicName(SVGConfig::SVGTYPE profile) {
    switch (profile) {
    case SVGConfig::SVGTYPE_BASIC:
        return "-//W3C//DTD SVG 1.1 Basic//EN";
    case SVGConfig::SVGTYPE_TINY:
        return "-//W3C//DTD SVG 1.1 Tiny//EN";
    default:
        return "-//W3C//DTD SVG 1.1//EN";
    }
}

struct DocumentDeleter {
    void operator()(xmlDoc* document) const { xmlFreeDoc(document); }
};

struct ContextDeleter {
    void operator()(xmlValidCtxt* context) const { xmlFreeValidCtxt(context); }
};

const xmlChar* toXml(const char* text) { return reinterpret_cast<const xmlChar*>(text); }

/// Keeps what libxml2 says instead of printing it.
class Listener {
public:
    explicit Listener(Faults& heard) { xmlSetStructuredErrorFunc(&heard, hear); }

    Listener(const Listener&) = delete;
    Listener& operator=(const Listener&) = delete;

    ~Listener() { xmlSetStructuredErrorFunc(nullptr, nullptr); }

private:
    static void hear(void* heard, xmlError* error) {
        std::string text = error->message ? error->message : "?";
        while (!text.empty() && text.back() == '\n') {
            text.pop_back();
        }
        static_cast<Faults*>(heard)->push_back(text);
    }
};

} // namespace

void SvgValidator::DtdDeleter::operator()(_xmlDtd* unused) const { xmlFreeDtd(unused); }

bool SvgValidator::KnownFault::concerns(SVGConfig::SVGTYPE type) const {
    return std::ranges::find(profiles, type) != profiles.end();
}

SvgValidator::SvgValidator(SVGConfig::SVGTYPE outputProfile) : profile(outputProfile) {
    xmlSetExternalEntityLoader(xmlNoNetExternalEntityLoader);
    dtd.reset(xmlParseDTD(toXml(findPublicName(profile)), nullptr));
    if (!dtd) {
        throw std::runtime_error("no document type for the profile");
    }
}

Faults SvgValidator::listFaults(const std::string& document) const {
    Faults faults;
    const Listener listener(faults);
    const std::unique_ptr<xmlDoc, DocumentDeleter> tree(
        xmlReadMemory(document.data(), static_cast<int>(document.size()), nullptr, nullptr,
                      XML_PARSE_NONET | XML_PARSE_HUGE));
    const std::unique_ptr<xmlValidCtxt, ContextDeleter> context(xmlNewValidCtxt());
    const bool isValid = tree && xmlValidateDtd(context.get(), tree.get(), dtd.get()) == 1;
    if (!isValid && faults.empty()) {
        faults.emplace_back("invalid");
    }
    return faults;
}

const SvgValidator::KnownFault* SvgValidator::findKnown(const std::string& fault) const {
    for (const KnownFault& known : listKnownFaults()) {
        if (known.concerns(profile) && fault.starts_with(known.start) &&
            std::regex_match(fault.substr(std::strlen(known.start)), std::regex(known.rest))) {
            return &known;
        }
    }
    return nullptr;
}

const std::vector<SvgValidator::KnownFault>& SvgValidator::listKnownFaults() {
    using Profiles = std::vector<SVGConfig::SVGTYPE>;
    static const Profiles withViews = {SVGConfig::SVGTYPE_FULL, SVGConfig::SVGTYPE_BASIC,
                                       SVGConfig::SVGTYPE_WISP};
    static const Profiles withClips = {SVGConfig::SVGTYPE_FULL, SVGConfig::SVGTYPE_BASIC,
                                       SVGConfig::SVGTYPE_WISP, SVGConfig::SVGTYPE_PLAZMIC};
    static const Profiles everyProfile = {SVGConfig::SVGTYPE_FULL, SVGConfig::SVGTYPE_BASIC,
                                          SVGConfig::SVGTYPE_TINY, SVGConfig::SVGTYPE_WISP,
                                          SVGConfig::SVGTYPE_PLAZMIC};
    static const std::vector<KnownFault> faults = {
        {{SVGConfig::SVGTYPE_TINY},
         "No declaration for attribute font-stretch of element svg",
         "",
         "every root states the font defaults, though Tiny has no word for one of them"},
        {{SVGConfig::SVGTYPE_TINY},
         "No declaration for attribute vert-adv-y of element glyph",
         "",
         "a glyph for lines that run down says so, though Tiny has no word for it"},
        {{SVGConfig::SVGTYPE_TINY},
         "No declaration for attribute orientation of element glyph",
         "",
         "the same"},
        {{SVGConfig::SVGTYPE_TINY},
         "Element g content does not follow the DTD, expecting (desc | title | metadata | animate "
         "| set | animateMotion | animateColor | animateTransform | g | defs | use | switch | "
         "image | path | rect | circle | line | ellipse | polyline | polygon | text | a | font | "
         "font-face | foreignObject)*, got ",
         "\\(svg ?\\)",
         "an embedded image is used in a frame; the small-device mode takes the frame away"},
        {everyProfile,
         "Element font-face content does not follow the DTD, expecting ((font-face-src , (desc | "
         "title | metadata)*) | ((desc | title | metadata)+ , font-face-src , (desc | title | "
         "metadata)*)), got ",
         "", "an embedded font is its own source"},
        {withClips,
         "Element clipPath content does not follow the DTD, expecting (desc | title | metadata | "
         "animate | set | animateMotion | animateColor | animateTransform | use | path | rect | "
         "circle | line | ellipse | polyline | polygon | text)*, got (",
         "((path|rect|circle|line|ellipse|polyline|polygon|text|g) ?)*\\)",
         "what is pushed in a clip, and a clip in a clip, is a group there"},
        {withViews, "No declaration for attribute ", "[a-z-]+ of element view",
         "a view is page content, and states what differs from its group"},
        {{SVGConfig::SVGTYPE_TINY},
         "No declaration for attribute direction of element text",
         "",
         "text that runs from right to left says so, though Tiny has no word for it"},
    };
    return faults;
}

} // namespace DrawmereTest
