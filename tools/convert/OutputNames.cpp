#include "tools/convert/OutputNames.h"

#include "foundation/common/MoxUtil.h"

#include <array>
#include <filesystem>

namespace DrawmereConvert {
namespace {

namespace fs = std::filesystem;

/// Returns: `path` with a slash at its end, never one that could be taken for a URI.
std::string toDirectory(const fs::path& path) {
    const std::string text = path.empty() ? "." : path.string();
    const bool isSafe = path.is_absolute() || text.starts_with(".");
    return (isSafe ? text : "./" + text) + (text.ends_with('/') ? "" : "/");
}

std::string formatNumber(int number, const std::string& format) {
    const UnicodeString text = MoxCommonNS::MoxUtil::formatNumber(
        number, UnicodeString::fromUTF8(format), UnicodeString(), 0,
        MoxCommonNS::MoxLang(icu::Locale::getRoot()), MoxCommonNS::MOXNAME_ALPHABETIC);
    std::string bytes;
    return text.toUTF8String(bytes);
}

bool needsEscape(char sign) {
    constexpr std::string_view signs = " \"#%:<>?[\\]^`{|}";
    return static_cast<unsigned char>(sign) < ' ' || signs.find(sign) != std::string_view::npos;
}

} // namespace

OutputNames::OutputNames(const RunOptions& options, const std::string& input, int pageCount)
    : extension(options.gzip ? ".svgz" : ".svg"), numberFormat(options.numberFormat),
      keepsNumber(options.keepNumber) {
    placeIn(options.output, input);
    if (numberFormat.empty()) {
        const std::size_t digits = std::to_string(pageCount).size();
        numberFormat = std::string(digits - 1, '0') + "1";
    }
}

bool OutputNames::isDirectory(const std::string& output) {
    std::error_code failure;
    return output.empty() || output.ends_with('/') || fs::is_directory(output, failure);
}

void OutputNames::placeIn(const std::string& output, const std::string& input) {
    if (isDirectory(output)) {
        directory = toDirectory(output);
        stem = fs::path(input).stem().string();
        return;
    }
    const fs::path path(output);
    directory = toDirectory(path.parent_path());
    stem = path.stem().string();
    if (path.has_extension()) {
        extension = path.extension().string();
    }
}

std::string OutputNames::getPageStem(int page, bool isSingle) const {
    return isSingle && !keepsNumber ? stem : stem + formatNumber(page + 1, numberFormat);
}

std::string OutputNames::getPageFile(int page, bool isSingle) const {
    return getPageStem(page, isSingle) + extension;
}

std::string OutputNames::toReference(const std::string& file) {
    constexpr std::array digits = {'0', '1', '2', '3', '4', '5', '6', '7',
                                   '8', '9', 'A', 'B', 'C', 'D', 'E', 'F'};
    std::string reference;
    for (const char sign : file) {
        if (!needsEscape(sign)) {
            reference += sign;
            continue;
        }
        const auto byte = static_cast<unsigned char>(sign);
        reference += {'%', digits.at(byte >> 4U), digits.at(byte & 15U)};
    }
    return reference;
}

} // namespace DrawmereConvert
