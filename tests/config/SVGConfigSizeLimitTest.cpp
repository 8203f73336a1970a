#include "SVGConfig.h"

#include "tests/support/TempDir.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

#include <csignal>
#include <filesystem>

#include <sys/resource.h> // limits of a process are no part of standard C++

using namespace DrawmereNS;
using DrawmereTest::TempDir;
using DrawmereTest::utf8;

namespace {

constexpr char missingText[] = "16935 There is no alternative file for the maximum size error.\n";

std::string tooLargeText(const std::string& page) {
    return "17320 The size of the output file exceeded the limitation of a specified maximum. "
           "(page no = " +
           page + ")\n";
}

/// A directory with an output file and a substitute for it, and the limit of one kilobyte.
class SizeLimit : public testing::Test {
protected:
    SizeLimit() {
        config.wispMode = true;
        allow("1");
        dir.write("error.svg", "substitute");
    }

    void allow(const std::string& kilobytes, const std::string& substitute = "error.svg") {
        config.wispOptions =
            u"maxsize=" + UnicodeString::fromUTF8(kilobytes) + u",errorsvg=" + dir.uri(substitute);
    }

    /// Returns: what is queued, newest first, a line each.
    std::string check(const std::string& name = "page.svg", int page = 3) {
        config.checkMaxFileSize(dir.uri(name), page);
        return takeErrors();
    }

    std::string takeErrors() {
        std::string text;
        while (config.hasError()) {
            const MoxError error = config.popError();
            text += std::to_string(error.getCode()) + " " + utf8(error.getMessage()) + "\n";
            EXPECT_EQ(error.getSource() + error.getExtra(), UnicodeString());
            EXPECT_EQ(error.getLine(), -1);
            EXPECT_EQ(error.getColumn(), -1);
        }
        return text;
    }

    void writePage(std::size_t size) { dir.write("page.svg", std::string(size, 'x')); }

    bool isReplaced() { return dir.read("page.svg") == "substitute"; }

    TempDir dir;
    SVGConfig config;
};

/// Lets this process write no file beyond so many bytes.
class FileLimit {
public:
    explicit FileLimit(rlim_t bytes) : handler(std::signal(SIGXFSZ, SIG_IGN)) {
        getrlimit(RLIMIT_FSIZE, &before);
        const rlimit limit = {bytes, before.rlim_max};
        setrlimit(RLIMIT_FSIZE, &limit);
    }

    FileLimit(const FileLimit&) = delete;
    FileLimit& operator=(const FileLimit&) = delete;

    ~FileLimit() {
        setrlimit(RLIMIT_FSIZE, &before);
        std::signal(SIGXFSZ, handler);
    }

private:
    rlimit before = {};
    void (*handler)(int);
};

} // namespace

TEST_F(SizeLimit, IsAnOptionOfTheSmallDeviceMode) {
    const struct {
        const char16_t* options;
        std::int32_t limit;
        const char* substitute;
    } rows[] = {
        {u"", 0, ""},
        {u"maxsize=5", 5, ""},
        {u"errorsvg=a b.svg", 0, "a b.svg"},
        {u"maxsize=12,errorsvg=/x/e.svg", 12, "/x/e.svg"},
        {u"errorsvg=e.svg,maxsize=7,maxsize=8", 7, "e.svg"},
        {u"maxsize=-3", -3, ""},
        {u"maxsize=", 0, ""},
        {u"maxsize=many", 0, ""},
        {u"maxsize=2.9", 2, ""},
        {u"maxsize=99999999999", 2147483647, ""},
    };

    for (const auto& row : rows) {
        config.wispOptions = row.options;
        config.wispMode = true;
        EXPECT_EQ(config.getMaxFileSize(), row.limit) << utf8(row.options);
        EXPECT_EQ(utf8(config.getMaxFileSizeErrorSvg()), row.substitute) << utf8(row.options);
        config.wispMode = false;
        EXPECT_EQ(config.getMaxFileSize(), 0);
        EXPECT_EQ(config.getMaxFileSizeErrorSvg(), UnicodeString());
    }
}

TEST_F(SizeLimit, IsTheLargestSizeThatPasses) {
    writePage(1024);
    EXPECT_EQ(check(), "");
    EXPECT_FALSE(isReplaced());
    writePage(1025);
    EXPECT_EQ(check(), tooLargeText("3"));
    EXPECT_TRUE(isReplaced());
}

TEST_F(SizeLimit, EndsTheReportWithThePageNumberOfTheCaller) {
    for (const int page : {0, -1, 12345}) {
        writePage(2000);
        EXPECT_EQ(check("page.svg", page), tooLargeText(std::to_string(page)));
    }
}

TEST_F(SizeLimit, BelowOneIsNone) {
    writePage(5000);
    for (const char* limit : {"0", "-1", "", "x", "0.9"}) {
        allow(limit, "missing.svg");
        EXPECT_EQ(check(), "") << limit;
    }
    EXPECT_FALSE(isReplaced());
}

TEST_F(SizeLimit, OutsideTheSmallDeviceModeIsNone) {
    config.wispMode = false;
    writePage(5000);
    EXPECT_EQ(check(), "");
    EXPECT_FALSE(isReplaced());
}

TEST_F(SizeLimit, WithoutASubstituteLeavesThePageAndTellsAtEveryCheck) {
    for (const std::size_t size : {10, 5000}) {
        writePage(size);
        allow("1", "missing.svg");
        EXPECT_EQ(check(), missingText);
        config.wispOptions = u"maxsize=1";
        EXPECT_EQ(check(), missingText);
        config.wispOptions = u"maxsize=1,errorsvg=";
        EXPECT_EQ(check(), missingText);
        EXPECT_EQ(dir.read("page.svg").size(), size);
    }
    EXPECT_EQ(check("missing-too.svg"), missingText);
}

TEST_F(SizeLimit, SubstituteThatCannotBeReadIsNone) {
    writePage(5000);
    std::filesystem::create_directory(dir.path("directory"));
    allow("1", "directory");
    EXPECT_EQ(check(), missingText);
    config.wispOptions = u"maxsize=1,errorsvg=/dev/null";
    EXPECT_EQ(check(), missingText);
    config.wispOptions = u"maxsize=1,errorsvg=" + dir.uri("error.svg") + UnicodeString(u'\0');
    EXPECT_EQ(check(), missingText);
    EXPECT_FALSE(isReplaced());
}

TEST_F(SizeLimit, SubstituteThatFailsWhileItIsReadLosesNoPage) {
    const char* const shorterThanItsSize = "/sys/kernel/mm/transparent_hugepage/enabled";
    if (!std::filesystem::exists(shorterThanItsSize)) {
        GTEST_SKIP() << "no file that ends before its size";
    }
    config.wispOptions = u"maxsize=1,errorsvg=" + UnicodeString(shorterThanItsSize);
    writePage(1000);
    EXPECT_EQ(check(), "");
    writePage(5000);
    EXPECT_EQ(check(), missingText);
    EXPECT_EQ(dir.read("page.svg").size(), 5000U);
}

TEST_F(SizeLimit, OutputThatIsNoFileIsLeftAlone) {
    EXPECT_EQ(check("missing.svg"), "");
    EXPECT_FALSE(dir.has("missing.svg"));
    std::filesystem::create_directory(dir.path("directory"));
    EXPECT_EQ(check("directory"), "");
    EXPECT_TRUE(dir.has("directory"));
    writePage(5000);
    config.checkMaxFileSize(dir.uri("page.svg") + UnicodeString(u'\0') + u"x", 1);
    EXPECT_EQ(takeErrors(), "");
    EXPECT_FALSE(isReplaced());
}

TEST_F(SizeLimit, SubstituteBeyondTheLimitIsWrittenAllTheSame) {
    const std::string large(3000, 's');
    dir.write("error.svg", large);
    writePage(2000);
    EXPECT_EQ(check("page.svg", 1), tooLargeText("1"));
    EXPECT_EQ(dir.read("page.svg"), large);
    EXPECT_EQ(check("page.svg", 2), tooLargeText("2"));
    EXPECT_EQ(dir.read("page.svg"), large);
}

TEST_F(SizeLimit, SecondCheckMeasuresTheSubstitute) {
    writePage(2000);
    EXPECT_EQ(check(), tooLargeText("3"));
    EXPECT_EQ(check(), "");
}

TEST_F(SizeLimit, SubstituteIsCopiedByteForByteAndMayBeEmpty) {
    std::string bytes;
    for (int i = 0; i < 256; ++i) {
        bytes += static_cast<char>(i);
    }
    for (const std::string& content : {bytes, std::string()}) {
        dir.write("error.svg", content);
        writePage(2000);
        EXPECT_EQ(check(), tooLargeText("3"));
        EXPECT_EQ(dir.read("page.svg"), content);
        EXPECT_EQ(dir.read("error.svg"), content);
    }
}

TEST_F(SizeLimit, SubstituteThatIsTheOutputReplacesItself) {
    const std::string large(3000, 's');
    dir.write("error.svg", large);
    EXPECT_EQ(check("error.svg"), tooLargeText("3"));
    EXPECT_EQ(dir.read("error.svg"), large);
}

TEST_F(SizeLimit, NamesAreUtf8AndSubstitutesMayHoldBlanks) {
    dir.write("größe e.svg", "other");
    allow("1", "größe e.svg");
    dir.write("säite.svg", std::string(2000, 'x'));
    EXPECT_EQ(check("säite.svg"), tooLargeText("3"));
    EXPECT_EQ(dir.read("säite.svg"), "other");
}

// On purpose: the limit in bytes has 32 bits, so one of 2,097,152 kilobytes wraps to a negative
// one, which no file keeps.
TEST_F(SizeLimit, OfTooManyKilobytesWraps) {
    writePage(0);
    allow("2097151");
    EXPECT_EQ(check(), "");
    allow("2097152");
    EXPECT_EQ(check(), tooLargeText("3"));
    EXPECT_TRUE(isReplaced());
    allow("4194304"); // wraps to 0
    EXPECT_EQ(check(), tooLargeText("3"));
    writePage(0);
    EXPECT_EQ(check(), "");
    allow("4194305"); // wraps to 1024
    writePage(1024);
    EXPECT_EQ(check(), "");
}

TEST_F(SizeLimit, CopyThatCannotBeWrittenIsTold) {
    const std::string large(3000, 's');
    dir.write("error.svg", large);
    writePage(2000);
    std::string told;
    {
        const FileLimit limit(100);
        told = check();
    }
    EXPECT_EQ(told, tooLargeText("3") + "16926 Specified uri that svg output (" +
                        dir.path("page.svg") + ") couldn't create.\n");
}

TEST_F(SizeLimit, LeavesErrorsThatWaitAlone) {
    config.pushError(MoxError(1, u"older", u"", -1, -1, u""));
    writePage(2000);
    EXPECT_EQ(check(), tooLargeText("3") + "1 older\n");
}
