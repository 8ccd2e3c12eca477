#pragma once

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>

namespace tovimar::test {

/// Compares a text with the file of that name below tests/golden, byte by byte. With TOVIMAR_REFRESH_GOLDEN
/// set the file is written instead: look at the difference before it is committed.
inline void ExpectGolden(const std::string& name, const std::string& text) {
    const std::string path = std::string(TOVIMAR_SOURCE_DIR "/tests/golden/") + name;
    if (std::getenv("TOVIMAR_REFRESH_GOLDEN") != nullptr)
        std::ofstream(path, std::ios::binary) << text;
    std::ifstream file(path, std::ios::binary);
    std::ostringstream expected;
    expected << file.rdbuf();
    EXPECT_EQ(expected.str(), text) << "golden file " << name;
}

} // namespace tovimar::test
