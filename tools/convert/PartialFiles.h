/// Where files grow before they get their names.
#pragma once

#include <string>

namespace DrawmereConvert {

/// A hidden directory beside the files to be, which is gone, with all that is left in it, at the
/// end. A file comes into being by being moved out of it, so there is never half of one.
class PartialFiles {
public:
    /// Makes `target` too when it is not there.
    /// Shape: `target`, a directory with a slash at its end.
    /// Throws: std::filesystem::filesystem_error when either can't be made.
    explicit PartialFiles(const std::string& target);
    PartialFiles(const PartialFiles&) = delete;
    PartialFiles& operator=(const PartialFiles&) = delete;

    /// Removes `target` too when it was made for nothing.
    ~PartialFiles();

    /// Makes a directory in it for one of several writers. Returns: its path, with a slash.
    std::string makeRoom(int number) const;

    /// Returns: what the file `name` is called in a room. The library takes a name with a colon for
    /// a URI.
    static std::string nameInside(std::string name);

    /// Moves the file `from` to `name` in the target, in place of one that was there.
    /// Throws: std::runtime_error, with the file's own name.
    void moveOut(const std::string& from, const std::string& name) const;

    /// Returns: `text` with the files of a room under the names that they get outside.
    std::string nameOutside(std::string text, const std::string& room) const;

private:
    std::string target;
    std::string place; // with a slash at its end
    bool madeTarget = false;
};

} // namespace DrawmereConvert
