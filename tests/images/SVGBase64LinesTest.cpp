#include "images/SVGBase64Lines.h"

#include "images/SVGBase64.h"

#include <gtest/gtest.h>

#include <memory>
#include <random>

namespace DrawmereTest {
namespace {

using DrawmereNS::SVGBase64;
using DrawmereNS::SVGBase64Lines;

/// Returns: the text of whole lines, made triple by triple.
std::string encodeByTriples(const std::string& bytes) {
    std::string text;
    for (std::size_t i = 0; i < bytes.size(); i += 3) {
        char characters[4];
        SVGBase64::EncodeByteTriple(bytes.data() + i, 3, characters);
        text.append(characters, 4);
        text += (i + 3) % SVGBase64Lines::lineBytes == 0 ? "\n" : "";
    }
    return text;
}

std::string makeLines(std::size_t lines) {
    std::mt19937 random(5);
    std::string bytes(lines * SVGBase64Lines::lineBytes, '\0');
    for (char& byte : bytes) {
        byte = static_cast<char>(random());
    }
    return bytes;
}

/// Returns: the text that a variant makes of `bytes`, from memory that ends with it to memory that
/// ends with the text, so that a checker sees any step beyond them. It leaves the line feeds alone,
/// which stand there before.
std::string encodeBy(SVGBase64Lines::Encoder encoder, const std::string& bytes) {
    const std::size_t lines = bytes.size() / SVGBase64Lines::lineBytes;
    const std::size_t size = lines * SVGBase64Lines::lineSize;
    const auto in = std::make_unique<char[]>(bytes.size());
    const auto out = std::make_unique<char[]>(size);
    bytes.copy(in.get(), bytes.size());
    std::fill_n(out.get(), size, '\n');
    encoder(in.get(), lines, out.get(), SVGBase64Lines::lineSize);
    return {out.get(), size};
}

TEST(SVGBase64Lines, AllVariantsWriteTheTextOfTheTriples) {
    for (const SVGBase64Lines::Variant& variant : SVGBase64Lines::getVariants()) {
        if (!variant.isSupported()) {
            continue;
        }
        for (const std::size_t lines : {0, 1, 2, 3, 1000}) {
            const std::string bytes = makeLines(lines);
            EXPECT_EQ(encodeBy(variant.encode, bytes), encodeByTriples(bytes)) << variant.name;
        }
    }
}

TEST(SVGBase64Lines, AllVariantsKnowEveryCharacterInEveryPlace) {
    for (const SVGBase64Lines::Variant& variant : SVGBase64Lines::getVariants()) {
        for (int value = 0; value < 256 && variant.isSupported(); ++value) {
            std::string bytes(SVGBase64Lines::lineBytes, static_cast<char>(value));
            for (std::size_t i = 0; i < bytes.size(); ++i) {
                bytes[i] = static_cast<char>(static_cast<std::size_t>(bytes[i]) + i * i);
            }
            ASSERT_EQ(encodeBy(variant.encode, bytes), encodeByTriples(bytes)) << variant.name;
        }
    }
}

TEST(SVGBase64Lines, TheLastVariantRunsEverywhere) {
    const SVGBase64Lines::Variant& last = SVGBase64Lines::getVariants().back();
    EXPECT_STREQ(last.name, "plain");
    EXPECT_TRUE(last.isSupported());
}

/// Returns: `text` with `lineEnd` in the place of each line feed.
std::string replaceLineFeeds(const std::string& text, std::string_view lineEnd) {
    std::string result;
    for (const char c : text) {
        result.append(c == '\n' ? lineEnd : std::string_view(&c, 1));
    }
    return result;
}

TEST(SVGBase64Lines, TheChosenVariantEndsLinesAsItIsTold) {
    for (const std::size_t lines : {0, 1, 7}) {
        const std::string bytes = makeLines(lines);
        const std::string text = encodeByTriples(bytes);
        for (const std::string_view lineEnd : {"\n", "&#10;", "", "12345678"}) {
            const std::string expected = replaceLineFeeds(text, lineEnd);
            const auto out = std::make_unique<char[]>(expected.size());
            SVGBase64Lines::encode(bytes.data(), lines, out.get(), lineEnd);
            EXPECT_EQ(std::string_view(out.get(), expected.size()), expected);
        }
    }
}

TEST(SVGBase64Lines, ALineThatIsNotFullHasNoEnd) {
    for (const std::size_t size : {0, 1, 2, 3, 56, 57, 58, 113, 114, 115}) {
        const std::string bytes = makeLines(3).substr(0, size);
        std::string text(DrawmereNS::SVGBase64::CalculateRecquiredEncodeOutputBufferSize(size), 0);
        DrawmereNS::SVGBase64::EncodeBuffer(bytes.data(), size, text.data());
        text.resize(text.find('\0'));
        EXPECT_EQ(SVGBase64Lines::countText(size), text.size());
        const std::string expected = replaceLineFeeds(text, "&#10;");
        const auto out = std::make_unique<char[]>(expected.size());
        const char* const end = SVGBase64Lines::encodeText(bytes.data(), size, out.get(), "&#10;");
        EXPECT_EQ(std::string_view(out.get(), end), expected);
    }
}

} // namespace
} // namespace DrawmereTest
