#include "tests/support/XmlReader.h"

#include "foundation/common/MoxXmlChars.h"

#include <algorithm>
#include <stdexcept>
#include <unicode/utf8.h>

namespace DrawmereTest {
namespace {

struct Entity {
    std::string_view name;
    char character;
};

constexpr Entity entities[] = {
    {"lt", '<'}, {"gt", '>'}, {"amp", '&'}, {"quot", '"'}, {"apos", '\''},
};

void appendCodePoint(std::string& text, UChar32 codePoint) {
    char bytes[U8_MAX_LENGTH];
    int length = 0;
    U8_APPEND_UNSAFE(bytes, length, codePoint);
    text.append(bytes, static_cast<std::size_t>(length));
}

class Reader {
public:
    Reader(std::string_view document, XmlReading& output) : input(document), reading(output) {}

    void read() {
        readDeclaration();
        skipSpace();
        if (take("<!DOCTYPE ")) {
            reading.doctype = takeUntil(">");
            skipSpace();
        }
        require(peek() == '<', "no root");
        readTag();
        while (!open.empty()) {
            peek() == '<' ? readTag() : readText();
        }
        skipSpace();
        require(position == input.size(), "something behind the root");
    }

    std::size_t getPosition() const { return position; }

private:
    void require(bool condition, const char* what) const {
        if (!condition) {
            throw std::runtime_error(what);
        }
    }

    char peek() const {
        require(position < input.size(), "the document ends too early");
        return input[position];
    }

    bool take(std::string_view text) {
        const bool found = input.substr(position, text.size()) == text;
        position += found ? text.size() : 0;
        return found;
    }

    std::string takeUntil(std::string_view end) {
        const std::size_t found = input.find(end, position);
        require(found != std::string_view::npos, "no end");
        std::string text(input.substr(position, found - position));
        position = found + end.size();
        return text;
    }

    bool skipSpace() {
        const std::size_t end =
            std::min(input.find_first_not_of(" \t\r\n", position), input.size());
        const bool skipped = end > position;
        position = end;
        return skipped;
    }

    void readDeclaration() {
        require(take("<?xml version=\"1.0\" encoding=\""), "no declaration");
        reading.encoding = takeUntil("\"");
        require(take("?>"), "the declaration does not end");
    }

    UChar32 readCodePoint() {
        const auto lead = static_cast<unsigned char>(peek());
        const std::size_t length = lead < 0x80 ? 1 : lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
        const std::string_view bytes = input.substr(position, length);
        UChar32 codePoint = length == 1 ? lead : lead & (0x7F >> length);
        for (const char byte : bytes.substr(1)) {
            codePoint = codePoint << 6 | (byte & 0x3F);
        }
        require(MoxCommonNS::isXmlChar(codePoint), "a forbidden character");
        std::string same;
        appendCodePoint(same, codePoint);
        require(same == bytes, "the bytes are no UTF-8");
        position += length;
        return codePoint;
    }

    std::string readName() {
        const std::size_t start = position;
        require(MoxCommonNS::isXmlNameStart(readCodePoint()), "a name starts wrongly");
        std::size_t end = position;
        while (position < input.size() && MoxCommonNS::isXmlNameChar(readCodePoint())) {
            end = position;
        }
        position = end;
        return std::string(input.substr(start, end - start));
    }

    UChar32 readReference() {
        const std::string name = takeUntil(";");
        if (name.starts_with('#')) {
            const bool isHex = name.size() > 1 && name[1] == 'x';
            const UChar32 codePoint =
                std::stoi(name.substr(isHex ? 2 : 1), nullptr, isHex ? 16 : 10);
            require(MoxCommonNS::isXmlChar(codePoint), "a reference to a forbidden character");
            return codePoint;
        }
        for (const Entity& entity : entities) {
            if (entity.name == name) {
                return entity.character;
            }
        }
        throw std::runtime_error("an unknown entity");
    }

    std::string readAttributeValue() {
        require(take("\""), "no quotation mark");
        std::string value;
        while (!take("\"")) {
            require(peek() != '<', "'<' in an attribute");
            if (take("&")) {
                appendCodePoint(value, readReference());
                continue;
            }
            const UChar32 codePoint = readCodePoint();
            const bool isSpace = codePoint == '\t' || codePoint == '\n' || codePoint == '\r';
            appendCodePoint(value, isSpace ? ' ' : codePoint);
        }
        return value;
    }

    void readTag() {
        take("<");
        if (take("/")) {
            readEndTag();
            return;
        }
        XmlEvent event{XmlEvent::START, readName(), {}, {}};
        while (skipSpace() && peek() != '>' && peek() != '/') {
            readAttribute(event);
        }
        open.push_back(event.name);
        reading.events.push_back(std::move(event));
        if (take("/>")) {
            close();
        } else {
            require(take(">"), "a start tag does not end");
        }
    }

    void readAttribute(XmlEvent& event) {
        std::string name = readName();
        require(event.attribute(name) == "(none)", "an attribute is there twice");
        require(take("="), "no '='");
        event.attributes.emplace_back(std::move(name), readAttributeValue());
    }

    void readEndTag() {
        require(readName() == open.back(), "an end tag has another name");
        skipSpace();
        require(take(">"), "an end tag does not end");
        close();
    }

    void close() {
        reading.events.push_back({XmlEvent::END, open.back(), {}, {}});
        open.pop_back();
    }

    void readText() {
        std::string text;
        while (peek() != '<') {
            require(input.substr(position, 3) != "]]>", "']]>' in a text");
            if (take("&")) {
                appendCodePoint(text, readReference());
            } else if (take("\r\n") || take("\r")) {
                text += '\n';
            } else {
                appendCodePoint(text, readCodePoint());
            }
        }
        reading.events.push_back({XmlEvent::TEXT, {}, {}, text});
    }

    std::string_view input;
    XmlReading& reading;
    std::size_t position = 0;
    std::vector<std::string> open;
};

} // namespace

std::string XmlEvent::attribute(std::string_view wanted) const {
    for (const auto& [key, value] : attributes) {
        if (key == wanted) {
            return value;
        }
    }
    return "(none)";
}

std::string XmlReading::text() const {
    std::string all;
    for (const XmlEvent& event : events) {
        all += event.text;
    }
    return all;
}

XmlEvent XmlReading::element(std::string_view wanted) const {
    for (const XmlEvent& event : events) {
        if (event.kind == XmlEvent::START && event.name == wanted) {
            return event;
        }
    }
    return {};
}

XmlReading readXml(std::string_view document) {
    XmlReading reading;
    Reader reader(document, reading);
    try {
        reader.read();
    } catch (const std::exception& failure) {
        reading.error = failure.what() + std::string(" at byte ");
        reading.error += std::to_string(reader.getPosition());
    }
    return reading;
}

} // namespace DrawmereTest
