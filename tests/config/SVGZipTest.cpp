#include "config/SVGZip.h"

#include "tests/support/Gunzip.h"
#include "tests/support/TempDir.h"
#include "tests/support/Utf8.h"

#include <random>
#include <sstream>

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::gunzip;
using DrawmereTest::TempDir;

namespace {

constexpr std::size_t bufferSize = SVGZipStreamBuf::bufferSize;

std::string zip(const std::string& content) {
    std::ostringstream target;
    SVGZipStream(target) << content;
    EXPECT_TRUE(target.good());
    return target.str();
}

std::string makeRandomBytes(std::size_t size) {
    std::mt19937 random(1); // NOLINT(bugprone-random-generator-seed): the same bytes in each run
    std::string bytes(size, '\0');
    for (char& byte : bytes) {
        byte = static_cast<char>(random() & 0xFF);
    }
    return bytes;
}

/// A target that takes `room` bytes and no more.
class FullBuf : public std::streambuf {
public:
    explicit FullBuf(std::streamsize bytes) : room(bytes) {}

protected:
    std::streamsize xsputn(const char*, std::streamsize count) override {
        const std::streamsize taken = std::min(count, room);
        room -= taken;
        return taken;
    }

    int overflow(int) override { return traits_type::eof(); }

private:
    std::streamsize room;
};

} // namespace

TEST(SVGZip, EmptyDocumentIsAValidFile) { EXPECT_EQ(gunzip(zip("")), ""); }

TEST(SVGZip, HeaderHasNoNameAndNoTime) {
    const std::string file = zip("text");
    EXPECT_EQ(file.substr(0, 8), std::string("\x1F\x8B\x08\0\0\0\0\0", 8));
    EXPECT_EQ(file[8], 2); // the mark of the highest level
}

TEST(SVGZip, ContentAroundTheSizeOfTheBufferComesBack) {
    for (const std::size_t size : {bufferSize - 1, bufferSize, bufferSize + 1, 2 * bufferSize}) {
        const std::string content = makeRandomBytes(size);
        EXPECT_EQ(gunzip(zip(content)), content) << size;
    }
}

TEST(SVGZip, MebibyteOfRandomBytesComesBack) {
    const std::string content = makeRandomBytes(1048576);
    EXPECT_EQ(gunzip(zip(content)), content);
}

TEST(SVGZip, LongRunsShrink) {
    const std::string content(1048576, 'x');
    const std::string file = zip(content);
    EXPECT_LT(file.size(), 2000U);
    EXPECT_EQ(gunzip(file), content);
}

TEST(SVGZip, SingleCharactersComeBack) {
    const std::string content = makeRandomBytes(3 * bufferSize + 5);
    std::ostringstream target;
    {
        SVGZipStream stream(target);
        for (const char byte : content) {
            stream.put(byte);
        }
    }
    EXPECT_EQ(gunzip(target.str()), content);
}

TEST(SVGZip, FullPutAreaWaitsForTheNextCharacter) {
    std::ostringstream target;
    SVGZipStreamBuf buffer(target);
    const std::string content(bufferSize, 'x');
    buffer.sputn(content.data(), static_cast<std::streamsize>(content.size()));
    EXPECT_EQ(buffer.in_avail(), 0);
    EXPECT_EQ(buffer.sputc('y'), 'y');
    buffer.sync();
    buffer.FinishEncodeBuf();
    EXPECT_EQ(gunzip(target.str()), content + 'y');
}

TEST(SVGZip, FlushNeedNotMakeTheFileGrow) {
    std::ostringstream target;
    {
        SVGZipStream stream(target);
        stream << "one" << std::flush;
        EXPECT_TRUE(stream.good());
        EXPECT_TRUE(target.str().empty());
        stream << "two";
    }
    EXPECT_EQ(gunzip(target.str()), "onetwo");
}

TEST(SVGZip, TargetStaysOpen) {
    std::ostringstream target;
    target << "before";
    SVGZipStream(target) << "text";
    target << "behind";
    const std::string all = target.str();
    EXPECT_EQ(all.substr(0, 6), "before");
    EXPECT_EQ(all.substr(all.size() - 6), "behind");
    EXPECT_EQ(gunzip(all.substr(6, all.size() - 12)), "text");
}

TEST(SVGZip, FileFormMakesTheFile) {
    const TempDir dir;
    dir.write("ä.svgz", std::string(1000, 'x'));
    SVGZipStream(dir.uri("ä.svgz")) << "text";
    EXPECT_EQ(gunzip(dir.read("ä.svgz")), "text");
}

TEST(SVGZip, FileThatCannotBeOpenedSwallowsEverything) {
    const TempDir dir;
    SVGZipStream stream(dir.uri("missing/a.svgz"));
    EXPECT_TRUE(stream.fail());
    stream.clear();
    stream << makeRandomBytes(3 * bufferSize) << std::flush;
    EXPECT_TRUE(stream.fail());
    EXPECT_FALSE(dir.has("missing"));
}

TEST(SVGZip, FileNameWithANullCharacterEmptiesNoOtherFile) {
    const TempDir dir;
    dir.write("a", "kept");
    {
        SVGZipStream stream(dir.uri("a") + UnicodeString(u'\0') + u".svgz");
        EXPECT_TRUE(stream.fail());
        stream.clear();
        stream << "lost";
    }
    EXPECT_EQ(dir.read("a"), "kept");
}

// On purpose: the end-of-file value is a byte like others and stores 255.
TEST(SVGZip, OverflowWithTheEndOfFileValueStoresAByte) {
    std::ostringstream target;
    {
        SVGZipStreamBuf buffer(target);
        EXPECT_EQ(buffer.overflow(std::char_traits<char>::eof()), 255);
        EXPECT_EQ(buffer.overflow('a'), 'a');
    }
    EXPECT_EQ(gunzip(target.str()), "\xFF"
                                    "a");
}

TEST(SVGZip, EncodeBufferTellsWhatWaits) {
    std::ostringstream target;
    SVGZipStreamBuf buffer(target);
    std::string content = makeRandomBytes(4 * bufferSize);
    auto* bytes = reinterpret_cast<unsigned char*>(content.data());
    const unsigned long waiting = buffer.EncodeBuffer(bytes, nullptr, content.size(), bufferSize);
    EXPECT_LT(waiting, bufferSize);
    const std::size_t written = target.str().size();
    EXPECT_GT(written, 0U);
    EXPECT_EQ(written % bufferSize, 0U);
    EXPECT_EQ(buffer.EncodeBuffer(bytes, nullptr, 0, bufferSize), waiting);
    EXPECT_EQ(buffer.FinishEncodeBuf(), 0);
    EXPECT_EQ(gunzip(target.str()), content);
}

TEST(SVGZip, StartingAgainBeginsAnotherFile) {
    std::ostringstream target;
    {
        SVGZipStreamBuf buffer(target);
        buffer.sputn("lost", 4);
        buffer.gzOut();
        buffer.initZStream();
        buffer.sputn("text", 4);
    }
    EXPECT_EQ(gunzip(target.str()), "text");
}

TEST(SVGZip, FinishedTwiceIsFinishedOnce) {
    std::ostringstream target;
    {
        SVGZipStreamBuf buffer(target);
        buffer.sputn("text", 4);
        buffer.sync();
        buffer.FinishEncodeBuf();
        buffer.FinishEncodeBuf();
    }
    EXPECT_EQ(gunzip(target.str()), "text");
    EXPECT_TRUE(target.good());
}

TEST(SVGZip, WritingBehindTheEndIsAnErrorAndEnds) {
    std::ostringstream target;
    SVGZipStreamBuf buffer(target);
    buffer.FinishEncodeBuf();
    EXPECT_TRUE(target.good());
    buffer.sputn("text", 4);
    EXPECT_EQ(buffer.sync(), -1);
    EXPECT_TRUE(target.bad());
    EXPECT_EQ(buffer.overflow('a'), std::char_traits<char>::eof());
    buffer.FinishEncodeBuf();
}

TEST(SVGZip, WriteErrorShowsInTheTarget) {
    FullBuf full(100);
    std::ostream target(&full);
    SVGZipStream(target) << makeRandomBytes(1000);
    EXPECT_TRUE(target.fail());
}

TEST(SVGZip, WriteErrorShowsInTheStreamWhenItIsFlushed) {
    FullBuf full(100);
    std::ostream target(&full);
    SVGZipStream stream(target);
    stream << makeRandomBytes(3 * bufferSize) << std::flush;
    EXPECT_TRUE(stream.bad());
    EXPECT_TRUE(target.fail());
}

TEST(SVGZip, FullDiskShowsInTheStreamOfAFileWhenItIsFlushed) {
    SVGZipStream stream(u"/dev/full");
    EXPECT_TRUE(stream.good());
    stream << makeRandomBytes(3 * bufferSize) << std::flush;
    EXPECT_TRUE(stream.bad());
    stream.clear();
    stream << makeRandomBytes(3 * bufferSize) << std::flush; // which ends all the same
    EXPECT_TRUE(stream.bad());
}

TEST(SVGZip, TargetThatThrowsDoesNotBreakTheDestruction) {
    FullBuf full(100);
    std::ostream target(&full);
    target.exceptions(std::ios::badbit);
    EXPECT_NO_THROW({ SVGZipStream(target) << makeRandomBytes(1000); });
    EXPECT_TRUE(target.bad());
}
