/// Reads path data as SVG 1.1 tells, for tests of what was written.
#pragma once

#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxPointT.h"

#include <cctype>
#include <cstdlib>
#include <string>
#include <vector>

namespace DrawmereTest {

using MoxCommonNS::MoxLength;
using MoxCommonNS::MoxPointT;

/// The points at which the commands of a path end. It knows the commands "M" to begin with, and
/// "m", "l", "h", "v", "c" and "z".
class PathReader {
public:
    explicit PathReader(const std::string& data) : position(data.c_str()) {
        while (*position != '\0' && error.empty()) {
            readCommand(*position++);
        }
    }

    std::string error; ///< what can't be read, empty when all could
    std::vector<MoxPointT<MoxLength>> ends;

private:
    void readCommand(char letter) {
        const float fromX = letter == 'M' ? 0.0F : x;
        const float fromY = letter == 'M' ? 0.0F : y;
        const std::vector<float> numbers = readNumbers();
        if (letter == 'z' && numbers.empty()) {
            x = startX;
            y = startY;
        } else if (letter == 'h' && numbers.size() == 1) {
            x = fromX + numbers[0];
        } else if (letter == 'v' && numbers.size() == 1) {
            y = fromY + numbers[0];
        } else if (numbers.size() == (letter == 'c' ? 6 : 2)) {
            x = fromX + numbers[numbers.size() - 2];
            y = fromY + numbers[numbers.size() - 1];
        } else {
            error = std::string("a fault in the command ") + letter;
        }
        if (letter == 'M' || letter == 'm') {
            startX = x;
            startY = y;
        }
        ends.emplace_back(MoxLength::fromRaw(x), MoxLength::fromRaw(y));
    }

    std::vector<float> readNumbers() {
        std::vector<float> numbers;
        while (*position != '\0' && std::isalpha(static_cast<unsigned char>(*position)) == 0) {
            char* end = nullptr;
            numbers.push_back(std::strtof(position, &end));
            if (end == position) {
                error = "no number";
                return numbers;
            }
            position = end;
            position += *position == ',' || *position == ' ' ? 1 : 0;
        }
        return numbers;
    }

    const char* position;
    float x = 0.0F;
    float y = 0.0F;
    float startX = 0.0F;
    float startY = 0.0F;
};

} // namespace DrawmereTest
