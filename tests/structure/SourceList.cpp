#include "tests/structure/SourceList.h"

#include <algorithm>

namespace DrawmereTest {
namespace {

std::string trim(std::string_view line) {
    const auto first = line.find_first_not_of(" \t");
    const auto last = line.find_last_not_of(" \t");
    return first == std::string_view::npos ? "" : std::string(line.substr(first, last - first + 1));
}

bool holds(const std::vector<std::string>& names, const std::string& name) {
    return std::ranges::find(names, name) != names.end();
}

} // namespace

std::vector<std::string> readList(const std::vector<std::string>& lines, std::string_view command) {
    const std::string opening = std::string(command) + "(";
    auto line = std::ranges::find_if(lines, [&](const auto& l) { return l.starts_with(opening); });
    std::vector<std::string> list;
    while (line != lines.end() && ++line != lines.end() && trim(*line) != ")") {
        list.push_back(trim(*line));
    }
    return list;
}

std::vector<std::string> findListFaults(const std::vector<std::string>& list,
                                        const std::vector<std::string>& files) {
    std::vector<std::string> faults;
    for (const std::string& file : files) {
        if (!holds(list, file)) {
            faults.push_back(file + " is not listed");
        }
    }
    for (const std::string& name : list) {
        if (!holds(files, name)) {
            faults.push_back(name + " is listed but not there");
        }
    }
    for (std::size_t i = 1; i < list.size(); ++i) {
        if (list[i] <= list[i - 1]) {
            faults.push_back(list[i] + " stands behind " + list[i - 1]);
        }
    }
    return faults;
}

} // namespace DrawmereTest
