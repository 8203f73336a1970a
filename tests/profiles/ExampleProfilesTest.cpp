// Every example in every profile, with and without the small-device mode, plain and compressed.
#include "SVGConfig.h"

#include "tests/support/Command.h"
#include "tests/support/Gunzip.h"
#include "tests/support/SvgValidator.h"
#include "tests/support/TempDir.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

#include <map>
#include <sstream>

namespace DrawmereTest {
namespace {

namespace fs = std::filesystem;

using DrawmereNS::SVGConfig;
using Files = std::map<std::string, std::string>; // names and bytes
using Lines = std::vector<std::string>;

struct Profile {
    const char* name;
    SVGConfig::SVGTYPE number;
    const char* baseProfile; ///< what the root says
};

constexpr Profile profiles[] = {
    {"Full", SVGConfig::SVGTYPE_FULL, "(none)"},       {"Basic", SVGConfig::SVGTYPE_BASIC, "basic"},
    {"Tiny", SVGConfig::SVGTYPE_TINY, "tiny"},         {"Wisp", SVGConfig::SVGTYPE_WISP, "(none)"},
    {"Plazmic", SVGConfig::SVGTYPE_PLAZMIC, "(none)"},
};

struct ExampleRun {
    std::string example;
    Profile profile;
    bool wispMode;
};

Files readFiles(const TempDir& directory) {
    Files files;
    for (const auto& entry : fs::recursive_directory_iterator(directory.path())) {
        const std::string name = fs::relative(entry.path(), directory.path());
        if (entry.is_regular_file()) {
            files[name] = directory.read(name);
        }
    }
    return files;
}

void runExample(const ExampleRun& run, bool gzip, const TempDir& directory) {
    std::vector<std::string> words = {"env", "-C", directory.path()};
    words.push_back("EXAMPLE_PROFILE=" + std::to_string(run.profile.number));
    if (run.wispMode) {
        words.emplace_back("EXAMPLE_WISP_MODE=1");
    }
    if (gzip) {
        words.emplace_back("EXAMPLE_GZIP=1");
    }
    words.push_back(EXAMPLE_DIRECTORY "/" + run.example);
    const CommandResult result = runCommand(words);
    EXPECT_EQ(result.status, 0) << result.output;
}

bool isDocument(const std::string& bytes) { return bytes.starts_with("<?xml"); }

/// Returns: what the validator says about the documents, without what is known.
Lines validate(const std::vector<std::string>& documents, const Profile& profile) {
    const SvgValidator validator(profile.number);
    Lines faults;
    for (const std::string& document : documents) {
        for (const std::string& fault : validator.listFaults(document)) {
            if (!validator.findKnown(fault)) {
                faults.push_back(fault);
            }
        }
    }
    return faults;
}

/// Tells what no document of the small-device mode may have outside its definitions.
std::string findUnflattened(const XmlReading& reading) {
    int definitions = 0;
    for (const XmlEvent& event : reading.events) {
        if (event.kind != XmlEvent::TEXT && event.name == "defs") {
            definitions += event.kind == XmlEvent::START ? 1 : -1;
        }
        if (event.kind != XmlEvent::START || definitions > 0) {
            continue;
        }
        const bool isList =
            event.name == "text" &&
            (event.attribute("x") + event.attribute("y")).find(' ') != std::string::npos;
        if (event.name == "a" || event.name == "use" || isList) {
            return event.name;
        }
    }
    return "";
}

void checkDocument(const std::string& bytes, const ExampleRun& run) {
    const XmlReading reading = readXml(bytes);
    EXPECT_EQ(reading.error, "");
    EXPECT_EQ(reading.element("svg").attribute("baseProfile"), run.profile.baseProfile);
    if (run.wispMode && run.profile.number == SVGConfig::SVGTYPE_TINY) {
        EXPECT_EQ(findUnflattened(reading), "");
    }
}

class ExampleProfiles : public testing::TestWithParam<ExampleRun> {};

std::string nameRun(const testing::TestParamInfo<ExampleRun>& info) {
    return info.param.example + info.param.profile.name + (info.param.wispMode ? "WispMode" : "");
}

std::vector<ExampleRun> listRuns() {
    std::vector<ExampleRun> runs;
    std::istringstream names(EXAMPLE_NAMES);
    for (std::string name; names >> name;) {
        for (const Profile& profile : profiles) {
            runs.push_back({name, profile, false});
            runs.push_back({name, profile, true});
        }
    }
    return runs;
}

TEST_P(ExampleProfiles, WritesValidDocumentsPlainAndCompressed) {
    const ExampleRun& run = GetParam();
    const TempDir plainDirectory;
    const TempDir zippedDirectory;
    runExample(run, /*gzip=*/false, plainDirectory);
    runExample(run, /*gzip=*/true, zippedDirectory);
    const Files plain = readFiles(plainDirectory);
    Files zipped = readFiles(zippedDirectory);
    Lines documents;
    Lines gzipTest = {"sh", "-c", "for f; do gzip -t <\"$f\" || exit 1; done", "sh"};
    for (const auto& [name, bytes] : plain) {
        SCOPED_TRACE(name);
        if (!isDocument(bytes)) {
            EXPECT_TRUE(zipped[name] == bytes);
            continue;
        }
        checkDocument(bytes, run);
        EXPECT_TRUE(gunzip(zipped[name]) == bytes);
        documents.push_back(bytes);
        gzipTest.push_back(zippedDirectory.path(name));
    }
    EXPECT_EQ(plain.size(), zipped.size());
    ASSERT_FALSE(documents.empty());
    const CommandResult intact = runCommand(gzipTest);
    EXPECT_EQ(intact.status, 0) << intact.output;
    EXPECT_EQ(validate(documents, run.profile), Lines());
}

INSTANTIATE_TEST_SUITE_P(Examples, ExampleProfiles, testing::ValuesIn(listRuns()), nameRun);

// On purpose: `font-stretch` stands on every root, which makes every Tiny document invalid.
TEST(ExampleFaults, FontStretchMakesATinyDocumentInvalid) {
    const Profile& tiny = profiles[2];
    const TempDir directory;
    runExample({"hello", tiny, /*wispMode=*/false}, /*gzip=*/false, directory);
    EXPECT_EQ(SvgValidator(tiny.number).listFaults(directory.read("hello.svg")),
              Lines{"No declaration for attribute font-stretch of element svg"});
}

} // namespace
} // namespace DrawmereTest
