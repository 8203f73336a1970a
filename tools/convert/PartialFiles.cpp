#include "tools/convert/PartialFiles.h"

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <stdexcept>
#include <system_error>

#include <stdlib.h> // mkdtemp is no part of standard C++

namespace DrawmereConvert {

namespace fs = std::filesystem;

PartialFiles::PartialFiles(const std::string& targetPath)
    : target(targetPath), place(targetPath + ".drawmere-XXXXXX") {
    madeTarget = fs::create_directories(target);
    if (!mkdtemp(place.data())) {
        throw fs::filesystem_error("can't write there", target,
                                   std::error_code(errno, std::generic_category()));
    }
    place += '/';
}

PartialFiles::~PartialFiles() {
    std::error_code ignored;
    fs::remove_all(place, ignored);
    if (madeTarget) {
        fs::remove(target, ignored); // an empty one only
    }
}

std::string PartialFiles::makeRoom(int number) const {
    std::string room = place + std::to_string(number) + "/";
    fs::create_directory(room);
    return room;
}

std::string PartialFiles::nameInside(std::string name) {
    std::ranges::replace(name, ':', '_');
    return name;
}

void PartialFiles::moveOut(const std::string& from, const std::string& name) const {
    std::error_code failure;
    fs::rename(from, target + name, failure);
    if (failure) {
        throw std::runtime_error(target + name + ": " + failure.message());
    }
}

std::string PartialFiles::nameOutside(std::string text, const std::string& room) const {
    for (std::size_t at = text.find(room); at != std::string::npos;
         at = text.find(room, at + target.size())) {
        text.replace(at, room.size(), target);
    }
    return text;
}

} // namespace DrawmereConvert
