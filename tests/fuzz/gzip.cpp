// What goes into a compressed stream comes out of it again, in whatever pieces it was written.
#include "config/SVGZip.h"
#include "tests/fuzz/Require.h"
#include "tests/support/Choices.h"
#include "tests/support/Gunzip.h"

#include <sstream>

using namespace DrawmereTest;

namespace {

constexpr std::streamoff mostBytes = 300'000;

using Write = void (*)(Choices& choices, std::ostream& stream);

constexpr Write writes[] = {
    [](Choices& choices, std::ostream& stream) {
        stream.put(static_cast<char>(choices.below(256)));
    },
    [](Choices& choices, std::ostream& stream) { stream << choices.takeBytes(choices.below(256)); },
    [](Choices& choices, std::ostream& stream) {
        stream << std::string(choices.below(0x10000), static_cast<char>(choices.below(256)));
    },
    [](Choices& /*choices*/, std::ostream& stream) { stream.flush(); },
    [](Choices& choices, std::ostream& stream) {
        const auto number = choices.number();
        stream.write(reinterpret_cast<const char*>(&number), choices.below(sizeof number + 1));
    },
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Choices choices(inputOf(data, size));
    Choices same = choices;
    std::ostringstream plain;
    std::ostringstream target;
    {
        DrawmereNS::SVGZipStream zip(target);
        while (!choices.isUsedUp() && plain.tellp() < mostBytes) {
            choices.pick(writes)(choices, zip);
            same.pick(writes)(same, plain);
        }
        require(zip.good(), "a write failed");
    }
    require(target.good(), "the target failed");
    require(gunzip(target.str()) == plain.str(), "other bytes come back");
    return 0;
}
