#include "images/SVGImageText.h"

#include "images/SVGBase64.h"
#include "tests/images/KeptImages.h"
#include "tests/support/OneValueDocument.h"
#include "tests/support/OpenFiles.h"
#include "tests/support/TempDir.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using namespace MoxCommonNS;
using DrawmereNS::SVGBase64;
using DrawmereNS::SVGImageText;

constexpr std::size_t chunk = SVGImageStore::chunkBytes;
constexpr std::size_t piece = chunk / 2; // as it is encoded

const MoxName href(u"href");

std::string encode(const std::string& bytes) {
    std::string text(SVGBase64::CalculateRecquiredEncodeOutputBufferSize(bytes.size()), '\0');
    SVGBase64::EncodeBuffer(bytes.data(), bytes.size(), text.data());
    return text.c_str();
}

MoxValue keepText(SVGImageStore& store, const std::string& bytes) {
    return MoxValue::fromKept(new SVGImageText("data:,\n", keep(store, bytes)));
}

TEST(SVGImageText, IsTheTextOfTheBytesWhereverTheyAre) {
    const TempDir directory;
    for (const std::size_t budget : {std::size_t(0), std::size_t(1) << 30U}) {
        SVGImageStore store(budget, directory.path());
        for (const std::size_t size :
             {std::size_t(0), std::size_t(1), std::size_t(2), std::size_t(3), std::size_t(56),
              std::size_t(57), std::size_t(58), std::size_t(114), piece - 1, piece, piece + 1,
              chunk, chunk + 58}) {
            const std::string bytes = makeBytes(size);
            const MoxPtr<SVGImageText> text(new SVGImageText("data:,\n", keep(store, bytes)));
            const std::string expected = "data:,\n" + encode(bytes);
            EXPECT_EQ(text->getLength(), expected.size());
            EXPECT_EQ(text->getText(), expected);
        }
    }
}

TEST(SVGImageText, IsWrittenAsTheWholeTextWouldBe) {
    const TempDir directory;
    for (const char16_t* const encoding : {u"", u"UTF-16", u"US-ASCII"}) {
        for (const std::size_t budget : {std::size_t(0), 2 * chunk}) {
            SVGImageStore store(budget, directory.path());
            for (const std::size_t size : {std::size_t(0), std::size_t(57), piece + 1, chunk}) {
                const std::string bytes = makeBytes(size);
                const MoxValue whole = MoxValue::fromAscii("data:,\n" + encode(bytes));
                const MoxPtr<MoxDocument> document = makeDocument(href, keepText(store, bytes));
                const std::string saved = saveWhole(*document, encoding);
                EXPECT_EQ(saved, saveWhole(*makeDocument(href, whole), encoding));
                EXPECT_EQ(saved, saveWhole(*document, encoding)); // once more
            }
        }
    }
}

TEST(SVGImageText, LineFeedsOfThePrefixAreReplacedToo) {
    for (const char* const prefix : {"", "\n", "a", "\n\nab\nc\n", "ab\ncd"}) {
        const MoxPtr<SVGImageText> text(new SVGImageText(prefix, {}));
        std::string written;
        EXPECT_TRUE(text->handOut("<>", [&](std::string_view one) { written += one; }));
        UnicodeString expected(prefix);
        EXPECT_EQ(written, utf8(expected.findAndReplace(u"\n", u"<>")));
        EXPECT_EQ(text->getText(), prefix);
    }
}

TEST(SVGImageText, DocumentsShareNoFile) {
    const TempDir directory;
    SVGImageStore stores[] = {SVGImageStore(0, directory.path()),
                              SVGImageStore(0, directory.path())};
    const std::string one = makeBytes(chunk + 5);
    const std::string other = makeBytes(200);
    const MoxPtr<MoxDocument> first = makeDocument(href, keepText(stores[0], one));
    const MoxPtr<MoxDocument> second = makeDocument(href, keepText(stores[1], other));
    EXPECT_EQ(countOpenFiles(directory.path()), 2);
    EXPECT_EQ(saveWhole(*first),
              saveWhole(*makeDocument(href, MoxValue::fromAscii("data:,\n" + encode(one)))));
    EXPECT_EQ(saveWhole(*second),
              saveWhole(*makeDocument(href, MoxValue::fromAscii("data:,\n" + encode(other)))));
}

TEST(SVGImageText, ACloneKeepsTheFileOpen) {
    const TempDir directory;
    MoxPtr<MoxDocument> document;
    {
        SVGImageStore store(0, directory.path());
        document = makeDocument(href, keepText(store, makeBytes(1000)));
    }
    const std::string saved = saveWhole(*document);
    MoxPtr<MoxNode> clone = document->cloneNode(/*deep=*/true);
    document = nullptr;
    EXPECT_EQ(saveWhole(static_cast<const MoxDocument&>(*clone)), saved);
    EXPECT_EQ(countOpenFiles(directory.path()), 1);
    clone = nullptr;
    EXPECT_EQ(countOpenFiles(directory.path()), 0);
}

TEST(SVGImageText, BytesThatAreGoneFailTheStream) {
    const TempDir directory;
    SVGImageStore store(0, directory.path());
    const MoxPtr<MoxDocument> document = makeDocument(href, keepText(store, makeBytes(chunk)));
    cutOpenFiles(directory.path(), chunk - 1);
    std::ostringstream stream;
    document->save(u"", u"", stream, nullptr, u"", u"");
    EXPECT_TRUE(stream.bad());
    EXPECT_EQ(stream.str().find("/>"), std::string::npos);
    const MoxValue& value = document->getDocumentElement()->getAttribute(href);
    EXPECT_THROW(value.toString(), std::ios_base::failure);
}

} // namespace
} // namespace DrawmereTest
