#include "foundation/common/MoxMemStream.h"

#include <iterator>
#include <memory>
#include <sstream>
#include <string>

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

std::string readRest(std::istream& stream) {
    return std::string(std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>());
}

/// Tells when it dies.
class WatchedSource : public std::istringstream {
public:
    WatchedSource(const std::string& text, bool& deletedFlag)
        : std::istringstream(text), isDeleted(deletedFlag) {}

    ~WatchedSource() override { isDeleted = true; }

private:
    bool& isDeleted;
};

TEST(MoxMemStream, IsReadAfterWriting) {
    MoxMemStream stream(nullptr, 8192, false);
    ASSERT_TRUE(stream.good());
    stream << "page " << 12;
    stream.write("\0!", 2);
    EXPECT_EQ(readRest(stream), std::string("page 12\0!", 9));
}

TEST(MoxMemStream, LengthIsFoundBySeekingToTheEndAndBack) {
    MoxMemStream stream(nullptr, 16, false);
    stream << std::string(10000, 'x') << "end";
    stream.seekg(0, std::ios::end);
    EXPECT_EQ(stream.tellg(), 10003);
    stream.seekg(0);
    EXPECT_EQ(readRest(stream).size(), 10003U);
    EXPECT_EQ(stream.tellp(), 10003);
}

TEST(MoxMemStream, EmptyStreamSeeksToItsOnlyPosition) {
    MoxMemStream stream(nullptr, 16, false);
    stream.seekg(0, std::ios::end);
    EXPECT_EQ(stream.tellg(), 0);
    stream.seekg(0);
    EXPECT_TRUE(stream.good());
    EXPECT_EQ(stream.get(), EOF);
}

TEST(MoxMemStream, SeekPastTheEndSetsTheFailBit) {
    MoxMemStream stream(nullptr, 16, false);
    stream << "abc";
    stream.seekp(4);
    EXPECT_TRUE(stream.fail());
}

TEST(MoxMemStream, TakesWhatTheSourceHasLeft) {
    std::istringstream source("skip" + std::string(100000, 'y'));
    source.ignore(4);
    MoxMemStream stream(&source, 16, false);
    EXPECT_EQ(stream.rdbuf()->getSize(), 100000U);
    EXPECT_TRUE(source.good());
    stream << "more";
    EXPECT_EQ(readRest(stream), std::string(100000, 'y') + "more");
}

TEST(MoxMemStream, SourceWithoutABufferIsEmpty) {
    std::istream source(nullptr);
    MoxMemStream stream(&source, 16, false);
    EXPECT_TRUE(stream.good());
    EXPECT_EQ(stream.rdbuf()->getSize(), 0U);
}

TEST(MoxMemStream, DeletesTheSourceOnlyWhenItOwnsIt) {
    bool isDeleted = false;
    auto source = std::make_unique<WatchedSource>("abc", isDeleted);
    EXPECT_EQ(readRest(*std::make_unique<MoxMemStream>(source.get(), 16, false)), "abc");
    EXPECT_FALSE(isDeleted);
    source->seekg(0);
    MoxMemStream owner(source.release(), 16, true);
    EXPECT_TRUE(isDeleted);
    EXPECT_EQ(readRest(owner), "abc");
}

TEST(MoxMemStream, BufferIsReachedThroughTheBaseToo) {
    MoxMemStream stream(nullptr, 16, false);
    std::ostream& output = stream;
    output << "abc";
    EXPECT_EQ(output.rdbuf(), stream.rdbuf());
    const MoxMemBytes bytes = stream.rdbuf()->remove();
    EXPECT_EQ(std::string(bytes.data.get(), bytes.size), "abc");
    EXPECT_EQ(stream.get(), EOF);
}

} // namespace
