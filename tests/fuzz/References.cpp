#include "tests/fuzz/References.h"

#include "tests/fuzz/TreeReading.h"

namespace DrawmereTest {
namespace {

constexpr std::string_view urlStart = "url(#";

} // namespace

References::References(const XmlReading& reading, bool isSmallDevice) {
    int definitions = 0; // how many are open
    for (const XmlEvent& event : reading.events) {
        if (event.kind == XmlEvent::START) {
            readElement(event, isSmallDevice && definitions > 0);
        }
        if (event.name == "defs") {
            definitions += event.kind == XmlEvent::START ? 1 : -1;
        }
    }
}

void References::readElement(const XmlEvent& event, bool isLeftAlone) {
    // An image lies in a file, whose name may begin in any way.
    const bool isOutside = event.name == "image" || (event.name == "use" && isLeftAlone);
    for (const auto& [name, value] : event.attributes) {
        if (name == "id") {
            ids.insert(value);
        } else if (value.starts_with(urlStart)) {
            references.insert(value.substr(urlStart.size(), value.size() - urlStart.size() - 1));
        } else if (name == "xlink:href" && value.starts_with('#') && !isOutside) {
            references.insert(value.substr(1));
        }
    }
}

std::string References::findFault(const std::vector<UnicodeString>& words,
                                  const std::vector<UnicodeString>& lost) const {
    std::set<std::string> foreign;
    for (const auto* texts : {&words, &lost}) {
        for (const UnicodeString& text : *texts) {
            const std::string word = toXmlText(text);
            foreign.insert(word);
            foreign.insert(word.substr(word.starts_with('#') ? 1 : 0));
        }
    }
    for (const std::string& reference : references) {
        if (!reference.empty() && !ids.contains(reference) && !foreign.contains(reference)) {
            return "nothing has the id " + reference;
        }
    }
    return {};
}

} // namespace DrawmereTest
