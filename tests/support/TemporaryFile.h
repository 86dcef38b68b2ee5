#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <unistd.h>

namespace orvex::test {

// A file path of the running test's own. The file is removed with the object.
class TemporaryFile {
public:
    TemporaryFile()
        : path(testing::TempDir() + "orvex-" + testing::UnitTest::GetInstance()->current_test_info()->name()
            + "-" + std::to_string(::getpid()))
    {
    }
    ~TemporaryFile() { std::filesystem::remove(path); }
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;

    const std::string path;
};

} // namespace orvex::test
