#include "images/SVGBase64.h"

#include "tests/support/TempDir.h"

#include <gtest/gtest.h>

#include <climits>
#include <sstream>

#include <sys/stat.h>

namespace DrawmereTest {
namespace {

using namespace DrawmereNS;

constexpr char filler = '#';

int findSize(unsigned long size) {
    return SVGBase64::CalculateRecquiredEncodeOutputBufferSize(size);
}

std::string makeBytes(std::size_t size) {
    std::string bytes(size, '\0');
    for (std::size_t i = 0; i < size; ++i) {
        bytes[i] = static_cast<char>(i * i + i / 3);
    }
    return bytes;
}

/// Returns: all of the buffer of a text, with the zeros behind it.
std::string encodeBuffer(const std::string& bytes) {
    std::string out(findSize(bytes.size()), filler);
    SVGBase64::EncodeBuffer(bytes.data(), bytes.size(), out.data());
    return out;
}

/// Returns: the text alone.
std::string encode(const std::string& bytes) { return encodeBuffer(bytes).c_str(); }

std::string encodeTriple(const std::string& bytes) {
    std::string out(4, filler);
    SVGBase64::EncodeByteTriple(bytes.data(), bytes.size(), out.data());
    return out;
}

/// The bytes that `text` stands for, read character by character.
std::string decode(const std::string& text) {
    const std::string alphabet = SVGBase64::BASE64_ALPHABET;
    std::string bytes;
    unsigned int bits = 0;
    int count = 0;
    for (const char c : text) {
        const std::size_t field = alphabet.find(c);
        if (field == std::string::npos) {
            continue; // a line feed or a pad
        }
        bits = bits << 6U | static_cast<unsigned int>(field);
        count += 6;
        if (count >= 8) {
            count -= 8;
            bytes += static_cast<char>(bits >> static_cast<unsigned int>(count));
        }
    }
    return bytes;
}

TEST(SVGBase64, SizesLeaveRoomForLongLineEndsAndAZero) {
    const std::pair<unsigned long, int> rows[] = {{0, 1},   {1, 5},     {2, 5},    {3, 5},
                                                  {4, 9},   {56, 79},   {57, 79},  {58, 83},
                                                  {60, 83}, {114, 157}, {171, 235}};
    for (const auto& [size, expected] : rows) {
        EXPECT_EQ(findSize(size), expected) << size;
    }
}

TEST(SVGBase64, SizesBeyondAnIntAreZero) {
    EXPECT_GT(findSize(1500000000), 0);
    for (const unsigned long size : {1600000000UL, 2147483647UL, 2147483648UL, ULONG_MAX}) {
        EXPECT_EQ(findSize(size), 0) << size;
    }
}

TEST(SVGBase64, TheLargestSizeIsTheLastThatAnIntTells) {
    unsigned long low = 1500000000;
    unsigned long high = 1600000000;
    while (high - low > 1) {
        const unsigned long middle = (low + high) / 2;
        (findSize(middle) > 0 ? low : high) = middle;
    }
    EXPECT_GT(findSize(low), INT_MAX - 10);
    EXPECT_EQ(findSize(low + 3), 0);
}

TEST(SVGBase64, TriplesArePaddedWithEqualsSigns) {
    const std::pair<const char*, const char*> rows[] = {
        {"f", "Zg=="}, {"fo", "Zm8="}, {"foo", "Zm9v"}, {"A", "QQ=="}, {"\xFF\xFF\xFF", "////"},
    };
    for (const auto& [bytes, expected] : rows) {
        EXPECT_EQ(encodeTriple(bytes), expected);
    }
}

TEST(SVGBase64, CountsThatAreNoTripleWriteNothing) {
    EXPECT_EQ(encodeTriple(""), "####");
    EXPECT_EQ(encodeTriple("four"), "####");
}

TEST(SVGBase64, NoBytesGiveAnEmptyText) { EXPECT_EQ(encodeBuffer(""), std::string(1, '\0')); }

TEST(SVGBase64, OneByteGivesTwoPads) { EXPECT_EQ(encodeBuffer("A"), std::string("QQ==\0", 5)); }

TEST(SVGBase64, AFullLineIsClosedAndItsSpareBytesStayZero) {
    const std::string line = std::string(76, 'A') + "\n";
    EXPECT_EQ(encodeBuffer(std::string(57, '\0')), line + std::string(2, '\0'));
    EXPECT_EQ(encode(std::string(58, '\0')), line + "AA==");
    EXPECT_EQ(encode(std::string(114, '\0')), line + line);
}

TEST(SVGBase64, LastLineWithFewerThanNineteenGroupsIsNotClosed) {
    EXPECT_EQ(encode(std::string(56, '\0')), std::string(75, 'A') + "=");
}

TEST(SVGBase64, DecodingGivesTheBytesBack) {
    for (std::size_t size = 0; size < 400; ++size) {
        const std::string bytes = makeBytes(size);
        ASSERT_EQ(decode(encode(bytes)), bytes) << size;
    }
}

TEST(SVGBase64, ABufferTooLargeForAnIntIsLeftAlone) {
    char byte = filler;
    SVGBase64::EncodeBuffer(&byte, 2000000000, &byte);
    EXPECT_EQ(byte, filler);
}

TEST(SVGBase64, TextsAndFilesTellTheirSizes) {
    const TempDir directory;
    directory.write("a", makeBytes(58));
    directory.write("empty", "");
    const std::string path = directory.path("a");
    EXPECT_EQ(SVGBase64::CreateMatchingEncodingBuffer(path.c_str(), BASE64INPUTTYPE_FILE), 83);
    EXPECT_EQ(SVGBase64::CreateMatchingEncodingBuffer(directory.path("empty").c_str(),
                                                      BASE64INPUTTYPE_FILE),
              1);
    EXPECT_EQ(SVGBase64::CreateMatchingEncodingBuffer("four", BASE64INPUTTYPE_TEXT), 9);
    EXPECT_EQ(SVGBase64::CreateMatchingEncodingBuffer("a", static_cast<BASE64INPUTTYPE>(7)), 5);
}

TEST(SVGBase64, EmptyTextsAndMissingFilesHaveNoSize) {
    const TempDir directory;
    const std::string missing = directory.path("missing");
    EXPECT_EQ(SVGBase64::CreateMatchingEncodingBuffer("", BASE64INPUTTYPE_TEXT), 0);
    EXPECT_EQ(SVGBase64::CreateMatchingEncodingBuffer(nullptr, BASE64INPUTTYPE_TEXT), 0);
    for (const char* const path : {missing.c_str(), "/", "", static_cast<const char*>(nullptr)}) {
        EXPECT_EQ(SVGBase64::CreateMatchingEncodingBuffer(path, BASE64INPUTTYPE_FILE), -20);
    }
}

TEST(SVGBase64, FilesAndStreamsHaveTheTextOfTheirBytes) {
    const TempDir directory;
    for (const std::size_t size : {0, 1, 56, 57, 58, 114, 5000, 58368, 58369, 116736, 200000}) {
        const std::string bytes = makeBytes(size);
        directory.write("in", bytes);
        std::string fromFile(findSize(size), '\0');
        std::string fromStream(findSize(size), '\0');
        std::istringstream stream(bytes);
        EXPECT_EQ(SVGBase64::encodeFile2Buffer(directory.path("in").c_str(), fromFile.data(),
                                               fromFile.size()),
                  0);
        EXPECT_EQ(SVGBase64::encodeStream2Buffer(stream, fromStream.data(), fromStream.size()), 0);
        EXPECT_EQ(
            SVGBase64::EncodeFile(directory.path("in").c_str(), directory.path("out").c_str()), 0);
        EXPECT_EQ(fromFile, encodeBuffer(bytes)) << size;
        EXPECT_EQ(fromStream, encodeBuffer(bytes)) << size;
        EXPECT_EQ(directory.read("out"), encode(bytes)) << size;
    }
}

TEST(SVGBase64, NoBufferIsASuccessWithoutAText) {
    char out = filler;
    std::istringstream stream("abc");
    EXPECT_EQ(SVGBase64::encodeFile2Buffer("/missing/file", nullptr, 10), 0);
    EXPECT_EQ(SVGBase64::encodeFile2Buffer("/missing/file", &out, 0), 0);
    EXPECT_EQ(SVGBase64::encodeStream2Buffer(stream, nullptr, 10), 0);
    EXPECT_EQ(SVGBase64::encodeStream2Buffer(stream, &out, 0), 0);
    EXPECT_EQ(out, filler);
}

TEST(SVGBase64, ATextIsCutBeforeTheEndOfItsBuffer) {
    const TempDir directory;
    const std::string bytes = makeBytes(100000);
    directory.write("in", bytes);
    std::istringstream stream(bytes);
    std::string out(90000, filler);
    EXPECT_EQ(SVGBase64::encodeFile2Buffer(directory.path("in").c_str(), out.data(), 89999), -18);
    EXPECT_EQ(out.back(), filler);
    EXPECT_EQ(SVGBase64::encodeStream2Buffer(stream, out.data(), 89999), -18);
    EXPECT_EQ(out.back(), filler);
}

TEST(SVGBase64, MissingSourcesAndTargetsAreTold) {
    const TempDir directory;
    directory.write("in", "abc");
    const std::string in = directory.path("in");
    const std::string missing = directory.path("no/such");
    char out[10] = {};
    EXPECT_EQ(SVGBase64::EncodeFile(missing.c_str(), directory.path("out").c_str()), -20);
    EXPECT_EQ(SVGBase64::EncodeFile(nullptr, directory.path("out").c_str()), -20);
    EXPECT_EQ(SVGBase64::EncodeFile(directory.path().c_str(), in.c_str()), -20);
    EXPECT_EQ(SVGBase64::EncodeFile(in.c_str(), missing.c_str()), -19);
    EXPECT_EQ(SVGBase64::EncodeFile(in.c_str(), nullptr), -19);
    EXPECT_EQ(SVGBase64::encodeFile2Buffer(missing.c_str(), out, sizeof(out)), -20);
    EXPECT_FALSE(directory.has("out"));
}

TEST(SVGBase64, AFileIsNotEncodedIntoItself) {
    const TempDir directory;
    directory.write("in", "abc");
    EXPECT_EQ(SVGBase64::EncodeFile(directory.path("in").c_str(), directory.path("./in").c_str()),
              -19);
    EXPECT_EQ(directory.read("in"), "abc");
}

TEST(SVGBase64, APipeIsNotWaitedFor) {
    const TempDir directory;
    const std::string pipe = directory.path("pipe");
    ASSERT_EQ(mkfifo(pipe.c_str(), S_IRWXU), 0);
    char out[10] = {};
    EXPECT_EQ(SVGBase64::CreateMatchingEncodingBuffer(pipe.c_str(), BASE64INPUTTYPE_FILE), -20);
    EXPECT_EQ(SVGBase64::encodeFile2Buffer(pipe.c_str(), out, sizeof(out)), -20);
    EXPECT_EQ(SVGBase64::EncodeFile(pipe.c_str(), directory.path("out").c_str()), -20);
}

TEST(SVGBase64, AFullDiskIsTold) {
    const TempDir directory;
    directory.write("in", makeBytes(100000));
    EXPECT_EQ(SVGBase64::EncodeFile(directory.path("in").c_str(), "/dev/full"), -19);
}

TEST(SVGBase64, StreamsAreReadFromTheirStartInWhateverState) {
    std::istringstream stream("foo");
    std::string rest;
    stream >> rest >> rest;
    EXPECT_TRUE(stream.fail());
    char out[5] = {};
    EXPECT_EQ(SVGBase64::encodeStream2Buffer(stream, out, sizeof(out)), 0);
    EXPECT_STREQ(out, "Zm9v");
}

TEST(SVGBase64, StreamsThatCannotBeReadLeaveTheBufferAlone) {
    std::istream broken(nullptr);
    char out[5] = {};
    EXPECT_EQ(SVGBase64::encodeStream2Buffer(broken, out, sizeof(out)), 0);
    EXPECT_STREQ(out, "");
}

} // namespace
} // namespace DrawmereTest
