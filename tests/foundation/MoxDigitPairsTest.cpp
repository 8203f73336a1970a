#include "foundation/common/MoxDigitPairs.h"

#include <gtest/gtest.h>
#include <random>
#include <string>

namespace {

using MoxCommonNS::MoxDigitPairs;

std::string pack(const std::string& text) {
    std::string bytes(text.size(), '\0');
    bytes.resize(MoxDigitPairs::pack(text, bytes.data()));
    return bytes;
}

/// Piece by piece, as a writer does it.
std::string unpack(const std::string& bytes, std::size_t length, std::size_t pieceSize) {
    std::string text;
    const char* place = bytes.data();
    while (text.size() < length) {
        const std::size_t count = std::min(pieceSize, length - text.size());
        std::string piece(count + count % 2, '\0');
        place = MoxDigitPairs::unpack(place, count, piece.data());
        text.append(piece, 0, count);
    }
    EXPECT_EQ(place, bytes.data() + bytes.size());
    return text;
}

std::string makeNumbers(std::mt19937& random, std::size_t length) {
    constexpr std::string_view characters = "0123456789 l,-.c0123456789";
    std::string text;
    while (text.size() < length) {
        const bool isStranger = random() % 40 == 0;
        const char stranger = static_cast<char>('A' + random() % 26);
        text += isStranger ? stranger : characters[random() % characters.size()];
    }
    return text;
}

TEST(MoxDigitPairs, NumbersNeedHalfTheBytes) {
    EXPECT_EQ(pack("12.5,-3 0.25l7c1").size(), 8U);
    EXPECT_EQ(pack("12.5,-3 0.25l7c1,").size(), 9U);
}

TEST(MoxDigitPairs, WhatIsUnpackedIsWhatWasPacked) {
    std::mt19937 random(7);
    for (std::size_t length = 1; length < 400; ++length) {
        const std::string text = makeNumbers(random, length);
        const std::string bytes = pack(text);
        for (const std::size_t pieceSize :
             {std::size_t{2}, std::size_t{16}, std::size_t{64}, length + 1}) {
            if (!bytes.empty() && (pieceSize % 2 == 0 || pieceSize > length)) {
                EXPECT_EQ(unpack(bytes, length, pieceSize), text);
            }
        }
    }
}

TEST(MoxDigitPairs, APairThatReadsLikeTheMarkIsKeptAsItIs) {
    const std::string text = "1234567890cc1234567890ccc";
    EXPECT_EQ(unpack(pack(text), text.size(), 64), text);
}

TEST(MoxDigitPairs, WordsAreNotPacked) {
    EXPECT_EQ(pack("a text of many words, as runs have"), "");
    EXPECT_EQ(pack("M"), "");
    EXPECT_EQ(pack(""), "");
}

TEST(MoxDigitPairs, AFewLettersAmongNumbersArePacked) {
    EXPECT_FALSE(pack("M1.25,2.5 3.75,4L12.5,7.25 8.5,9.75").empty());
}

TEST(MoxDigitPairs, MarkupIsNotPacked) {
    for (const char c : {'<', '>', '&', '"', '\n', '\x7F'}) {
        EXPECT_EQ(pack("1234567890" + std::string(1, c) + "1234567890123456789012345"), "");
        EXPECT_EQ(pack("12345678901" + std::string(1, c) + "1234567890123456789012345"), "");
    }
}

} // namespace
