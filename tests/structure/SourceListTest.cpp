#include "tests/structure/SourceList.h"
#include "tests/structure/SourceTree.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <iterator>
#include <set>

namespace DrawmereTest {
namespace {

using Names = std::vector<std::string>;

struct FolderFiles {
    std::string folder;
    Names names;
};

// All folders, at any depth, that hold files with one of `endings`, with the names of those files.
std::vector<FolderFiles> groupByFolder(const std::string& top, const Names& endings) {
    std::vector<FolderFiles> groups;
    std::set<std::string> seen;
    for (const std::string& file : findFiles(top, endings)) {
        const std::filesystem::path path(file);
        const std::string folder = path.parent_path().generic_string();
        if (seen.insert(folder).second) {
            groups.push_back({folder, {}});
        }
        auto group = std::ranges::find(groups, folder, &FolderFiles::folder);
        group->names.push_back(path.filename().string());
    }
    return groups;
}

Names readFolderList(const std::string& folder, std::string_view command) {
    return readList(readLines(folder + "/CMakeLists.txt"), command);
}

void expectListed(const FolderFiles& files, std::string_view command) {
    for (const std::string& fault :
         findListFaults(readFolderList(files.folder, command), files.names)) {
        ADD_FAILURE() << files.folder << "/CMakeLists.txt: " << fault;
    }
}

bool isExported(const std::string& header) {
    return std::ranges::any_of(readLines(header), [](const std::string& line) {
        return line.find("DRAWMERE_API") != std::string::npos;
    });
}

TEST(SourceList, ReadsTheNamesOfOneCall) {
    const Names lines = {"add(a", ")",    "target_sources(mox PRIVATE", "    A.cpp", "    B.cpp",
                         ")",     "C.cpp"};
    EXPECT_EQ((Names{"A.cpp", "B.cpp"}), readList(lines, "target_sources"));
    EXPECT_EQ(Names{}, readList(lines, "install"));
}

TEST(SourceList, FindsNothingWrongWithASortedFullList) {
    EXPECT_EQ(Names{}, findListFaults({"A.cpp", "B.cpp"}, {"A.cpp", "B.cpp"}));
}

TEST(SourceList, FindsWhatIsMissingTooManyOrOutOfOrder) {
    EXPECT_EQ(Names{"B.cpp is not listed"}, findListFaults({"A.cpp"}, {"A.cpp", "B.cpp"}));
    EXPECT_EQ(Names{"B.cpp is listed but not there"},
              findListFaults({"A.cpp", "B.cpp"}, {"A.cpp"}));
    EXPECT_EQ(Names{"A.cpp stands behind B.cpp"},
              findListFaults({"B.cpp", "A.cpp"}, {"A.cpp", "B.cpp"}));
    EXPECT_EQ(Names{"A.cpp stands behind A.cpp"}, findListFaults({"A.cpp", "A.cpp"}, {"A.cpp"}));
}

TEST(SourceList, EverySourceOfTheLibraryIsListedInOrder) {
    for (const std::string& folder : libraryFolders) {
        for (const FolderFiles& files : groupByFolder(folder, {".cpp"})) {
            expectListed(files, "target_sources");
        }
    }
}

TEST(SourceList, EveryTestIsListedInOrder) {
    for (const std::string& folder : libraryFolders) {
        if (folder != "include") {
            for (const FolderFiles& files : groupByFolder("tests/" + folder, {".cpp"})) {
                expectListed(files, "drawmere_add_test");
            }
        }
    }
}

TEST(SourceList, WhatTestsShareIsListedInOrder) {
    expectListed(groupByFolder("tests/support", {".cpp"}).at(0), "add_library");
    expectListed(groupByFolder("tests/structure", {".cpp"}).at(0), "drawmere_add_plain_test");
}

TEST(SourceList, EveryExportedHeaderIsInstalled) {
    for (const std::string& folder : libraryFolders) {
        for (const FolderFiles& files : groupByFolder(folder, {".h"})) {
            const Names installed = readFolderList(files.folder, "drawmere_install_headers");
            for (const std::string& name : files.names) {
                const bool found = std::ranges::find(installed, name) != installed.end();
                EXPECT_TRUE(found || !isExported(files.folder + "/" + name))
                    << files.folder << "/" << name;
            }
        }
    }
}

TEST(SourceList, InstalledHeadersAreThereAndInOrder) {
    for (const std::string& folder : libraryFolders) {
        for (const FolderFiles& files : groupByFolder(folder, {".h", ".def"})) {
            const Names list = readFolderList(files.folder, "drawmere_install_headers");
            Names there;
            std::ranges::copy_if(files.names, std::back_inserter(there), [&](const auto& name) {
                return std::ranges::find(list, name) != list.end();
            });
            for (const std::string& fault : findListFaults(list, there)) {
                ADD_FAILURE() << files.folder << "/CMakeLists.txt: " << fault;
            }
        }
    }
}

} // namespace
} // namespace DrawmereTest
