// Options as callers and their users write them: read as a plain reader of lists would, and never
// more than the sum of their words.
#include "SVGConfig.h"
#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxElement.h"
#include "foundation/common/MoxNameTable.h"
#include "tests/fuzz/Require.h"
#include "tests/support/Choices.h"
#include "tests/support/Utf8.h"
#include "tests/support/XmlReader.h"

#include <sstream>

using namespace DrawmereTest;
using namespace DrawmereNS;
using namespace MoxCommonNS;

namespace {

UnicodeString makeText(Choices& choices) {
    constexpr const char16_t* words[] = {
        u"maxsize",   u"errorsvg", u"=",   u",",   u" ",    u"12", u"indent",     u"decimals=",
        u"embed-all", u"copy",     u"jpg", u"png", u"auto", u"-1", u"99999999999"};
    UnicodeString text;
    for (unsigned count = choices.below(9); count > 0; --count) {
        text += choices.flag() ? UnicodeString(choices.pick(words))
                               : UnicodeString::fromUTF8(choices.takeBytes(choices.below(6)));
    }
    return text;
}

/// Returns: what stands between the commas.
std::vector<UnicodeString> split(const UnicodeString& list) {
    std::vector<UnicodeString> parts(1);
    for (std::int32_t i = 0; i < list.length(); ++i) {
        if (list[i] == u',') {
            parts.emplace_back();
        } else {
            parts.back().append(list[i]);
        }
    }
    return parts;
}

void checkValues(Choices& choices) {
    const SVGConfig config;
    const UnicodeString options = makeText(choices);
    constexpr const char16_t* keys[] = {u"maxsize", u"errorsvg", u"", u"a", u"decimals"};
    const UnicodeString key = choices.pick(keys);
    UnicodeString expected;
    for (const UnicodeString& option : split(options)) {
        if (!options.isEmpty() && option.startsWith(key + u"=")) {
            expected = UnicodeString(option, key.length() + 1);
            break;
        }
    }
    const UnicodeString found = config.findValue(options, key);
    require(found == expected, utf8(key) + " in " + utf8(options) + " is " + utf8(found));
}

void checkFonts(Choices& choices) {
    SVGConfig config;
    const UnicodeString list = makeText(choices);
    config.setEmbedFonts(list);
    for (const UnicodeString& name : config.embedFontNames) {
        UnicodeString trimmed = name;
        require(!name.isEmpty() && name == trimmed.trim(), "'" + utf8(name) + "' is a name");
        require(name.indexOf(u',') < 0 && list.indexOf(name) >= 0, utf8(name) + " is new");
        require(config.isEmbedFont(name), utf8(name) + " is not embedded");
    }
    const std::set<UnicodeString> names = config.embedFontNames;
    config.setEmbedFonts(list);
    require(config.embedFontNames == names, utf8(list) + " says something else again");
}

void checkWords(Choices& choices) {
    SVGConfig config;
    config.svgType = static_cast<SVGConfig::SVGTYPE>(choices.below(6));
    config.maxLength = static_cast<float>(choices.below(0x10000)) - 100.0F;
    config.wispMode = choices.flag();
    const MoxName word(makeText(choices));
    config.setImageConversion(word);
    config.setImageProcessingType(word);
    require(config.imageConversion >= 0 && config.imageConversion <= 4 &&
                config.imageProcessing >= 0 && config.imageProcessing <= 3,
            "a word has a number that is none");
    require(!config.isEmbedImage(nullptr) || !config.isCopyImage(nullptr), "embedded and copied");
    config.adjustConfig();
    const float length = config.maxLength;
    const MoxName conversion = config.imageConversionName;
    config.adjustConfig();
    require(length > 0.0F && length == config.maxLength, "a limit that is none");
    require(conversion == config.imageConversionName, "other words when adjusted again");
}

void checkSizeLimit(Choices& choices) {
    SVGConfig config;
    config.wispMode = choices.flag();
    config.wispOptions = makeText(choices);
    const bool hasNone =
        !config.wispMode || config.findValue(config.wispOptions, u"maxsize") == u"";
    require(!hasNone || config.getMaxFileSize() == 0, "a limit that nobody set");
    config.checkMaxFileSize(u"", 1);
    require(!config.hasError() || config.getMaxFileSize() > 0, "an error without a limit");
}

void checkImageNames(Choices& choices) {
    SVGConfig config;
    std::map<UnicodeString, UnicodeString> expected;
    for (unsigned count = choices.below(6); count > 0; --count) {
        const UnicodeString source = makeText(choices);
        const UnicodeString key = makeText(choices);
        const UnicodeString name = makeText(choices);
        config.enterImageName(source, key, name);
        require(config.isEnteredImagename(name), utf8(name) + " is not entered");
        if (!source.isEmpty() && !key.isEmpty()) {
            expected.emplace(key, name);
        }
    }
    for (const auto& [key, name] : expected) {
        require(config.getEnteredImageName(key) == name, utf8(key) + " has another name");
    }
    config.initImageName();
    require(config.enteredImageNames.empty() && config.imageNameMap.empty(), "names stay");
}

// Whatever the options, the document is one, and with indentation it says the same.
void checkSaving(Choices& choices) {
    MoxDocument document;
    const MoxPtr<MoxElement> root = document.createElement(MoxName(u"root"));
    document.appendChild(root.get());
    root->setAttribute(MoxName(u"x"), MoxValue(static_cast<float>(choices.below(999)) / 7.0F));
    const UnicodeString content = makeText(choices);
    const MoxPtr<MoxElement> child = document.createElement(MoxName(u"child"));
    root->appendChild(child.get());
    child->appendChildText(content);
    std::ostringstream stream;
    const UnicodeString options = makeText(choices);
    document.save(u"", u"", stream, nullptr, options, u"");
    const XmlReading reading = readXml(stream.str());
    require(reading.error.empty(), utf8(options) + ": " + reading.error);
    require(reading.element("root").attribute("x") != "(none)", "an attribute is lost");
}

void checkEncoding(Choices& choices) {
    constexpr const char16_t* names[] = {u"UTF-16", u"ISO-8859-1", u"ibm037", u"Shift_JIS", u"hz"};
    MoxDocument document;
    document.appendChild(document.createElement(MoxName(u"root")).get());
    document.getDocumentElement()->appendChildText(makeText(choices));
    std::ostringstream stream;
    const UnicodeString name =
        choices.flag() ? UnicodeString(choices.pick(names)) : makeText(choices);
    document.save(name, u"", stream, nullptr, u"", u"");
    require(stream.good() && !stream.str().empty(), utf8(name) + " can't be written");
}

constexpr void (*checks[])(Choices& choices) = {
    checkValues,     checkFonts,  checkWords,    checkSizeLimit,
    checkImageNames, checkSaving, checkEncoding,
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Choices choices(inputOf(data, size));
    while (!choices.isUsedUp()) {
        choices.pick(checks)(choices);
    }
    return 0;
}
