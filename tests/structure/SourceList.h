/// The lists of files that each folder gives to the build.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace DrawmereTest {

/// Reads the call of `command` in a build file: one file name a line, between the line that opens
/// the call and the closing bracket. Returns: the names as they stand; none without such a call.
std::vector<std::string> readList(const std::vector<std::string>& lines, std::string_view command);

/// Compares a list with the files it should name. Returns: a sentence for each name that is
/// missing, too many or out of order.
std::vector<std::string> findListFaults(const std::vector<std::string>& list,
                                        const std::vector<std::string>& files);

} // namespace DrawmereTest
