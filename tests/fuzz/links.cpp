// Links over sets of pages: they lead where a plain model of the rules says.
#include "Drawmere.h"
#include "foundation/common/MoxNamedValueMap.h"
#include "tests/fuzz/LinkModel.h"
#include "tests/fuzz/Require.h"
#include "tests/support/Choices.h"
#include "tests/support/SvgPage.h"
#include "tests/support/TempDir.h"
#include "tests/support/XmlReader.h"

#include <filesystem>

using namespace DrawmereTest;
using namespace DrawmereNS;

namespace {

constexpr int mostItems = 60;

constexpr const char* names[] = {"a", "b", "c", "d", "", "Mox-SVG-page-2", "e f", "p1", "#a"};
constexpr const char* uris[] = {"http://www.example.com/#a", "Mox-SVG-page-1", "other.svg", ""};

LinkItem makeItem(Choices& choices, int& depth, int& page) {
    const auto kind = static_cast<LinkItem::Kind>(choices.below(6));
    if (kind == LinkItem::END_LINK && depth == 0) {
        return {LinkItem::ANCHOR, choices.pick(names)};
    }
    depth += kind == LinkItem::LINK ? 1 : kind == LinkItem::END_LINK ? -1 : 0;
    if (kind == LinkItem::PAGE) {
        page = choices.flag() ? page + 1 : static_cast<int>(choices.below(5));
        return {kind, {}, page};
    }
    if (kind == LinkItem::LINK) {
        return {kind, choices.flag() ? choices.pick(uris) : "#" + std::string(choices.pick(names))};
    }
    const bool hasName = kind == LinkItem::ANCHOR || kind == LinkItem::VIEW;
    return {kind, hasName ? choices.pick(names) : ""};
}

LinkItems makeDocument(Choices& choices, int& page) {
    LinkItems items;
    int depth = 0;
    for (unsigned count = choices.below(mostItems); count > 0; --count) {
        items.push_back(makeItem(choices, depth, page));
    }
    for (; depth > 0; --depth) {
        items.push_back({LinkItem::END_LINK, {}});
    }
    return items;
}

void draw(Drawmere& drawmere, const LinkItem& item) {
    const UnicodeString text = UnicodeString::fromUTF8(item.text);
    switch (item.kind) {
    case LinkItem::PAGE:
        drawmere.startPage(item.page, {});
        break;
    case LinkItem::END_PAGE:
        drawmere.endPage();
        break;
    case LinkItem::ANCHOR:
        drawmere.setInternalLinkAnchor(text, 1, 2);
        break;
    case LinkItem::VIEW:
        drawmere.setInternalView(text, 1, 2, 3, 4);
        break;
    case LinkItem::LINK:
        drawmere.startLink(text, MoxName());
        drawmere.drawCircle(pt(1), pt(1), pt(1), PAINTMODE_FILL);
        break;
    case LinkItem::END_LINK:
        drawmere.endLink();
    }
}

/// Returns: the anchors, views and links of a document.
LinkItems readItems(const std::string& document) {
    const XmlReading reading = readXml(document);
    require(reading.error.empty(), reading.error);
    LinkItems items;
    for (const XmlEvent& event : reading.events) {
        const bool isStart = event.kind == XmlEvent::START;
        if (event.name == "a") {
            items.push_back({isStart ? LinkItem::LINK : LinkItem::END_LINK,
                             isStart ? event.attribute("xlink:href") : ""});
        } else if (isStart && (event.name == "text" || event.name == "view")) {
            const bool isView = event.name == "view";
            items.push_back({isView ? LinkItem::VIEW : LinkItem::ANCHOR, event.attribute("id")});
        }
    }
    return items;
}

std::map<std::string, LinkItems> readFiles(const TempDir& directory, const std::string& stream) {
    std::map<std::string, LinkItems> files;
    for (const auto& file : std::filesystem::directory_iterator(directory.path())) {
        const std::string name = file.path().filename().string();
        files[name] = readItems(directory.read(name));
    }
    if (!stream.empty()) {
        files["stream"] = readItems(stream);
    }
    return files;
}

std::string describe(const std::map<std::string, LinkItems>& files) {
    std::string text;
    for (const auto& [name, items] : files) {
        text += "\n" + name + ":";
        for (const LinkItem& item : items) {
            text += " " + std::to_string(item.kind) + "'" + item.text + "'";
        }
    }
    return text;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Choices choices(inputOf(data, size));
    const LinkOptions options = {choices.below(4) == 3, choices.below(4) == 3, choices.flag()};
    const TempDir directory;
    SVGConfig config;
    config.streamOutput = options.toStream;
    config.singleFile = options.singleFile;
    config.keepPageNumber = options.keepPageNumber;
    SVGPageUri uri(directory.uri("out.svg"));
    std::ostringstream stream;
    Drawmere drawmere(&config, &uri);
    LinkModel model(options);
    int page = 0;
    while (!choices.isUsedUp()) {
        if (options.toStream) {
            drawmere.initRootSvg(&stream);
        } else {
            drawmere.initRootSvg(uri.getText());
        }
        const LinkItems items = makeDocument(choices, page);
        for (const LinkItem& item : items) {
            draw(drawmere, item);
        }
        drawmere.finishRootSvg();
        model.addDocument(items);
    }
    drawmere.finish();
    const auto expected = model.finish();
    const auto found = readFiles(directory, stream.str());
    require(found == expected, describe(found) + "\ninstead of" + describe(expected));
    return 0;
}
