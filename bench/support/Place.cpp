// SPDX-License-Identifier: Apache-2.0
#include "support/Place.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>

#include <fcntl.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace zelvo_bench {

namespace {

std::string parentDirectory()
{
    const char *chosen = std::getenv("ZELVO_BENCH_DIR");
    return chosen != nullptr ? chosen : ZELVO_BENCH_DEFAULT_DIR;
}

std::string newDirectory()
{
    std::string path = parentDirectory() + "/XXXXXX";
    fs::create_directories(fs::path(path).parent_path());
    if (mkdtemp(path.data()) == nullptr) {
        std::perror(path.c_str());
        std::exit(1);
    }
    return path;
}

} // namespace

Place::Place() : path_(newDirectory()) {}

Place::~Place()
{
    fs::remove_all(path_);
}

void empty(const std::string &file)
{
    close(open(file.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0644));
}

std::string contentOf(const std::string &file)
{
    std::ifstream stream(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
}

size_t sizeOf(const std::string &file)
{
    return fs::file_size(file);
}

} // namespace zelvo_bench
