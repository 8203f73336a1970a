/// Reads the repository's own sources for the tests that judge them.
#pragma once

#include <string>
#include <vector>

namespace DrawmereTest {

/// The folders whose sources make the library, from the root of the repository.
extern const std::vector<std::string> libraryFolders;

/// Returns: the paths, from the root and sorted, of all files below `folder` that end in one of
/// `endings`.
std::vector<std::string> findFiles(const std::string& folder,
                                   const std::vector<std::string>& endings);

/// Returns: true if there is a file at `path`, taken from the root of the repository.
bool isFile(const std::string& path);

/// Returns: the lines of the file at `path`, taken from the root; none when it can't be read.
std::vector<std::string> readLines(const std::string& path);

} // namespace DrawmereTest
