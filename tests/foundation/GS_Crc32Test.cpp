#include "foundation/graphicservice/GS_Crc32.h"

#include <gtest/gtest.h>

#include <string_view>
#include <vector>

using MoxGraphicService_NS::GS_Crc32;

namespace {

std::uint32_t checksum(std::string_view text) {
    GS_Crc32 crc;
    crc.add(reinterpret_cast<const std::uint8_t*>(text.data()), text.size());
    return crc.getValue();
}

} // namespace

TEST(GS_Crc32, KnownTextsHaveTheirKnownChecksums) {
    EXPECT_EQ(checksum(""), 0x00000000U);
    EXPECT_EQ(checksum("123456789"), 0xCBF43926U);
    EXPECT_EQ(checksum("IEND"), 0xAE426082U);
    EXPECT_EQ(checksum(std::string(1000000, 'a')), 0xDC25BFBCU);
}

TEST(GS_Crc32, BothWaysComeToTheSameForEverySize) {
    std::vector<std::uint8_t> bytes(1000);
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        bytes[i] = static_cast<std::uint8_t>(i * i + i / 7);
    }
    for (std::size_t size = 0; size <= bytes.size(); ++size) {
        GS_Crc32 fast;
        GS_Crc32 plain;
        fast.add(bytes.data(), size);
        plain.addPlain(bytes.data(), size);
        ASSERT_EQ(fast.getValue(), plain.getValue()) << size;
    }
}

TEST(GS_Crc32, BytesMayComeInPieces) {
    const std::vector<std::uint8_t> bytes(777, 0x5A);
    GS_Crc32 whole;
    whole.add(bytes.data(), bytes.size());
    for (const std::size_t piece : {1, 63, 64, 65, 200}) {
        GS_Crc32 pieces;
        for (std::size_t i = 0; i < bytes.size(); i += piece) {
            pieces.add(bytes.data() + i, std::min(piece, bytes.size() - i));
        }
        EXPECT_EQ(pieces.getValue(), whole.getValue()) << piece;
    }
}
