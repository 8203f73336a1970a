#include "foundation/graphicservice/GS_Exif.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

int read(const std::string& block) {
    const std::vector<std::uint8_t> bytes(block.begin(), block.end());
    return readExifOrientation(bytes.data(), bytes.size());
}

std::string entry(std::uint32_t tag, std::uint32_t type, std::uint32_t value) {
    return little(tag, 2) + little(type, 2) + little(1, 4) + little(value, 4);
}

const std::string head = std::string("II*\0", 4) + little(8, 4);

TEST(GS_Exif, OrientationIsFoundInEitherOrderOfBytes) {
    EXPECT_EQ(read(head + little(2, 2) + entry(0x100, 3, 7) + entry(0x112, 3, 5)), 5);
    EXPECT_EQ(read(std::string("MM\0*", 4) + big(8, 4) + big(1, 2) + big(0x112, 2) + big(3, 2) +
                   big(1, 4) + big(6, 2) + big(0, 2)),
              6);
}

TEST(GS_Exif, WhatIsNoneOrDamagedIsUpright) {
    const std::string good = head + little(1, 2) + entry(0x112, 3, 5);
    for (std::size_t size = 0; size < good.size(); ++size) {
        EXPECT_EQ(read(good.substr(0, size)), 1) << size;
    }
    EXPECT_EQ(read(good), 5);
    EXPECT_EQ(read(head + little(1, 2) + entry(0x112, 3, 9)), 1);
    EXPECT_EQ(read(head + little(1, 2) + entry(0x112, 3, 0)), 1);
    EXPECT_EQ(read(head + little(1, 2) + entry(0x112, 4, 5)), 1);
    EXPECT_EQ(read(std::string("II*\0", 4) + little(0xFFFFFFFF, 4) + entry(0x112, 3, 5)), 1);
    EXPECT_EQ(read("XX*\0" + good.substr(4)), 1);
}

} // namespace
