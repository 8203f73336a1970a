#include "foundation/common/MoxUri.h"

#include "foundation/common/MoxCStr.h"

#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <string>

#include <sys/stat.h>
#include <unistd.h>

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

MoxUri uri(const UnicodeString& text) { return MoxUri(text, URISTRTYPE_PATH_OR_URI, nullptr); }

std::string utf8(const UnicodeString& text) { return MoxCStr(text).toBytes(); }

std::string resolve(const UnicodeString& base, const UnicodeString& relative) {
    return utf8(MoxUri(uri(base), relative, URISTRTYPE_PATH_OR_URI, nullptr).getText());
}

struct PieceRow {
    const char16_t* text;
    const char* base;
    const char* name;
    const char* extension;
};

void expectPieces(std::initializer_list<PieceRow> rows) {
    for (const PieceRow& row : rows) {
        const MoxUri whole = uri(row.text);
        EXPECT_EQ(utf8(whole.getBaseString()), row.base) << utf8(row.text);
        EXPECT_EQ(utf8(whole.getFileName()), row.name) << utf8(row.text);
        EXPECT_EQ(utf8(whole.getExtension()), row.extension) << utf8(row.text);
    }
}

struct TextRow {
    const char16_t* text;
    const char* result;
};

void expectLocalPaths(std::initializer_list<TextRow> rows) {
    for (const TextRow& row : rows) {
        EXPECT_EQ(utf8(MoxUri::getLocalPath(row.text)), row.result) << utf8(row.text);
    }
}

/// A directory of its own for each test, removed with all that is in it.
class MoxUriFiles : public testing::Test {
protected:
    MoxUriFiles()
        : directory(std::filesystem::temp_directory_path() /
                    ("drawmere-uri-" + std::to_string(getpid()))) {
        std::filesystem::create_directories(directory);
    }

    ~MoxUriFiles() override { std::filesystem::remove_all(directory); }

    UnicodeString path(const UnicodeString& name) const {
        return UnicodeString::fromUTF8(directory.string()) + u"/" + name;
    }

    static bool write(const UnicodeString& text, bool create, const std::string& content) {
        const std::unique_ptr<std::ostream> stream(uri(text).getOStream(create));
        return stream && (*stream << content).flush();
    }

    static std::string read(const UnicodeString& text) {
        const std::unique_ptr<std::istream> stream(uri(text).getIStream(nullptr, nullptr));
        return stream ? std::string(std::istreambuf_iterator<char>(*stream),
                                    std::istreambuf_iterator<char>())
                      : std::string("null");
    }

    std::filesystem::path directory;
};

TEST(MoxUri, LocalPathKeepsItsText) {
    expectLocalPaths({{u"a b#c?d%20e.svg", "a b#c?d%20e.svg"},
                      {u"", ""},
                      {u"./x", "./x"},
                      {u"//x/../y", "//x/../y"},
                      {u"1:x", "1:x"},
                      {u"chapter 1: x", "chapter 1: x"}});
}

TEST(MoxUri, FileUriGivesItsDecodedPath) {
    expectLocalPaths({{u"file:///tmp/a%20b%23.svg", "/tmp/a b#.svg"},
                      {u"FILE:/tmp/x", "/tmp/x"},
                      {u"file://localhost/tmp/x", "/tmp/x"},
                      {u"file://LocalHost/tmp/x", "/tmp/x"},
                      {u"file:x.svg", "x.svg"},
                      {u"file:///gr%C3%B6%C3%9Fe+", "/gr\xC3\xB6\xC3\x9F"
                                                    "e+"},
                      {u"file:///\U0001F600%F0%9F%98%80", "/\xF0\x9F\x98\x80\xF0\x9F\x98\x80"},
                      {u"file:///x.svg?query#fragment", "/x.svg"}});
}

TEST(MoxUri, PercentSignThatBeginsNoEscapeStandsForItself) {
    expectLocalPaths(
        {{u"file:///%zz", "/%zz"}, {u"file:///100%", "/100%"}, {u"file:///%4", "/%4"}});
}

TEST(MoxUri, LocalPathOfWhatIsNoLocalFileIsTheText) {
    expectLocalPaths({{u"http://host/a%20b", "http://host/a%20b"},
                      {u"file://server/share/x", "file://server/share/x"},
                      {u"file:///%FF", "file:///%FF"},
                      {u"file:///a%00b", "file:///a%00b"},
                      {u"http://[bad", "http://[bad"},
                      {u"file://[bad", "file://[bad"},
                      {u"data:,x", "data:,x"}});
}

TEST(MoxUri, LocalPathIsCutAtItsLastSlashAndDot) {
    expectPieces({{u"out.svg", "", "out.svg", ".svg"},
                  {u"/dir/out.tar.gz", "/dir/", "out.tar.gz", ".gz"},
                  {u"dir.d/name", "dir.d/", "name", ""},
                  {u"dir.d/", "dir.d/", "", ""},
                  {u"/", "/", "", ""},
                  {u"", "", "", ""},
                  {u"a/b c#d?e%2f.svg", "a/", "b c#d?e%2f.svg", ".svg"},
                  {u"ö/\U0001F600.\U0001F600", "\xC3\xB6/", "\xF0\x9F\x98\x80.\xF0\x9F\x98\x80",
                   ".\xF0\x9F\x98\x80"}});
}

TEST(MoxUri, NameCanBeAnExtensionAlone) {
    expectPieces({{u".svg", "", ".svg", ".svg"},
                  {u"dir/.svg", "dir/", ".svg", ".svg"},
                  {u"..svg", "", "..svg", ".svg"},
                  {u"out.", "", "out.", "."}});
}

TEST(MoxUri, DotNamesOfDirectoriesHaveNoExtension) {
    expectPieces({{u".", "", ".", ""}, {u"..", "", "..", ""}, {u"a/..", "a/", "..", ""}});
}

TEST(MoxUri, QueryAndFragmentOfAUriAreNotInItsFileName) {
    expectPieces({{u"http://h/d/x.svg?a/b.c#d/e.f", "http://h/d/", "x.svg", ".svg"},
                  {u"file:///d/x.svg#f", "file:///d/", "x.svg", ".svg"},
                  {u"http://h/d/?q", "http://h/d/", "", ""},
                  {u"http://host.com", "http://host.com/", "", ""},
                  {u"http://host.com?q/r.s", "http://host.com/", "", ""},
                  {u"file:x.svg", "", "x.svg", ".svg"},
                  {u"mailto:a.b", "mailto:", "a.b", ".b"},
                  {u"http://[bad", "http://[bad/", "", ""},
                  {u"file:///%zz", "file:///", "%zz", ""},
                  {u"x:", "x:", "", ""}});
}

TEST(MoxUri, AbsoluteIsALeadingSlashOrAScheme) {
    for (const char16_t* text : {u"/", u"/x", u"//h/x", u"file:x", u"http://[bad", u"a+b-c.1:"}) {
        EXPECT_TRUE(uri(text).isAbsolute()) << utf8(text);
    }
    for (const char16_t* text : {u"", u"x", u"./x", u"1:x", u"a b:x", u":x", u"-a:x", u"ä:x"}) {
        EXPECT_FALSE(uri(text).isAbsolute()) << utf8(text);
    }
}

TEST(MoxUri, FileIsNoSchemeOrTheSchemeFile) {
    for (const char16_t* text : {u"", u"x", u"/x", u"file:x", u"File:///%zz"}) {
        EXPECT_TRUE(uri(text).isFile()) << utf8(text);
    }
    for (const char16_t* text : {u"http://h/x", u"files:x", u"fil:x", u"data:,x"}) {
        EXPECT_FALSE(uri(text).isFile()) << utf8(text);
    }
}

TEST(MoxUri, RelativeNameIsJoinedBehindTheLastSlashOfALocalPath) {
    EXPECT_EQ(resolve(u"out/", u"a.svg"), "out/a.svg");
    EXPECT_EQ(resolve(u"out/x.svg", u"../a#b?c%20.svg"), "out/../a#b?c%20.svg");
    EXPECT_EQ(resolve(u"out", u"a.svg"), "a.svg");
    EXPECT_EQ(resolve(u"", u"./a"), "./a");
    EXPECT_EQ(resolve(u"./", u"a"), "./a");
    EXPECT_EQ(resolve(u"out#/", u"a"), "out#/a");
    EXPECT_EQ(resolve(u"dir/x", u""), "dir/");
    EXPECT_EQ(resolve(u"./", u""), "./");
}

TEST(MoxUri, WhatNeedsNoBaseStaysAsItIs) {
    EXPECT_EQ(resolve(u"out/", u"/a/../b"), "/a/../b");
    EXPECT_EQ(resolve(u"http://h/", u"file:///a/../b"), "file:///a/../b");
    EXPECT_EQ(resolve(u"out/", u"http://[bad"), "http://[bad");
}

TEST(MoxUri, ReferenceIsResolvedAgainstAScheme) {
    struct Row {
        const char16_t* reference;
        const char* text;
    };

    // The examples of RFC 3986.
    const Row rows[] = {
        {u"g", "http://a/b/c/g"},         {u"./g", "http://a/b/c/g"},
        {u"g/", "http://a/b/c/g/"},       {u"?y", "http://a/b/c/d;p?y"},
        {u"g?y", "http://a/b/c/g?y"},     {u"#s", "http://a/b/c/d;p?q#s"},
        {u"g?y#s", "http://a/b/c/g?y#s"}, {u";x", "http://a/b/c/;x"},
        {u"", "http://a/b/c/d;p?q"},      {u".", "http://a/b/c/"},
        {u"..", "http://a/b/"},           {u"../g", "http://a/b/g"},
        {u"../../g", "http://a/g"},       {u"../../../g", "http://a/g"},
        {u"g.", "http://a/b/c/g."},       {u"g;x=1/../y", "http://a/b/c/y"},
    };
    for (const Row& row : rows) {
        EXPECT_EQ(resolve(u"http://a/b/c/d;p?q", row.reference), row.text);
    }
}

TEST(MoxUri, ReferenceToAFileUriStaysAFileUri) {
    EXPECT_EQ(resolve(u"file:///out/dir/", u"page1.svg"), "file:///out/dir/page1.svg");
    EXPECT_EQ(resolve(u"file:///out/dir/x.svg", u"../page1.svg"), "file:///out/page1.svg");
    EXPECT_EQ(resolve(u"file:///out/dir/", u"/page1.svg"), "file:///page1.svg");
    EXPECT_EQ(resolve(u"file:/out/", u"x"), "file:/out/x");
    EXPECT_EQ(resolve(u"http://h", u"x"), "http://h/x");
}

TEST(MoxUri, ReferenceToAUriWithoutASlashIsItsSibling) {
    EXPECT_EQ(resolve(u"file:out/a", u"b"), "file:out/b");
    EXPECT_EQ(resolve(u"file:a", u"b"), "file:b");
    EXPECT_EQ(resolve(u"file:", u"b"), "file:b");
    EXPECT_EQ(resolve(u"file:a/", u"../b"), "file:b");
    EXPECT_EQ(resolve(u"file:a/", u"../../b"), "file:b");
    EXPECT_EQ(resolve(u"urn:a:b", u"c"), "urn:c");
    EXPECT_EQ(resolve(u"file:///", u"..//x"), "file:////x");
    EXPECT_EQ(resolve(u"file:/a/", u"..//x"), "file:/.//x");
}

TEST(MoxUri, CharactersThatCantStandInAUriAreEscapedWhenResolving) {
    EXPECT_EQ(resolve(u"file:///out/", u"a b[1].svg"), "file:///out/a%20b%5B1%5D.svg");
    EXPECT_EQ(resolve(u"file:///größe/", u"\U0001F600"), "file:///gr%C3%B6%C3%9Fe/%F0%9F%98%80");
    EXPECT_EQ(resolve(u"file:///out/", u"100%"), "file:///out/100%25");
    EXPECT_EQ(resolve(u"file:///out/", u"a%20b"), "file:///out/a%20b");
    EXPECT_EQ(resolve(u"http://[v1.x]/out/", u"y"), "http://[v1.x]/out/y");
}

TEST(MoxUri, BrokenTextsAreJoinedAsTheyStand) {
    EXPECT_EQ(resolve(u"http://[bad", u"x y"), "http://[bad/x y");
    EXPECT_EQ(resolve(u"http://[bad/d/e?f", u"x"), "http://[bad/d/x");
    EXPECT_EQ(resolve(u"http://[bad/d/e?f", u"/x"), "http://[bad/x");
    EXPECT_EQ(resolve(u"http://h/d/e", u"1:x"), "http://h/d/1:x");
    EXPECT_EQ(resolve(u"http://h/d/e", u"a#b#c"), "http://h/d/a#b#c");
}

TEST(MoxUri, OverlongUriIsJoinedAsItStands) {
    const UnicodeString longName(1 << 20, UChar32(u'a'), 1 << 20);
    EXPECT_EQ(resolve(u"file:///d/e", longName), "file:///d/" + std::string(1 << 20, 'a'));
    EXPECT_EQ(utf8(uri(u"file:///" + longName).getLocalPath()).size(), (1U << 20) + 1U);
}

TEST(MoxUri, SetTextReplacesTheText) {
    MoxUri changed = uri(u"a");
    changed.setText(u"b/c.svg");
    EXPECT_EQ(utf8(changed.getText()), "b/c.svg");
    EXPECT_EQ(utf8(changed.getFileName()), "c.svg");
}

TEST(MoxUri, EveryTypeOfStringReadsAlike) {
    const MoxUri other(u"file:///x", URISTRTYPE(99), nullptr);
    EXPECT_EQ(utf8(other.getLocalPath()), "/x");
}

TEST(MoxUri, SetExtensionReplacesTheExtensionOfTheFileName) {
    struct Row {
        const char16_t* text;
        const char16_t* extension;
        const char* result;
    };

    const Row rows[] = {
        {u"a/b.png", u".jpg", "a/b.jpg"},
        {u"a/b.png", nullptr, "a/b"},
        {u"a/b.png", u"", "a/b"},
        {u"a/b.png", u"jpg", "a/b.jpg"},
        {u"a.d/b", u".jpg", "a.d/b.jpg"},
        {u"a.d/b", nullptr, "a.d/b"},
        {u".svg", nullptr, ""},
        {u"out.", u".svg", "out.svg"},
        {u"a/", u".svg", "a/"},
        {u"..", u".svg", ".."},
        {u"", u".svg", ""},
        {u"http://h.i/a.png?b.c#d.e", u".jpg", "http://h.i/a.jpg?b.c#d.e"},
        {u"http://h.i", u".jpg", "http://h.i"},
    };
    for (const Row& row : rows) {
        MoxUri changed = uri(row.text);
        const UnicodeString extension = row.extension ? UnicodeString(row.extension) : u"";
        EXPECT_EQ(utf8(changed.setExtension(row.extension ? &extension : nullptr)), row.result);
        EXPECT_EQ(utf8(changed.getText()), row.result);
    }
}

TEST(MoxUri, SetExtensionTakesAPartOfItsOwnText) {
    MoxUri changed = uri(u"a.b");
    EXPECT_EQ(utf8(changed.setExtension(&changed.getText())), "a.a.b");
}

TEST(MoxUri, DirectoryFormEndsInTheSeparatorOnce) {
    struct Row {
        const char16_t* text;
        char16_t separator;
        const char* result;
    };

    const Row rows[] = {
        {u"images", u'/', "images/"}, {u"images/", u'/', "images/"}, {u"/", u'/', "/"},
        {u".", u'/', "./"},           {u"a/", u'\\', "a/\\"},        {u"", u'/', ""},
    };
    for (const Row& row : rows) {
        UnicodeString text(row.text);
        MoxUri::toDirectory(text, row.separator);
        EXPECT_EQ(utf8(text), row.result);
    }
}

TEST_F(MoxUriFiles, CreatesAFileAndReadsItBack) {
    EXPECT_TRUE(write(path(u"a b#größe\U0001F600%20?.svg"), true, "content\r\n"));
    EXPECT_EQ(read(path(u"a b#größe\U0001F600%20?.svg")), "content\r\n");
}

TEST_F(MoxUriFiles, CreatingEmptiesTheFileThatIsThere) {
    EXPECT_TRUE(write(path(u"x"), true, "long content"));
    EXPECT_TRUE(write(path(u"x"), true, "new"));
    EXPECT_EQ(read(path(u"x")), "new");
}

TEST_F(MoxUriFiles, OpeningWithoutCreatingNeedsTheFileAndKeepsItsContent) {
    EXPECT_FALSE(write(path(u"x"), false, "new"));
    EXPECT_FALSE(uri(path(u"x")).isFileExists());
    EXPECT_TRUE(write(path(u"x"), true, "content"));
    EXPECT_TRUE(write(path(u"x"), false, "CON"));
    EXPECT_EQ(read(path(u"x")), "CONtent");
}

TEST_F(MoxUriFiles, OutputIsAFileStream) {
    const std::unique_ptr<std::ostream> stream(uri(path(u"x")).getOStream(true));
    auto* const file = dynamic_cast<std::fstream*>(stream.get());
    ASSERT_NE(file, nullptr);
    *stream << "x";
    EXPECT_NE(file->rdbuf()->close(), nullptr);
    EXPECT_EQ(read(path(u"x")), "x");
}

TEST_F(MoxUriFiles, FileUriOpensTheDecodedPath) {
    EXPECT_TRUE(write(u"file://" + path(u"a%20b.svg"), true, "content"));
    EXPECT_EQ(read(path(u"a b.svg")), "content");
    EXPECT_EQ(read(u"file://localhost" + path(u"a%20b.svg")), "content");
    EXPECT_TRUE(uri(u"file:" + path(u"a%20b.svg")).isFileExists());
}

TEST_F(MoxUriFiles, WhatIsNoLocalFileOpensAsNull) {
    EXPECT_TRUE(write(path(u"x"), true, "content"));
    UnicodeString cut = path(u"x");
    cut += char16_t(0);
    cut += u'y';
    const UnicodeString texts[] = {u"",
                                   u"http://h/x",
                                   u"file://server" + path(u"x"),
                                   u"http://[bad",
                                   u"file://[bad",
                                   u"file:///%FF",
                                   u"file:///%zz/x",
                                   u"file:",
                                   u"data:,x",
                                   u"file://" + path(u"x%00"),
                                   cut,
                                   u"file://" + cut};
    for (const UnicodeString& text : texts) {
        EXPECT_FALSE(write(text, true, "")) << utf8(text);
        EXPECT_FALSE(write(text, false, "")) << utf8(text);
        EXPECT_EQ(read(text), "null") << utf8(text);
        EXPECT_FALSE(uri(text).isFileExists()) << utf8(text);
    }
    EXPECT_EQ(read(path(u"x")), "content");
}

TEST_F(MoxUriFiles, DirectoryExistsButOpensAsNull) {
    EXPECT_TRUE(uri(path(u"")).isFileExists());
    EXPECT_FALSE(write(path(u""), true, ""));
    EXPECT_FALSE(write(path(u"."), false, ""));
    EXPECT_EQ(read(path(u".")), "null");
    EXPECT_EQ(read(path(u"none")), "null");
}

TEST_F(MoxUriFiles, MissingDirectoryIsNotMade) {
    EXPECT_FALSE(write(path(u"none/x"), true, ""));
    EXPECT_FALSE(uri(path(u"none/")).isFileExists());
}

TEST_F(MoxUriFiles, ExistenceIsAskedOfUtf8PathsToo) {
    EXPECT_TRUE(write(path(u"größe"), true, ""));
    EXPECT_TRUE(MoxUri::isFileExists(utf8(path(u"größe")).c_str()));
    EXPECT_FALSE(MoxUri::isFileExists(utf8(path(u"other")).c_str()));
    EXPECT_FALSE(MoxUri::isFileExists(""));
    EXPECT_FALSE(MoxUri::isFileExists(static_cast<const char*>(nullptr)));
}

TEST_F(MoxUriFiles, ReadingLeavesNoMediaType) {
    EXPECT_TRUE(write(path(u"x.svg"), true, "x"));
    UnicodeString type(u"left over");
    const std::unique_ptr<std::istream> stream(uri(path(u"x.svg")).getIStream(nullptr, &type));
    EXPECT_NE(stream, nullptr);
    EXPECT_TRUE(type.isEmpty());
}

TEST_F(MoxUriFiles, PipeIsNotWaitedFor) {
    ASSERT_EQ(mkfifo((directory / "pipe").c_str(), S_IRWXU), 0);
    EXPECT_EQ(read(path(u"pipe")), "null");
}

TEST_F(MoxUriFiles, OverlongPathIsAFailureLikeAnyOther) {
    const UnicodeString longName(100000, UChar32(u'a'), 100000);
    EXPECT_FALSE(write(path(longName), true, ""));
    EXPECT_EQ(read(path(longName)), "null");
    EXPECT_FALSE(uri(path(longName)).isFileExists());
}

} // namespace
