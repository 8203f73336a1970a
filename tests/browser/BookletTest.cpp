// The links of the example booklet, as a reader of it meets them. Their labels say where they lead.
#include "tests/browser/Clicks.h"
#include "tests/support/Command.h"
#include "tests/support/TempDir.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

constexpr int pageCount = 200;

/// Returns: what follows the last blank; the number of a page at the end of a label.
std::string lastWord(const std::string& text) { return text.substr(text.rfind(' ') + 1); }

std::string pageFile(int number) {
    const std::string digits = std::to_string(number);
    return "booklet" + std::string(3 - digits.size(), '0') + digits + ".svg";
}

/// Each page has its number at its foot.
void expectArrival(const Click& click) {
    EXPECT_TRUE(click.sees(lastWord(click.label))) << click.label << " leads to " << click.where;
}

struct Link {
    std::string label;
    std::string target;
};

/// Returns: all links of a page that is no close-up of itself.
std::vector<Link> readLinks(const std::string& document) {
    const XmlReading reading = readXml(document);
    EXPECT_EQ(reading.error, "");
    std::vector<Link> links;
    bool isOpen = false;
    for (const XmlEvent& event : reading.events) {
        if (event.name == "a") {
            isOpen = event.kind == XmlEvent::START;
            if (isOpen) {
                links.push_back({"", event.attribute("xlink:href")});
            }
        } else if (isOpen) {
            links.back().label += event.text;
        }
    }
    return links;
}

class Booklet : public testing::Test {
protected:
    Booklet() { EXPECT_EQ(runCommand({BOOKLET, directory.path()}).status, 0); }

    std::vector<Click> follow(const std::string& file,
                              const std::vector<std::string>& numbers = {}) const {
        return followLinks(directory.path(file), numbers);
    }

    TempDir directory;
};

TEST_F(Booklet, EveryLinkOfTheContentsArrives) {
    const std::vector<Click> clicks = follow(pageFile(2));
    EXPECT_EQ(clicks.size(), 14U);
    for (const Click& click : clicks) {
        expectArrival(click);
        EXPECT_EQ(click.where, pageFile(std::stoi(lastWord(click.label))));
    }
}

TEST_F(Booklet, LinksOfTheIndexArrive) {
    const std::vector<Click> clicks = follow(pageFile(197), {"0", "7", "19", "20", "39", "40"});
    EXPECT_EQ(clicks.size(), 6U);
    for (const Click& click : clicks) {
        expectArrival(click);
    }
}

TEST_F(Booklet, LinksOfPagesLeadForwardAndBackAndToTheirOwnViews) {
    for (const int number : {3, 194}) {
        const std::vector<Click> clicks = follow(pageFile(number));
        ASSERT_EQ(clicks.size(), 6U);
        EXPECT_EQ(clicks[0].where, pageFile(number) + "#closeup" + std::to_string(number));
        EXPECT_GT(clicks[0].scale, 3 * clicks[1].scale);
        for (std::size_t i = 1; i < clicks.size(); ++i) {
            expectArrival(clicks[i]);
        }
    }
}

TEST_F(Booklet, TheFirstPageLeadsIntoItAndTheLastOneBack) {
    for (const Click& click : follow(pageFile(1))) {
        expectArrival(click);
    }
    const std::vector<Click> clicks = follow(pageFile(pageCount), {"0"});
    ASSERT_EQ(clicks.size(), 1U);
    EXPECT_EQ(clicks[0].where, pageFile(1));
}

TEST_F(Booklet, EveryLinkOfEveryPageNamesTheFileOfThePageOnItsLabel) {
    int count = 0;
    for (int number = 1; number <= pageCount; ++number) {
        for (const Link& link : readLinks(directory.read(pageFile(number)))) {
            if (link.target.starts_with("https:")) {
                continue;
            }
            const bool isCloseUp = link.target == "#closeup" + std::to_string(number);
            EXPECT_TRUE(isCloseUp || link.target == pageFile(std::stoi(lastWord(link.label))))
                << number << ": " << link.label << " leads to " << link.target;
            ++count;
        }
    }
    EXPECT_EQ(count, 192 * 6 + 192 + 5 + 14 + 2 + 1); // lights, index, contents, cover, colophon
}

TEST_F(Booklet, AsOneFileItsLinksShowOnePageAfterTheOther) {
    for (const std::string page : {"#page1", "#page118"}) {
        for (const Click& click : follow("booklet-whole.svg" + page)) {
            if (click.label != "A closer look") {
                expectArrival(click);
            }
        }
    }
}

TEST_F(Booklet, AsAStreamItIsTheSame) {
    EXPECT_EQ(directory.read("booklet-stream.svg"), directory.read("booklet-whole.svg"));
    EXPECT_NE(directory.read("booklet-stream.svg"), "");
}

} // namespace
} // namespace DrawmereTest
