// Whatever is called and in whatever order, what is written is a document.
#include "tests/frontend/RandomCalls.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

#include <set>
#include <sstream>
#include <string>
#include <vector>

namespace DrawmereTest {
namespace {

constexpr unsigned seedCount = 40;
constexpr int callCount = 500;

std::string drawAnything(unsigned seed) {
    RandomCalls any(seed);
    std::ostringstream stream;
    SVGConfig config;
    any.configure(config);
    SVGPageUri uri(u"page.svg", any.make<UnicodeString>());
    Drawmere page(&config, &uri);
    any.draw(page, stream, callCount);
    return stream.str();
}

TEST(RandomCalls, EveryDocumentIsWellFormed) {
    for (unsigned seed = 0; seed < seedCount; ++seed) {
        const XmlReading reading = readXml(drawAnything(seed));
        EXPECT_EQ(reading.error, "") << "seed " << seed;
        EXPECT_GT(reading.events.size(), 2U) << "seed " << seed;
    }
}

TEST(RandomCalls, EveryUseLeadsToAnImage) {
    int useCount = 0;
    for (unsigned seed = 0; seed < seedCount; ++seed) {
        std::set<std::string> images;
        std::vector<std::string> uses;
        for (const XmlEvent& event : readXml(drawAnything(seed)).events) {
            if (event.kind == XmlEvent::START && event.name == "image") {
                images.insert("#" + event.attribute("id"));
            } else if (event.kind == XmlEvent::START && event.name == "use") {
                uses.push_back(event.attribute("xlink:href"));
            }
        }
        for (const std::string& use : uses) {
            EXPECT_TRUE(images.contains(use)) << use << ", seed " << seed;
        }
        useCount += static_cast<int>(uses.size());
    }
    EXPECT_GT(useCount, 10);
}

TEST(RandomCalls, TheSameCallsWriteTheSameBytes) {
    EXPECT_EQ(drawAnything(1), drawAnything(1));
    EXPECT_NE(drawAnything(1), drawAnything(2));
}

} // namespace
} // namespace DrawmereTest
