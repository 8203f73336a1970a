#include "foundation/records/TLGraphicType.h"

#include "tests/support/BrittleBuffer.h"

#include <sstream>
#include <string>

#include <gtest/gtest.h>

using namespace TalGraphic;
using DrawmereTest::BrittleBuffer;

namespace {

TLGraphicType findType(const std::string& bytes) {
    std::istringstream stream(bytes);
    return findGraphicType(stream);
}

} // namespace

TEST(TLGraphicType, ContentTellsTheType) {
    const std::pair<std::string, TLGraphicType> rows[] = {
        {"\x89PNG\r\n\x1A\n....", TLGRAPHICTYPE_PNG},
        {"\xFF\xD8\xFF\xE0", TLGRAPHICTYPE_JPEG},
        {"<svg/>", TLGRAPHICTYPE_SVG},
        {"\xEF\xBB\xBF \n<?xml version=\"1.0\"?><!-- a --><svg>", TLGRAPHICTYPE_SVG},
        {"", TLGRAPHICTYPE_OTHER},
        {" ", TLGRAPHICTYPE_OTHER},
        {"GIF89a", TLGRAPHICTYPE_OTHER},
        {"\x89PNG", TLGRAPHICTYPE_OTHER},
        {"<html><body>", TLGRAPHICTYPE_OTHER},
        {"say <svg>", TLGRAPHICTYPE_OTHER},
        {"<a>" + std::string(2000, ' ') + "<svg>", TLGRAPHICTYPE_OTHER},
    };
    for (const auto& [bytes, type] : rows) {
        EXPECT_EQ(findType(bytes), type) << bytes;
    }
}

TEST(TLGraphicType, StreamsAreReadFromTheirStartAndLeftThere) {
    std::istringstream stream("\xFF\xD8\xFF\xE0rest");
    stream.seekg(4);
    EXPECT_EQ(findGraphicType(stream), TLGRAPHICTYPE_JPEG);
    EXPECT_EQ(stream.tellg(), std::streampos(0));
}

TEST(TLGraphicType, AStreamAtItsEndIsReadAllTheSame) {
    std::istringstream stream("\xFF\xD8\xFF");
    std::string all;
    stream >> all >> all;
    EXPECT_EQ(findGraphicType(stream), TLGRAPHICTYPE_JPEG);
}

TEST(TLGraphicType, AStreamThatCannotBeReadHasNoType) {
    std::istream broken(nullptr);
    EXPECT_EQ(findGraphicType(broken), TLGRAPHICTYPE_OTHER);
    for (const BrittleBuffer::Fault fault : BrittleBuffer::faults) {
        BrittleBuffer buffer("\xFF\xD8\xFF", 1, fault);
        std::istream stream(&buffer);
        EXPECT_EQ(findGraphicType(stream), TLGRAPHICTYPE_OTHER) << fault;
    }
}

TEST(TLGraphicType, TypesHaveTheNumbersOfTheCallers) {
    EXPECT_EQ(static_cast<int>(TLGRAPHICTYPE_PNG), 2);
    EXPECT_EQ(static_cast<int>(TLGRAPHICTYPE_JPEG), 5);
    EXPECT_EQ(static_cast<int>(TLGRAPHICTYPE_SVG), 9);
}
