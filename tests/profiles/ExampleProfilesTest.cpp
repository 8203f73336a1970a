// Every example in every profile, with and without the small-device mode, plain and compressed.
#include "SVGConfig.h"

#include "tests/support/Command.h"
#include "tests/support/Gunzip.h"
#include "tests/support/TempDir.h"
#include "tests/support/XmlReader.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <map>
#include <regex>
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
    const char* dtd;
};

constexpr char fullDtd[] = "-//W3C//DTD SVG 1.1//EN";

constexpr Profile profiles[] = {
    {"Full", SVGConfig::SVGTYPE_FULL, "(none)", fullDtd},
    {"Basic", SVGConfig::SVGTYPE_BASIC, "basic", "-//W3C//DTD SVG 1.1 Basic//EN"},
    {"Tiny", SVGConfig::SVGTYPE_TINY, "tiny", "-//W3C//DTD SVG 1.1 Tiny//EN"},
    {"Wisp", SVGConfig::SVGTYPE_WISP, "(none)", fullDtd},
    {"Plazmic", SVGConfig::SVGTYPE_PLAZMIC, "(none)", fullDtd},
};

/// What makes documents invalid on purpose: a complaint of the validator in its own words.
struct KnownFault {
    SVGConfig::SVGTYPE profile; ///< `everyProfile` for all of them
    const char* start;
    const char* rest; ///< a pattern for what follows
};

constexpr SVGConfig::SVGTYPE everyProfile = static_cast<SVGConfig::SVGTYPE>(-1);

constexpr KnownFault knownFaults[] = {
    // Every root states the font defaults, though Tiny has no word for one of them.
    {SVGConfig::SVGTYPE_TINY,
     "element svg: validity error : No declaration for attribute font-stretch of element svg", ""},
    // A glyph for lines that run down says so, though Tiny has no words for it either.
    {SVGConfig::SVGTYPE_TINY,
     "element glyph: validity error : No declaration for attribute vert-adv-y of element glyph",
     ""},
    {SVGConfig::SVGTYPE_TINY,
     "element glyph: validity error : No declaration for attribute orientation of element glyph",
     ""},
    // An embedded image is used in a frame, an `svg`; the small-device mode takes the frame away.
    {SVGConfig::SVGTYPE_TINY,
     "element g: validity error : Element g content does not follow the DTD, expecting (desc | "
     "title | metadata | animate | set | animateMotion | animateColor | animateTransform | g | defs "
     "| use | switch | image | path | rect | circle | line | ellipse | polyline | polygon | text | a "
     "| font | font-face | foreignObject)*, got (svg)",
     ""},
    // An embedded font is its own source.
    {everyProfile,
     "element font-face: validity error : Element font-face content does not follow the DTD, "
     "expecting ((font-face-src , (desc | title | metadata)*) | ((desc | title | metadata)+ , "
     "font-face-src , (desc | title | metadata)*)), got ",
     ""},
    // A clip in a clip is a group there.
    {everyProfile,
     "element clipPath: validity error : Element clipPath content does not follow the DTD, "
     "expecting (desc | title | metadata | animate | set | animateMotion | animateColor | "
     "animateTransform | use | path | rect | circle | line | ellipse | polyline | polygon | "
     "text)*, got (",
     "((path|rect|circle|line|ellipse|polyline|polygon|text|g) ?)*\\)"},
};

struct ExampleRun {
    std::string example;
    Profile profile;
    bool wispMode;
};

Lines splitLines(const std::string& text) {
    std::istringstream stream(text);
    Lines lines;
    for (std::string line; std::getline(stream, line);) {
        lines.push_back(line);
    }
    return lines;
}

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

bool isKnown(const std::string& fault, const Profile& profile) {
    return std::any_of(std::begin(knownFaults), std::end(knownFaults), [&](const auto& known) {
        return (known.profile == everyProfile || known.profile == profile.number) &&
               fault.starts_with(known.start) &&
               std::regex_match(fault.substr(std::strlen(known.start)), std::regex(known.rest));
    });
}

/// Returns: the complaint in a line of the validator, "FILE:LINE: COMPLAINT"; empty for its closing
/// words on a document.
std::string findFault(const std::string& line, const Lines& paths) {
    const auto path = std::find_if(paths.begin(), paths.end(), [&line](const auto& name) {
        return line.starts_with(name + ":");
    });
    if (path != paths.end()) {
        return line.substr(line.find(": ", path->size()) + 2);
    }
    return line.starts_with("Document ") ? "" : line;
}

CommandResult callValidator(const Lines& paths, const Profile& profile) {
    Lines words = {"xmllint", "--nonet", "--noout", "--huge", "--dtdvalidfpi", profile.dtd};
    words.insert(words.end(), paths.begin(), paths.end());
    return runCommand(words);
}

/// Returns: what the validator says about the documents, without what is known.
Lines validate(const Lines& paths, const Profile& profile) {
    const CommandResult result = callValidator(paths, profile);
    Lines faults;
    bool isAnyKnown = false;
    for (const std::string& line : splitLines(result.output)) {
        const std::string fault = findFault(line, paths);
        if (isKnown(fault, profile)) {
            isAnyKnown = true;
        } else if (!fault.empty()) {
            faults.push_back(line);
        }
    }
    // With complaints or without, the validator has read the documents to their ends.
    EXPECT_EQ(result.status != 0, isAnyKnown || !faults.empty()) << result.output;
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
        documents.push_back(plainDirectory.path(name));
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
    const CommandResult result = callValidator({directory.path("hello.svg")}, tiny);
    EXPECT_NE(result.output.find(knownFaults[0].start), std::string::npos) << result.output;
}

} // namespace
} // namespace DrawmereTest
