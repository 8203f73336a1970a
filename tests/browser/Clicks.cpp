#include "tests/browser/Clicks.h"

#include "tests/support/Command.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <sstream>

namespace DrawmereTest {
namespace {

std::vector<std::string> split(const std::string& text, char separator) {
    std::vector<std::string> parts;
    std::istringstream stream(text);
    for (std::string part; std::getline(stream, part, separator);) {
        parts.push_back(part);
    }
    return parts;
}

Click readClick(const std::string& line) {
    constexpr std::size_t fixedParts = 4;
    std::vector<std::string> parts = split(line, '\t');
    const std::size_t count = parts.size();
    parts.resize(std::max(count, fixedParts));
    Click click = {parts[0], parts[1], parts[2] == "new"};
    if (count >= fixedParts) {
        click.scale = std::stod(parts[3]);
        click.texts.assign(parts.begin() + fixedParts, parts.end());
    }
    return click;
}

} // namespace

bool Click::sees(const std::string& text) const {
    return std::find(texts.begin(), texts.end(), text) != texts.end();
}

std::vector<Click> followLinks(const std::string& file, const std::vector<std::string>& numbers) {
    std::vector<std::string> words = {TEST_SOURCE_DIR "/browser/follow-links", file};
    words.insert(words.end(), numbers.begin(), numbers.end());
    const CommandResult result = runCommand(words);
    EXPECT_EQ(result.status, 0) << result.output;
    std::vector<Click> clicks;
    for (const std::string& line : split(result.output, '\n')) {
        clicks.push_back(readClick(line));
    }
    return clicks;
}

} // namespace DrawmereTest
