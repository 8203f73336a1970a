#include "foundation/common/MoxTempFile.h"

#include "tests/support/OpenFiles.h"
#include "tests/support/TempDir.h"
#include "tests/support/TempVariable.h"

#include <gtest/gtest.h>

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

using DrawmereTest::countOpenFiles;
using DrawmereTest::cutOpenFiles;
using DrawmereTest::TempDir;
using DrawmereTest::TempVariable;
using MoxCommonNS::MoxPtr;
using MoxCommonNS::MoxTempFile;

std::string read(const MoxTempFile& file, std::uint64_t offset, std::size_t count) {
    std::string bytes(count, '?');
    return file.read(offset, bytes.data(), count) ? bytes : "nothing";
}

TEST(MoxTempFile, GivesBackWhatWasAppended) {
    const TempDir directory;
    const MoxPtr<MoxTempFile> file = MoxTempFile::make(directory.path());
    ASSERT_TRUE(file);
    EXPECT_TRUE(file->append("abc", 3));
    EXPECT_TRUE(file->append("", 0));
    EXPECT_TRUE(file->append("defg", 4));
    EXPECT_EQ(file->getSize(), 7U);
    EXPECT_EQ(read(*file, 0, 7), "abcdefg");
    EXPECT_EQ(read(*file, 2, 3), "cde");
    EXPECT_EQ(read(*file, 7, 0), "");
    EXPECT_EQ(read(*file, 5, 3), "nothing");
}

TEST(MoxTempFile, LeavesNothingInTheDirectory) {
    const TempDir directory;
    {
        const MoxPtr<MoxTempFile> file = MoxTempFile::make(directory.path());
        EXPECT_TRUE(file->append("abc", 3));
        EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
        EXPECT_EQ(countOpenFiles(directory.path()), 1);
    }
    EXPECT_EQ(countOpenFiles(directory.path()), 0);
}

TEST(MoxTempFile, EitherWayNobodyElseCanOpenIt) {
    const TempDir directory;
    for (const auto open : {MoxTempFile::openUnnamed, MoxTempFile::openUnlinked}) {
        const int descriptor = open(directory.path());
        if (descriptor < 0 && open == MoxTempFile::openUnnamed) {
            continue; // no file system for it
        }
        ASSERT_GE(descriptor, 0);
        struct stat state = {};
        EXPECT_EQ(fstat(descriptor, &state), 0);
        EXPECT_EQ(state.st_mode & 0777U, 0600U);
        EXPECT_EQ(state.st_nlink, 0U);
        EXPECT_NE(fcntl(descriptor, F_GETFD) & FD_CLOEXEC, 0);
        EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
        close(descriptor);
    }
}

TEST(MoxTempFile, NeedsADirectory) {
    const TempDir directory;
    directory.write("file", "");
    EXPECT_FALSE(MoxTempFile::make(directory.path("missing")));
    EXPECT_FALSE(MoxTempFile::make(directory.path("file")));
    EXPECT_FALSE(MoxTempFile::make("/proc/self"));
}

TEST(MoxTempFile, LeavesHalfOfTheDescriptorsToOthers) {
    const TempDir directory;
    rlimit before = {};
    getrlimit(RLIMIT_NOFILE, &before);
    std::vector<MoxPtr<MoxTempFile>> files;
    const rlimit limit = {.rlim_cur = 60, .rlim_max = before.rlim_max};
    setrlimit(RLIMIT_NOFILE, &limit);
    while (files.empty() || files.back()) {
        files.push_back(MoxTempFile::make(directory.path()));
    }
    setrlimit(RLIMIT_NOFILE, &before);
    files.pop_back();
    EXPECT_LE(files.size(), 30U - 3);
    EXPECT_EQ(countOpenFiles(directory.path()), static_cast<int>(files.size()));
}

TEST(MoxTempFile, GoesWhereTheEnvironmentSays) {
    const std::pair<const char*, const char*> rows[] = {
        {"/some/where", "/some/where"}, {"", "/tmp"}, {nullptr, "/tmp"}};
    for (const auto& [value, expected] : rows) {
        const TempVariable variable(value);
        EXPECT_EQ(MoxTempFile::getDirectory(), expected);
    }
}

/// Lets no file grow beyond `size`, and a write that tries it end the process.
void limitFiles(rlim_t size) {
    rlimit limit = {};
    getrlimit(RLIMIT_FSIZE, &limit);
    limit.rlim_cur = size;
    setrlimit(RLIMIT_FSIZE, &limit);
}

TEST(MoxTempFile, StaysBelowTheLimitForFilesWithoutTryingIt) {
    const TempDir directory;
    const MoxPtr<MoxTempFile> file = MoxTempFile::make(directory.path());
    rlimit before = {};
    getrlimit(RLIMIT_FSIZE, &before);
    limitFiles(8);
    const bool isTaken = file->append("12345678", 8); // a test's own output is a file, too
    const bool isRefused = !file->append("9", 1);
    setrlimit(RLIMIT_FSIZE, &before);
    EXPECT_TRUE(isTaken);
    EXPECT_TRUE(isRefused);
    EXPECT_FALSE(file->append("9", 1)); // full is full
    EXPECT_EQ(file->getSize(), 8U);
    EXPECT_EQ(read(*file, 0, 8), "12345678");
}

TEST(MoxTempFile, AForkMayReadButNotAppend) {
    const TempDir directory;
    const MoxPtr<MoxTempFile> file = MoxTempFile::make(directory.path());
    EXPECT_TRUE(file->append("abc", 3));
    const pid_t child = fork();
    if (child == 0) {
        const bool isRight = !file->append("xyz", 3) && read(*file, 0, 3) == "abc";
        _exit(isRight ? 0 : 1);
    }
    int status = -1;
    EXPECT_EQ(waitpid(child, &status, 0), child);
    EXPECT_EQ(status, 0);
    EXPECT_TRUE(file->append("def", 3));
    EXPECT_EQ(read(*file, 0, 6), "abcdef");
}

TEST(MoxTempFile, WhatIsGoneCannotBeRead) {
    const TempDir directory;
    const MoxPtr<MoxTempFile> file = MoxTempFile::make(directory.path());
    EXPECT_TRUE(file->append("abcdef", 6));
    cutOpenFiles(directory.path(), 4);
    EXPECT_EQ(read(*file, 0, 4), "abcd");
    EXPECT_EQ(read(*file, 0, 5), "nothing");
}

} // namespace
