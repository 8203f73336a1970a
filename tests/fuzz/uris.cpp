// Places and file names: what is taken apart fits together again, and no two pages share a file.
#include "Drawmere.h"
#include "foundation/common/MoxLang.h"
#include "foundation/common/MoxUri.h"
#include "foundation/common/MoxUtil.h"
#include "tests/fuzz/Require.h"
#include "tests/support/Choices.h"
#include "tests/support/Utf8.h"

#include <cctype>
#include <sstream>

using namespace DrawmereTest;
using namespace DrawmereNS;
using namespace MoxCommonNS;

namespace {

UnicodeString makeText(Choices& choices) {
    constexpr const char16_t* words[] = {
        u"",      u"/",         u"//",    u"..",      u".",      u"a",      u"b.svg",
        u"file:", u"http://h/", u"file:", u"file://", u"%2f",    u"%c3%a9", u"%zz",
        u"?q",    u"#f",        u"a/b/",  u"C:",      u"\u00e9", u"://",    u"[::1]"};
    UnicodeString text;
    for (unsigned count = choices.below(6); count > 0; --count) {
        text += choices.flag() ? UnicodeString(choices.pick(words))
                               : UnicodeString::fromUTF8(choices.takeBytes(choices.below(8)));
    }
    return text;
}

MoxUri makeUri(const UnicodeString& text) { return {text, URISTRTYPE_PATH_OR_URI, nullptr}; }

UnicodeString resolve(const MoxUri& base, const UnicodeString& relative) {
    return MoxUri(base, relative, URISTRTYPE_PATH_OR_URI, nullptr).getText();
}

void requireSame(const UnicodeString& one, const UnicodeString& other, const char* what) {
    require(one == other, std::string(what) + ": '" + utf8(one) + "' and '" + utf8(other) + "'");
}

// A local path, not a URI with a scheme.
bool isPlain(const MoxUri& uri) {
    const std::string text = utf8(uri.getText());
    const std::size_t end = text.find_first_not_of("abcdefghijklmnopqrstuvwxyz"
                                                   "ABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789+.-");
    const bool isScheme = end != 0 && end < text.size() && text[end] == ':' &&
                          std::isalpha(static_cast<unsigned char>(text[0])) != 0;
    require(isScheme || (uri.isFile() && uri.getLocalPath() == uri.getText()), text);
    return !isScheme;
}

void checkParts(Choices& choices) {
    const UnicodeString text = makeText(choices);
    const MoxUri uri = makeUri(text);
    requireSame(uri.getText(), text, "the text");
    const UnicodeString base = uri.getBaseString();
    const UnicodeString name = uri.getFileName();
    require(name.endsWith(uri.getExtension()), "the extension of " + utf8(name));
    require(name.indexOf(u'/') < 0, utf8(name) + " has a slash");
    requireSame(makeUri(base).getBaseString(), base, "the base of the base");
    if (isPlain(uri)) {
        requireSame(base + name, text, "both parts");
        const bool isRelative = isPlain(makeUri(name));
        requireSame(resolve(makeUri(base), name), isRelative ? text : name, "the parts resolved");
    }
    uri.isFileExists();
}

void checkExtension(Choices& choices) {
    MoxUri uri = makeUri(makeText(choices));
    const UnicodeString name = uri.getFileName();
    const UnicodeString base = uri.getBaseString();
    const UnicodeString extension(u".x1");
    uri.setExtension(choices.flag() ? &extension : nullptr);
    requireSame(uri.getBaseString(), base, "the base");
    const bool isKept = name.isEmpty() || name == u"." || name == u"..";
    require(!isKept || uri.getFileName() == name, "the name of a directory");
    const UnicodeString text = uri.getText();
    uri.setExtension(&extension);
    const MoxUri once = uri;
    uri.setExtension(&extension);
    requireSame(uri.getText(), once.getText(), "the same extension again");
}

void checkResolving(Choices& choices) {
    const MoxUri base = makeUri(makeText(choices));
    const UnicodeString relative = makeText(choices);
    const MoxUri reference = makeUri(relative);
    const UnicodeString resolved = resolve(base, relative);
    if (!isPlain(reference)) {
        return;
    }
    if (isPlain(base)) {
        requireSame(resolved, reference.isAbsolute() ? relative : base.getBaseString() + relative,
                    "joined");
    }
    const MoxUri result = makeUri(resolved);
    requireSame(resolve(result, UnicodeString()), resolve(result, UnicodeString()), "once more");
}

void checkDirectory(Choices& choices) {
    UnicodeString text = makeText(choices);
    MoxUri::toDirectory(text, u'/');
    require(text.isEmpty() || text.endsWith(u'/'), utf8(text) + " is no directory");
    const UnicodeString once = text;
    MoxUri::toDirectory(text, u'/');
    requireSame(text, once, "a directory again");
}

UnicodeString makeFormat(Choices& choices) {
    constexpr const char16_t* formats[] = {u"",  u"1", u"001", u"a",      u"A",
                                           u"i", u"I", u"-1-", u"\u0661", u"(a)"};
    return choices.flag() ? UnicodeString(choices.pick(formats)) : makeText(choices);
}

UnicodeString format(long long number, const UnicodeString& text) {
    return MoxUtil::formatNumber(number, text, u"", 0, MoxLang(icu::Locale::getRoot()),
                                 MOXNAME_ALPHABETIC);
}

void checkFormat(Choices& choices) {
    const UnicodeString text = makeFormat(choices);
    const int one =
        choices.flag() ? static_cast<int>(choices.below(5000)) : static_cast<int>(choices.number());
    const int other = choices.flag() ? one + 1 : static_cast<int>(choices.number());
    require(one == other || format(one, text) != format(other, text),
            "two numbers as " + utf8(format(one, text)));
    const std::string plain = utf8(format(one, u"1"));
    require(plain == std::to_string(one), plain);
}

// The names of page files tell all pages apart.
void checkPageFiles(Choices& choices) {
    SVGConfig config;
    SVGPageUri uri(makeText(choices), makeFormat(choices));
    Drawmere drawmere(&config, &uri);
    std::ostringstream stream;
    drawmere.initRootSvg(&stream);
    for (unsigned count = choices.below(4) + 1; count > 0; --count) {
        drawmere.startPage(static_cast<int>(choices.below(0x10000)) - 100, {});
    }
    std::set<UnicodeString> names;
    for (const auto& [page, name] : drawmere.pageFiles) {
        require(names.insert(name).second, "two pages in " + utf8(name));
        require(name.endsWith(uri.getExtension()), utf8(name) + " has another extension");
    }
}

constexpr void (*checks[])(Choices& choices) = {
    checkParts, checkExtension, checkResolving, checkDirectory, checkFormat, checkPageFiles,
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Choices choices(inputOf(data, size));
    while (!choices.isUsedUp()) {
        choices.pick(checks)(choices);
    }
    return 0;
}
