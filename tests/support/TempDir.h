/// A directory for the files of one test.
#pragma once

#include "foundation/common/MoxString.h"

#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>

#include <stdlib.h> // mkdtemp is no part of standard C++

namespace DrawmereTest {

using icu::UnicodeString;

/// Makes a directory of its own, and removes it with all that is in it.
class TempDir {
public:
    TempDir() {
        std::string pattern = (std::filesystem::temp_directory_path() / "drawmere-XXXXXX").string();
        if (!mkdtemp(pattern.data())) {
            throw std::runtime_error("no temporary directory");
        }
        place = pattern;
    }

    TempDir(const TempDir&) = delete;
    TempDir& operator=(const TempDir&) = delete;

    ~TempDir() {
        std::error_code failure;
        std::filesystem::remove_all(place, failure);
    }

    /// Returns: the path of `name` in the directory, as UTF-8; the directory's own without a name.
    std::string path(const std::string& name = std::string()) const {
        return name.empty() ? place.string() : (place / name).string();
    }

    /// Returns: the same path as the text that the library takes.
    UnicodeString uri(const std::string& name = std::string()) const {
        return UnicodeString::fromUTF8(path(name));
    }

    /// Returns: whether there is a file `name` in the directory.
    bool has(const std::string& name) const { return std::filesystem::exists(place / name); }

    /// Returns: the bytes of the file `name`, none when it can't be read.
    std::string read(const std::string& name) const {
        std::ifstream file(place / name, std::ios::binary);
        return std::string(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
    }

    /// Makes the file `name`.
    void write(const std::string& name, const std::string& bytes) const {
        std::ofstream(place / name, std::ios::binary) << bytes;
    }

private:
    std::filesystem::path place;
};

} // namespace DrawmereTest
