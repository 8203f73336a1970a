#include "tests/structure/IncludeRule.h"
#include "tests/structure/SourceTree.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

std::string judge(std::string_view file, std::string_view target) {
    return findIncludeFault(file, {std::string(target), /*quoted=*/true});
}

std::string judgeSystem(std::string_view file, std::string_view target) {
    return findIncludeFault(file, {std::string(target), /*quoted=*/false});
}

std::string findFault(const std::string& file, const IncludeLine& include) {
    if (std::string fault = findIncludeFault(file, include); !fault.empty()) {
        return fault;
    }
    const bool found =
        !include.quoted || isFile(include.target) || isFile("include/" + include.target);
    return found ? "" : "no such header, seen from the root or from include/";
}

std::vector<std::string> findFaultsOfFile(const std::string& file) {
    std::vector<std::string> faults;
    for (const std::string& line : readLines(file)) {
        const auto include = readInclude(line);
        const std::string fault = include ? findFault(file, *include) : "";
        if (!fault.empty()) {
            faults.push_back(line + ": " + fault);
        }
    }
    return faults;
}

struct JudgedInclude {
    std::string_view file;
    std::string_view target;
};

constexpr JudgedInclude allowedIncludes[] = {
    {"foundation/common/MoxUri.cpp", "foundation/common/MoxUri.h"},
    {"foundation/names/SVGName.h", "foundation/common/MoxName.h"},
    {"foundation/common/MoxName.h", "DrawmereExport.h"},
    {"include/SVGPageUri.h", "foundation/common/MoxUri.h"},
    {"include/Drawmere.h", "SVGPageUri.h"},
    {"config/SVGConfig.cpp", "SVGConfig.h"},
    {"config/SVGConfig.cpp", "frontend/DrawmereError.h"},
    {"frontend/DrawmereError.h", "foundation/common/MoxError.h"},
    {"frontend/DrawmereError.cpp", "config/SVGErrorTable.h"},
    {"tree/SVGTreeManager.cpp", "state/SVGGroupManager.h"},
    {"state/SVGGroupManager.cpp", "tree/SVGTreeManager.h"},
    {"fonts/SVGFontManager.cpp", "path/SVGDrawElement.h"},
    {"draw/DrawmereImpl.h", "post/SVGOptimizer.h"},
    {"frontend/Drawmere.cpp", "draw/DrawmereImpl.h"},
};

constexpr JudgedInclude refusedIncludes[] = {
    {"foundation/common/MoxUri.cpp", "config/SVGFileBook.h"},
    {"foundation/common/MoxUri.cpp", "SVGConfig.h"},
    {"foundation/common/MoxUri.cpp", "frontend/DrawmereError.h"},
    {"foundation/common/MoxUri.cpp", "MoxUri.h"},
    {"include/Drawmere.h", "draw/DrawmereImpl.h"},
    {"include/SVGFont.h", "foundation/fontservice/FontFace.h"},
    {"include/SVGConfig.h", "frontend/DrawmereError.h"},
    {"config/SVGConfig.cpp", "tree/SVGTreeManager.h"},
    {"config/SVGConfig.cpp", "frontend/Drawmere.h"},
    {"frontend/DrawmereError.h", "config/SVGErrorTable.h"},
    {"tree/SVGTreeManager.h", "state/SVGGroupManager.h"},
    {"state/SVGGroupManager.h", "tree/SVGTreeManager.h"},
    {"tree/SVGTreeManager.cpp", "refs/SVGReferenceId.h"},
    {"path/SVGPathManager.cpp", "fonts/SVGFontManager.h"},
    {"post/SVGOptimizer.cpp", "draw/DrawmereImpl.h"},
    {"draw/DrawmereImpl.cpp", "frontend/Drawmere.h"},
    {"draw/DrawmereImpl.cpp", "tests/support/SvgPage.h"},
    {"draw/DrawmereImpl.cpp", "../tree/SVGTreeManager.h"},
};

TEST(IncludeRule, ReadsBothFormsOfAnIncludeLine) {
    const auto quoted = readInclude("  #  include \"tree/SVGElement.h\" // why");
    ASSERT_TRUE(quoted);
    EXPECT_EQ("tree/SVGElement.h", quoted->target);
    EXPECT_TRUE(quoted->quoted);
    const auto angled = readInclude("#include <zlib.h>");
    ASSERT_TRUE(angled);
    EXPECT_EQ("zlib.h", angled->target);
    EXPECT_FALSE(angled->quoted);
}

TEST(IncludeRule, TakesNoOtherLineForAnInclude) {
    for (const char* line :
         {"", "#", "#pragma once", "// #include \"a.h\"", "include", "#include X"}) {
        EXPECT_FALSE(readInclude(line)) << line;
    }
}

TEST(IncludeRule, AllowsWhatPointsDown) {
    for (const JudgedInclude& row : allowedIncludes) {
        EXPECT_EQ("", judge(row.file, row.target)) << row.file << " includes " << row.target;
    }
}

TEST(IncludeRule, RefusesWhatPointsUpOrAside) {
    for (const JudgedInclude& row : refusedIncludes) {
        EXPECT_NE("", judge(row.file, row.target)) << row.file << " includes " << row.target;
    }
}

TEST(IncludeRule, OnlyTheZipStreamSeesZlib) {
    EXPECT_EQ("", judgeSystem("config/SVGZip.cpp", "zlib.h"));
    EXPECT_NE("", judgeSystem("config/SVGZip.h", "zlib.h"));
    EXPECT_NE("", judgeSystem("foundation/common/MoxMemStream.cpp", "zlib.h"));
}

TEST(IncludeRule, OnlyTheFoundationSeesFontAndRasterLibraries) {
    for (const char* header : {"ft2build.h", "png.h", "jpeglib.h", "uriparser/Uri.h", "hb-ft.h"}) {
        EXPECT_EQ("", judgeSystem("foundation/fontservice/FontFace.cpp", header)) << header;
        EXPECT_NE("", judgeSystem("fonts/SVGFontManager.cpp", header)) << header;
        EXPECT_NE("", judgeSystem("include/SVGFont.h", header)) << header;
    }
}

TEST(IncludeRule, EveryIncludeOfTheLibraryKeepsTheDirection) {
    std::size_t read = 0;
    for (const std::string& folder : libraryFolders) {
        for (const std::string& file : findFiles(folder, {".h", ".cpp", ".def"})) {
            ++read;
            for (const std::string& fault : findFaultsOfFile(file)) {
                ADD_FAILURE() << file << ": " << fault;
            }
        }
    }
    EXPECT_GT(read, 50U) << "the sources were not found";
}

} // namespace
} // namespace DrawmereTest
