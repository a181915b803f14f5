// SPDX-License-Identifier: Apache-2.0
// A fixture whose test runs in an empty directory of its own, which goes when the test ends.
#pragma once

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

namespace zelvo_test {

/// Runs each test in a fresh working directory, so that tests can run side by side.
class TestDir : public testing::Test {
protected:
    TestDir()
    {
        std::string pattern = (std::filesystem::temp_directory_path() / "zelvo-XXXXXX").string();
        directory_ = mkdtemp(pattern.data());
        previous_ = std::filesystem::current_path();
        std::filesystem::current_path(directory_);
    }

    ~TestDir() override
    {
        std::filesystem::current_path(previous_);
        std::filesystem::remove_all(directory_);
    }

    /// Writes CONTENT, bytes as they are, to the file NAME and gives the name back.
    static std::string write(const std::string &name, const std::string &content)
    {
        std::ofstream(name, std::ios::binary) << content;
        return name;
    }

    /// The whole content of the file NAME; "" when there is none.
    static std::string read(const std::string &name)
    {
        std::ostringstream text;
        text << std::ifstream(name, std::ios::binary).rdbuf();
        return text.str();
    }

    const std::filesystem::path &directory() const { return directory_; }

private:
    std::filesystem::path directory_;
    std::filesystem::path previous_;
};

} // namespace zelvo_test
