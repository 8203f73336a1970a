#include "foundation/common/MoxXmlScan.h"

#include <string>

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

/// Searches character by character.
std::size_t findPlainly(const std::string& text, std::size_t from) {
    while (from < text.size() && !mayBeXmlMarkup(text[from])) {
        ++from;
    }
    return from;
}

} // namespace

TEST(MoxXmlScan, MarkupAndControlCharactersAreKnown) {
    for (int c = 0; c < 128; ++c) {
        const bool isMarkup = c < 32 || c == 127 ||
                              std::string("<>&\"").find(static_cast<char>(c)) != std::string::npos;
        EXPECT_EQ(mayBeXmlMarkup(static_cast<char>(c)), isMarkup) << c;
    }
}

TEST(MoxXmlScan, EveryCharacterIsFoundInEveryPlace) {
    for (int c = 0; c < 128; ++c) {
        for (std::size_t place = 0; place < 50; ++place) {
            std::string text(50, 'a');
            text[place] = static_cast<char>(c);
            for (std::size_t from = 0; from <= place + 1; ++from) {
                ASSERT_EQ(findXmlMarkup(text, from), findPlainly(text, from)) << c << " " << place;
            }
        }
    }
}

TEST(MoxXmlScan, NothingFoundIsTheLength) {
    for (std::size_t size = 0; size < 70; ++size) {
        EXPECT_EQ(findXmlMarkup(std::string(size, 'a'), 0), size);
        EXPECT_EQ(findXmlMarkup(std::string(size, 'a'), size), size);
    }
}
