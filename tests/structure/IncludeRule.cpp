#include "tests/structure/IncludeRule.h"

#include <algorithm>
#include <iterator>

namespace DrawmereTest {
namespace {

struct FolderRank {
    std::string_view folder;
    int rank;
};

// A folder includes only folders of a lower rank, and itself. Foundation and the public headers
// have rules of their own.
constexpr FolderRank
    folderRanks[] =
        {
            {"foundation", 0}, {"include", 0}, {"config", 1},   {"tree", 2},
            {"state", 2}, // on purpose: tree and state know each other
            {"refs", 3},       {"path", 4},    {"fonts", 5},    {"images", 6},
            {"post", 7},       {"draw", 8},    {"frontend", 9},
};

struct LibraryOwner {
    std::string_view prefix;
    std::string_view owner;
};

constexpr LibraryOwner libraryOwners[] = {
    {"fontconfig/", "foundation/"},  {"freetype/", "foundation/"}, {"ft2build.h", "foundation/"},
    {"gif_lib.h", "foundation/"},    {"harfbuzz/", "foundation/"}, {"hb", "foundation/"},
    {"jerror.h", "foundation/"},     {"jpeglib.h", "foundation/"}, {"png.h", "foundation/"},
    {"stb", "foundation/"},          {"tiff", "foundation/"},      {"turbojpeg.h", "foundation/"},
    {"uriparser/", "foundation/"},   {"webp/", "foundation/"},     {"zconf.h", "config/SVGZip.cpp"},
    {"zlib.h", "config/SVGZip.cpp"},
};

// What include/ may see of the foundation: the folders of value types, and the name of the further
// fonts that a caller hands in.
constexpr std::string_view valueTypes[] = {
    "foundation/common/",
    "foundation/fontservice/FS_ExtraFonts.h",
    "foundation/names/",
    "foundation/records/",
};

constexpr std::string_view errorHeader = "frontend/DrawmereError.h";

std::string_view topFolder(std::string_view path) { return path.substr(0, path.find('/')); }

const FolderRank* findRank(std::string_view folder) {
    const auto* found = std::ranges::find(folderRanks, folder, &FolderRank::folder);
    return found == std::end(folderRanks) ? nullptr : found;
}

bool isHeader(std::string_view path) { return path.ends_with(".h"); }

std::string findLibraryFault(std::string_view file, std::string_view target) {
    for (const LibraryOwner& library : libraryOwners) {
        if (target.starts_with(library.prefix) && !file.starts_with(library.owner)) {
            return "only " + std::string(library.owner) + " may use this library";
        }
    }
    return {};
}

std::string findFoundationFault(std::string_view target) {
    const bool allowed = topFolder(target) == "foundation" || target == "include/DrawmereExport.h";
    return allowed ? "" : "foundation/ includes only itself";
}

std::string findPublicFault(std::string_view target) {
    const bool allowed =
        topFolder(target) == "include" ||
        std::ranges::any_of(valueTypes, [&](std::string_view f) { return target.starts_with(f); });
    return allowed ? "" : "include/ includes only itself and value types";
}

// The error class belongs before config, so its header may not lean on the folder it lives in.
std::string findErrorHeaderFault(std::string_view target) {
    const FolderRank* rank = findRank(topFolder(target));
    return rank && rank->rank == 0 ? "" : "this header includes only foundation/ and include/";
}

std::string findDirectionFault(std::string_view file, std::string_view target) {
    const FolderRank* from = findRank(topFolder(file));
    const FolderRank* to = findRank(topFolder(target));
    if (!to) {
        return "no folder of the library";
    }
    if (to == from || to->rank < from->rank) {
        return {};
    }
    if (to->rank > from->rank) {
        return "points against the direction of the folders";
    }
    const bool meetInHeaders = isHeader(file) && isHeader(target);
    return meetInHeaders ? "headers of these folders meet through forward declarations" : "";
}

// A bare name is spelled so because include/ is on the include path.
std::string fromRoot(std::string_view target) {
    const bool bare = target.find('/') == std::string_view::npos;
    return bare ? "include/" + std::string(target) : std::string(target);
}

std::string findQuotedFault(std::string_view file, std::string_view target) {
    const std::string_view folder = topFolder(file);
    if (folder == "foundation") {
        return findFoundationFault(target);
    }
    if (folder == "include") {
        return findPublicFault(target);
    }
    if (file == errorHeader) {
        return findErrorHeaderFault(target);
    }
    return target == errorHeader ? "" : findDirectionFault(file, target);
}

std::string_view trimLeft(std::string_view text) {
    return text.substr(std::min(text.find_first_not_of(" \t"), text.size()));
}

bool takeWord(std::string_view& text, std::string_view word) {
    text = trimLeft(text);
    if (!text.starts_with(word)) {
        return false;
    }
    text.remove_prefix(word.size());
    return true;
}

} // namespace

std::optional<IncludeLine> readInclude(std::string_view line) {
    if (!takeWord(line, "#") || !takeWord(line, "include")) {
        return std::nullopt;
    }
    const bool quoted = takeWord(line, "\"");
    if (!quoted && !takeWord(line, "<")) {
        return std::nullopt;
    }
    const auto end = line.find(quoted ? '"' : '>');
    return IncludeLine{std::string(line.substr(0, end)), quoted};
}

std::string findIncludeFault(std::string_view file, const IncludeLine& include) {
    if (std::string fault = findLibraryFault(file, include.target); !fault.empty()) {
        return fault;
    }
    return include.quoted ? findQuotedFault(file, fromRoot(include.target)) : std::string();
}

} // namespace DrawmereTest
