// Writes fail at every place there is: it is told, what was written before stays, and the next run
// is as good as ever.
#include "tests/support/WholeRun.h"

#include <gtest/gtest.h>

#include <csignal>
#include <sys/resource.h>

namespace DrawmereTest {
namespace {

constexpr RunOptions plainStream = {
    .name = "plain", .profile = SVGConfig::SVGTYPE_FULL, .output = RunOptions::STREAM};
constexpr RunOptions zippedStream = {.name = "zipped",
                                     .profile = SVGConfig::SVGTYPE_BASIC,
                                     .output = RunOptions::STREAM,
                                     .gzip = true};
constexpr RunOptions convertedStream = {.name = "converted",
                                        .profile = SVGConfig::SVGTYPE_PLAZMIC,
                                        .output = RunOptions::STREAM,
                                        .encoding = u"UTF-16"};

/// Takes what is written, up to one write that fails.
class FaultyBuffer : public std::streambuf {
public:
    enum Fault { REFUSES, TAKES_HALF, THROWS, REFUSES_ONCE };

    static constexpr Fault faults[] = {REFUSES, TAKES_HALF, THROWS, REFUSES_ONCE};

    FaultyBuffer(Fault kind, int number) : fault(kind), faulty(number) {}

    std::string taken;
    int writes = 0;

protected:
    std::streamsize xsputn(const char* bytes, std::streamsize count) override {
        const std::streamsize takes = isGood() ? count : fault == TAKES_HALF ? count / 2 : 0;
        taken.append(bytes, static_cast<std::size_t>(takes));
        return takes;
    }

    int_type overflow(int_type c) override {
        const char byte = traits_type::to_char_type(c);
        return xsputn(&byte, 1) == 1 ? c : traits_type::eof();
    }

    int sync() override { return isGood() ? 0 : -1; }

private:
    bool isGood() {
        const int number = writes++;
        const bool isBad = fault == REFUSES_ONCE ? number == faulty : number >= faulty;
        if (isBad && fault == THROWS) {
            throw std::length_error("full");
        }
        return !isBad;
    }

    Fault fault;
    int faulty;
};

RunOutcome runInto(std::streambuf& buffer, const RunOptions& options, bool throws) {
    std::ostream stream(&buffer);
    if (throws) {
        stream.exceptions(std::ios::badbit | std::ios::failbit);
    }
    WholeRun run(options, /*stopsAtErrors=*/false);
    run.draw(stream);
    return run.collect();
}

/// Lets each write fail in turn. Returns: how many there are.
int checkStream(const RunOptions& options, FaultyBuffer::Fault fault, bool throws) {
    constexpr int never = 1 << 30;
    FaultyBuffer whole(FaultyBuffer::REFUSES, never);
    EXPECT_TRUE(runInto(whole, options, throws).thrown.empty());
    for (int number = 0; number < whole.writes; ++number) {
        SCOPED_TRACE(std::string(options.name) + ", fault " + std::to_string(fault) + ", write " +
                     std::to_string(number) + " of " + std::to_string(whole.writes));
        FaultyBuffer buffer(fault, number);
        const RunOutcome outcome = runInto(buffer, options, throws);
        const bool isTold = outcome.thrown == std::set<int>{16414};
        EXPECT_TRUE(isTold || (throws && !outcome.others.empty()));
        EXPECT_TRUE(throws || outcome.others.empty()) << outcome.others;
        EXPECT_TRUE(whole.taken.starts_with(buffer.taken));
    }
    FaultyBuffer next(FaultyBuffer::REFUSES, never);
    runInto(next, options, throws);
    EXPECT_EQ(next.taken, whole.taken);
    return whole.writes;
}

TEST(WriteFaults, EachWriteToTheCallersStreamThatFailsIsTold) {
    int count = 0;
    for (const RunOptions* options : {&plainStream, &zippedStream, &convertedStream}) {
        for (const FaultyBuffer::Fault fault : FaultyBuffer::faults) {
            count += checkStream(*options, fault, /*throws=*/false);
            count += checkStream(*options, fault, /*throws=*/true);
        }
    }
    RecordProperty("writes", count);
}

/// Lets no file of this process grow beyond a size.
class FileSizeLimit {
public:
    explicit FileSizeLimit(std::size_t size) : handler(std::signal(SIGXFSZ, SIG_IGN)) {
        getrlimit(RLIMIT_FSIZE, &before);
        const rlimit limit = {.rlim_cur = size, .rlim_max = before.rlim_max};
        setrlimit(RLIMIT_FSIZE, &limit);
    }

    FileSizeLimit(const FileSizeLimit&) = delete;
    FileSizeLimit& operator=(const FileSizeLimit&) = delete;

    ~FileSizeLimit() {
        setrlimit(RLIMIT_FSIZE, &before);
        std::signal(SIGXFSZ, handler);
    }

private:
    rlimit before = {};
    void (*handler)(int);
};

using Files = std::map<std::string, std::string>;

RunOutcome runIntoFiles(const RunOptions& options, std::size_t limit) {
    std::ostream none(nullptr);
    WholeRun run(options, /*stopsAtErrors=*/false);
    {
        const FileSizeLimit noMore(limit);
        run.draw(none);
    }
    return run.collect();
}

/// Tells whether each file is the one that there should be, or its beginning.
bool areBeginnings(const Files& files, const Files& whole) {
    return std::ranges::all_of(files, [&whole](const auto& file) {
        const auto place = whole.find(file.first);
        return place != whole.end() && place->second.starts_with(file.second);
    });
}

std::size_t findLargest(const Files& files, bool isImage) {
    std::size_t largest = 0;
    for (const auto& [name, bytes] : files) {
        largest = std::max(largest, name.starts_with("images/") == isImage ? bytes.size() : 0);
    }
    return largest;
}

void checkFiles(const RunOptions& options) {
    constexpr std::size_t step = 509;
    constexpr std::size_t enough = 1U << 20U;
    const Files whole = runIntoFiles(options, enough).files;
    const std::size_t largestImage = findLargest(whole, /*isImage=*/true);
    const std::size_t largestPage = findLargest(whole, /*isImage=*/false);
    for (std::size_t limit = 0; limit < largestPage + step; limit += step) {
        SCOPED_TRACE(std::string(options.name) + ", " + std::to_string(limit) + " bytes");
        const RunOutcome outcome = runIntoFiles(options, limit);
        EXPECT_EQ(outcome.others, "");
        EXPECT_EQ(outcome.thrown, limit < largestPage ? std::set<int>{16414} : std::set<int>());
        EXPECT_EQ(outcome.queued, limit < largestImage ? std::set<int>{16931} : std::set<int>());
        EXPECT_TRUE(areBeginnings(outcome.files, whole));
    }
    EXPECT_EQ(runIntoFiles(options, enough).files, whole);
}

TEST(WriteFaults, AFullDiskIsToldOfPagesAndOfCopiesOfImages) {
    checkFiles({.name = "pages",
                .profile = SVGConfig::SVGTYPE_FULL,
                .output = RunOptions::PAGES,
                .copiesImages = true});
    checkFiles({.name = "single file",
                .profile = SVGConfig::SVGTYPE_FULL,
                .output = RunOptions::SINGLE_FILE,
                .gzip = true});
}

TEST(WriteFaults, ADirectoryThatTakesNoFilesIsTold) {
    for (const bool singleFile : {false, true}) {
        SVGConfig config;
        config.streamOutput = false;
        config.singleFile = singleFile;
        config.checkPaths = true; // it is there
        SVGPageUri uri(u"/proc/self/page.svg");
        Drawmere page(&config, &uri);
        page.initRootSvg(uri.getText());
        std::set<int> told;
        for (const auto end : {&Drawmere::finishRootSvg, &Drawmere::finish}) {
            try {
                (page.*end)();
            } catch (const MoxError& error) {
                told.insert(error.getCode());
            }
        }
        EXPECT_EQ(told, std::set<int>{16414});
    }
}

} // namespace
} // namespace DrawmereTest
