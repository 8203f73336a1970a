// Bytes to drawing calls, in every profile and every form of output: what is written is a
// well-formed document, all that the library itself refers to is there, and the tree says the same
// as its text.
#include "tests/fuzz/References.h"
#include "tests/fuzz/Require.h"
#include "tests/fuzz/TreeReading.h"
#include "tests/support/RandomRun.h"

using namespace DrawmereTest;

namespace {

constexpr int callCount = 2000;

void checkDocument(const std::string& document, const RandomCalls& calls, bool isSmallDevice) {
    const XmlReading reading = readXml(document);
    require(reading.error.empty(), reading.error);
    const std::string fault =
        References(reading, isSmallDevice).findFault(calls.madeTexts, calls.lostIds);
    require(fault.empty(), fault);
}

std::string save(const MoxDocument& document) {
    std::ostringstream stream;
    document.save(u"", u"", stream, nullptr, u"", u"");
    return stream.str();
}

void checkTree(const MoxDocument& document) {
    const std::string text = save(document);
    const XmlReading reading = readXml(text);
    require(reading.error.empty(), reading.error);
    const std::string difference = findDifference(readTree(document), reading.events);
    require(difference.empty(), difference);
    // To read the tree has made nodes of all that was packed.
    require(save(document) == text, "unpacked, the tree has another text");
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    RandomCalls calls(inputOf(data, size));
    RandomRun run(calls);
    const bool isSmallDevice = run.config.wispMode && run.config.svgType == SVGConfig::SVGTYPE_TINY;
    for (const std::string& document : run.draw(callCount)) {
        checkDocument(document, calls, isSmallDevice);
    }
    for (const auto& [page, document] : run.drawmere.documents) {
        checkTree(*document);
    }
    return 0;
}
