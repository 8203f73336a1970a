// Whatever is called and in whatever order, what is written is a document.
#include "tests/frontend/RandomCalls.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

#include <sstream>
#include <string>

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

TEST(RandomCalls, TheSameCallsWriteTheSameBytes) {
    EXPECT_EQ(drawAnything(1), drawAnything(1));
    EXPECT_NE(drawAnything(1), drawAnything(2));
}

} // namespace
} // namespace DrawmereTest
