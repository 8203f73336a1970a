/// Reads gzip files back.
#pragma once

#include <string>

namespace DrawmereTest {

/// Returns: the content of `file`, the bytes of one gzip file (RFC 1952).
/// Throws: std::runtime_error for a broken or incomplete file, and when anything follows it.
std::string gunzip(const std::string& file);

} // namespace DrawmereTest
