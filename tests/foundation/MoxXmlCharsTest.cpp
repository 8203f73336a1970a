#include "foundation/common/MoxXmlChars.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

struct CharRow {
    UChar32 codePoint;
    bool isChar;
    bool isNameStart;
    bool isNameChar;
};

// Both sides of every border.
constexpr CharRow charRows[] = {
    {0x0, false, false, false},    {0x8, false, false, false},     {0x9, true, false, false},
    {0xA, true, false, false},     {0xB, false, false, false},     {0xC, false, false, false},
    {0xD, true, false, false},     {0xE, false, false, false},     {0x1F, false, false, false},
    {' ', true, false, false},     {',', true, false, false},      {'-', true, false, true},
    {'.', true, false, true},      {'/', true, false, false},      {'0', true, false, true},
    {'9', true, false, true},      {':', true, true, true},        {';', true, false, false},
    {'@', true, false, false},     {'A', true, true, true},        {'Z', true, true, true},
    {'[', true, false, false},     {'_', true, true, true},        {'`', true, false, false},
    {'a', true, true, true},       {'z', true, true, true},        {'{', true, false, false},
    {0x7F, true, false, false},    {0xB6, true, false, false},     {0xB7, true, false, true},
    {0xB8, true, false, false},    {0xBF, true, false, false},     {0xC0, true, true, true},
    {0xD6, true, true, true},      {0xD7, true, false, false},     {0xD8, true, true, true},
    {0xF6, true, true, true},      {0xF7, true, false, false},     {0xF8, true, true, true},
    {0x2FF, true, true, true},     {0x300, true, false, true},     {0x36F, true, false, true},
    {0x370, true, true, true},     {0x37D, true, true, true},      {0x37E, true, false, false},
    {0x37F, true, true, true},     {0x1FFF, true, true, true},     {0x2000, true, false, false},
    {0x200B, true, false, false},  {0x200C, true, true, true},     {0x200D, true, true, true},
    {0x200E, true, false, false},  {0x203E, true, false, false},   {0x203F, true, false, true},
    {0x2040, true, false, true},   {0x2041, true, false, false},   {0x206F, true, false, false},
    {0x2070, true, true, true},    {0x218F, true, true, true},     {0x2190, true, false, false},
    {0x2BFF, true, false, false},  {0x2C00, true, true, true},     {0x2FEF, true, true, true},
    {0x2FF0, true, false, false},  {0x3000, true, false, false},   {0x3001, true, true, true},
    {0xD7FF, true, true, true},    {0xD800, false, false, false},  {0xDFFF, false, false, false},
    {0xE000, true, false, false},  {0xF8FF, true, false, false},   {0xF900, true, true, true},
    {0xFDCF, true, true, true},    {0xFDD0, true, false, false},   {0xFDEF, true, false, false},
    {0xFDF0, true, true, true},    {0xFFFD, true, true, true},     {0xFFFE, false, false, false},
    {0xFFFF, false, false, false}, {0x10000, true, true, true},    {0xEFFFF, true, true, true},
    {0xF0000, true, false, false}, {0x10FFFF, true, false, false}, {0x110000, false, false, false},
    {-1, false, false, false},
};

TEST(MoxXmlChars, KnowsBothSidesOfEveryBorder) {
    for (const CharRow& row : charRows) {
        EXPECT_EQ(isXmlChar(row.codePoint), row.isChar) << std::hex << row.codePoint;
        EXPECT_EQ(isXmlNameStart(row.codePoint), row.isNameStart) << std::hex << row.codePoint;
        EXPECT_EQ(isXmlNameChar(row.codePoint), row.isNameChar) << std::hex << row.codePoint;
    }
}

} // namespace
