/// Runs the converter as a reader of documents does.
#pragma once

#include "tests/support/Command.h"
#include "tests/support/TempDir.h"

#include <string>
#include <vector>

namespace DrawmereTest {

/// A directory with documents and what the converter makes of them.
class Conversion {
public:
    /// Runs the converter with its own directory as the current one.
    CommandResult run(const std::vector<std::string>& words) const;

    /// Runs a command line of the shell there, in which `$convert` is the converter.
    CommandResult runShell(const std::string& line) const;

    /// Returns: the names of all files in the directory `place`, sorted, hidden ones too.
    std::vector<std::string> list(const std::string& place = std::string()) const;

    /// Returns: the path of one of the documents of the tests.
    static std::string document(const std::string& name);

    TempDir directory;
};

} // namespace DrawmereTest
