/// Where temporary files go, for the time of a test.
#pragma once

#include <cstdlib>
#include <string>

namespace DrawmereTest {

/// Sets $TMPDIR until the end of its life; null takes it away.
class TempVariable {
public:
    explicit TempVariable(const char* value) : before(read()) { write(value); }

    TempVariable(const TempVariable&) = delete;
    TempVariable& operator=(const TempVariable&) = delete;

    ~TempVariable() { write(before.empty() ? nullptr : before.c_str()); }

private:
    static std::string read() {
        const char* const value = std::getenv("TMPDIR");
        return value ? std::string(value) : std::string();
    }

    static void write(const char* value) {
        value ? setenv("TMPDIR", value, /*overwrite=*/1) : unsetenv("TMPDIR");
    }

    std::string before;
};

} // namespace DrawmereTest
