#include "foundation/common/MoxTokenizer.h"

#include <gtest/gtest.h>
#include <string>
#include <vector>

namespace {

using namespace MoxCommonNS;

std::vector<std::string> tokensOf(const UnicodeString& text) {
    MoxTokenizer tokenizer(text);
    std::vector<std::string> tokens;
    for (;;) {
        const UnicodeString token = tokenizer.nextTokenValue(/*parsed=*/false).toString();
        if (token.isEmpty()) {
            return tokens;
        }
        token.toUTF8String(tokens.emplace_back());
    }
}

using Tokens = std::vector<std::string>;

TEST(MoxTokenizer, CutsAtWhiteSpaceAndCommas) {
    EXPECT_EQ(tokensOf(u"1 2\t3\n4\r5,6"), (Tokens{"1", "2", "3", "4", "5", "6"}));
    EXPECT_EQ(tokensOf(u"one"), Tokens{"one"});
}

TEST(MoxTokenizer, SeveralSeparatorsCountAsOne) {
    EXPECT_EQ(tokensOf(u" ,1 , 2,,3  4, "), (Tokens{"1", "2", "3", "4"}));
    EXPECT_EQ(tokensOf(u" , "), Tokens{});
    EXPECT_EQ(tokensOf(u""), Tokens{});
}

TEST(MoxTokenizer, TokenIsAStringUnlessItIsToBeParsed) {
    MoxTokenizer tokenizer(u"1 1 1.5 #f00 word");
    EXPECT_EQ(tokenizer.nextTokenValue(/*parsed=*/false), MoxValue(UnicodeString(u"1")));
    EXPECT_EQ(tokenizer.nextTokenValue(/*parsed=*/true), MoxValue(1));
    EXPECT_EQ(tokenizer.nextTokenValue(/*parsed=*/true), MoxValue(1.5F));
    EXPECT_EQ(tokenizer.nextTokenValue(/*parsed=*/true), MoxValue(MoxColor(255, 0, 0)));
    EXPECT_EQ(tokenizer.nextTokenValue(/*parsed=*/true), MoxValue(UnicodeString(u"word")));
}

TEST(MoxTokenizer, EndIsEmptyHoweverOftenItIsAskedFor) {
    MoxTokenizer tokenizer(u"1");
    tokenizer.nextTokenValue(/*parsed=*/false);
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(tokenizer.nextTokenValue(/*parsed=*/false), MoxValue(UnicodeString()));
        EXPECT_EQ(tokenizer.nextTokenValue(/*parsed=*/true), MoxValue::NULL_VALUE);
        EXPECT_TRUE(tokenizer.nextTokenValue(/*parsed=*/true).toString().isEmpty());
    }
}

TEST(MoxTokenizer, KeepsItsTextWhenTheCallersChanges) {
    UnicodeString text(u"first second");
    MoxTokenizer tokenizer(text);
    text.setTo(u"other");
    EXPECT_EQ(tokenizer.nextTokenValue(/*parsed=*/false).toString(), UnicodeString(u"first"));
}

TEST(MoxTokenizer, BogusTextHasNoTokens) {
    UnicodeString bogus;
    bogus.setToBogus();
    EXPECT_EQ(tokensOf(bogus), Tokens{});
}

} // namespace
