// The size limit of the small-device mode.
#include "SVGConfig.h"

#include "foundation/common/MoxCStr.h"
#include "foundation/common/MoxParser.h"
#include "foundation/common/MoxUtil.h"
#include "frontend/DrawmereError.h"

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <string>
#include <system_error>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxCStr;
using MoxCommonNS::MoxParser;
using MoxCommonNS::MoxTokenizer;
using MoxCommonNS::MoxUtil;

/// An error that is queued: the code of its record and that of its text.
struct QueuedError {
    unsigned short code;
    unsigned short text;
};

constexpr QueuedError noSubstitute = {16935, 16423};
constexpr QueuedError tooLarge = {17320, 16424};
constexpr QueuedError notWritten = {16926, 16414};

constexpr unsigned kilobyteBits = 10;

void queue(SVGConfig& config, const QueuedError& error,
           const UnicodeString& argument = UnicodeString(),
           const UnicodeString& addition = UnicodeString()) {
    config.pushError(
        MoxError(error.code, DrawmereError::getErrorMessage(error.text, argument) + addition,
                 UnicodeString(), /*lineNumber=*/-1, /*columnNumber=*/-1, UnicodeString()));
}

/// On purpose: the limit in bytes has 32 bits, so one of 2,097,152 kilobytes wraps to a negative
/// one, which no file keeps.
std::int32_t toBytes(std::int32_t kilobytes) {
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(kilobytes) << kilobyteBits);
}

/// Returns: whether `path` is that of a file; a null character would end it early.
bool isFile(const UnicodeString& path) {
    std::error_code failure;
    return path.indexOf(u'\0') < 0 &&
           std::filesystem::is_regular_file(MoxCStr(path).toBytes(), failure);
}

std::uintmax_t getSize(const UnicodeString& path) {
    std::error_code failure;
    const std::uintmax_t size = std::filesystem::file_size(MoxCStr(path).toBytes(), failure);
    return failure ? 0 : size;
}

/// Opens the file `path`, and nothing else: reading a pipe, for instance, might never end.
std::ifstream openFile(const UnicodeString& path) {
    std::ifstream file;
    if (isFile(path)) {
        file.open(MoxCStr(path).toBytes(), std::ios::binary);
    }
    return file;
}

/// Returns: whether `content` was read whole.
bool readAll(std::ifstream& file, std::string& content) {
    const auto size = static_cast<std::streamsize>(content.size());
    return file.read(content.data(), size).gcount() == size;
}

/// Returns: whether the new file is complete.
bool replaceFile(const UnicodeString& path, const std::string& content) {
    const MoxCStr local(path);
    std::remove(local.toCStr());
    std::ofstream file(local.toBytes(), std::ios::binary | std::ios::trunc);
    file.write(content.data(), static_cast<std::streamsize>(content.size()));
    file.close();
    return file.good();
}

} // namespace

std::int32_t SVGConfig::getMaxFileSize() const {
    if (!wispMode) {
        return 0;
    }
    return MoxParser::parse(findValue(wispOptions, u"maxsize"), 0, MoxTokenizer::TOKENIZER_DEFAULT)
        .getIntegerValue();
}

UnicodeString SVGConfig::getMaxFileSizeErrorSvg() const {
    return wispMode ? findValue(wispOptions, u"errorsvg") : UnicodeString();
}

void SVGConfig::checkMaxFileSize(const UnicodeString& path, int pageNo) {
    const std::int32_t limit = getMaxFileSize();
    if (limit <= 0) {
        return;
    }
    // On purpose: asked for before any look at the output, so that a missing one is told at every
    // check and not first when it is needed.
    const UnicodeString substitute = getMaxFileSizeErrorSvg();
    std::ifstream source = openFile(substitute);
    if (!source.is_open()) {
        queue(*this, noSubstitute);
        return;
    }
    if (!isFile(path) || static_cast<std::int64_t>(getSize(path)) <= toBytes(limit)) {
        return;
    }
    // It is read before the output is touched: no page is given up for one that can't be had.
    std::string content(getSize(substitute), '\0');
    if (!readAll(source, content)) {
        queue(*this, noSubstitute);
        return;
    }
    if (!replaceFile(path, content)) {
        queue(*this, notWritten, path);
    }
    queue(*this, tooLarge, UnicodeString(), u" (page no = " + MoxUtil::toString(pageNo) + u")");
}

} // namespace DrawmereNS
