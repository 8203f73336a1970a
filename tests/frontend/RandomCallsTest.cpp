// Whatever is called and in whatever order, what is written is a document.
#include "tests/support/RandomRun.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

namespace DrawmereTest {
namespace {

constexpr unsigned seedCount = 40;
constexpr int callCount = 500;

std::vector<std::string> drawAnything(unsigned seed, RandomCalls::Temper temper = RandomCalls::WILD,
                                      bool unpacks = false) {
    RandomCalls calls(seed, temper);
    calls.unpacks = unpacks;
    RandomRun run(calls);
    return run.draw(callCount);
}

TEST(RandomCalls, EveryDocumentIsWellFormed) {
    for (const auto temper : {RandomCalls::WILD, RandomCalls::TAME}) {
        std::size_t count = 0;
        for (unsigned seed = 0; seed < seedCount; ++seed) {
            for (const std::string& document : drawAnything(seed, temper)) {
                const XmlReading reading = readXml(document);
                EXPECT_EQ(reading.error, "") << "seed " << seed;
                count += reading.events.size();
            }
        }
        EXPECT_GT(count, seedCount * 10);
    }
}

TEST(RandomCalls, PackingIsNotSeen) {
    for (const auto temper : {RandomCalls::WILD, RandomCalls::TAME, RandomCalls::ORDERLY}) {
        for (unsigned seed = 0; seed < seedCount; ++seed) {
            EXPECT_EQ(drawAnything(seed, temper), drawAnything(seed, temper, /*unpacks=*/true))
                << "seed " << seed;
        }
    }
}

/// The images that a document stores, and those that it shows: a use within `defs` is never seen.
struct StoredImages {
    explicit StoredImages(const XmlReading& reading) {
        bool inDefs = false;
        for (const XmlEvent& event : reading.events) {
            const bool isStart = event.kind == XmlEvent::START;
            if (event.name == "defs") {
                inDefs = isStart;
            } else if (isStart && event.name == "image") {
                stored.insert("#" + event.attribute("id"));
            } else if (isStart && event.name == "use" && !inDefs) {
                shown.push_back(event.attribute("xlink:href"));
            }
        }
    }

    std::set<std::string> stored;
    std::vector<std::string> shown;
};

TEST(RandomCalls, EveryImageThatIsShownIsStored) {
    std::size_t count = 0;
    for (unsigned seed = 0; seed < seedCount; ++seed) {
        for (const std::string& document : drawAnything(seed)) {
            const StoredImages images(readXml(document));
            for (const std::string& reference : images.shown) {
                EXPECT_TRUE(images.stored.contains(reference)) << reference << ", seed " << seed;
            }
            count += images.shown.size();
        }
    }
    EXPECT_GT(count, 0U);
}

TEST(RandomCalls, TheSameCallsWriteTheSameBytes) {
    EXPECT_EQ(drawAnything(1), drawAnything(1));
    EXPECT_NE(drawAnything(1), drawAnything(2));
}

} // namespace
} // namespace DrawmereTest
