/// The names of the files that a document is converted into.
#pragma once

#include "foundation/common/MoxString.h"
#include "tools/convert/RunOptions.h"

#include <string>
#include <vector>

namespace DrawmereConvert {

using icu::UnicodeString;

/// Names the files of one document. Page 3 of "out/page.svg" goes to "out/page3.svg", in the form
/// that the library gives page numbers.
class OutputNames {
public:
    /// Shape: `input`, the document, which lends its name where the output has none; `pageCount`,
    /// of the whole document, so that a part of it is named as in a run of all.
    OutputNames(const RunOptions& options, const std::string& input, int pageCount);

    /// Returns: whether `output` stands for a directory rather than a file; nothing does.
    static bool isDirectory(const std::string& output);

    /// Returns: the directory of all files, with a slash at its end.
    const std::string& getDirectory() const { return directory; }

    /// Returns: the name without directory of the page, counted from 0. A single page has no number
    /// unless it was asked for.
    std::string getPageFile(int page, bool isSingle) const;

    /// Returns: the name without directory of the document that holds all pages.
    std::string getWholeFile() const { return stem + extension; }

    /// Returns: what other files of the page are named by.
    std::string getPageStem(int page, bool isSingle) const;

    /// Returns: the form of page numbers.
    const std::string& getNumberFormat() const { return numberFormat; }

    /// Returns: `file` as a reference from a document beside it, where a space, '#' and the like
    /// have a meaning of their own.
    static std::string toReference(const std::string& file);

private:
    void placeIn(const std::string& output, const std::string& input);

    std::string directory;
    std::string stem;
    std::string extension;
    std::string numberFormat;
    bool keepsNumber;
};

} // namespace DrawmereConvert
