// SPDX-License-Identifier: Apache-2.0
// Runs a fuzz target over files that are kept, without a fuzzer: replay DIRECTORY
#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

#include "support/Fuzz.h"

int main(int argc, char **argv)
{
    if (argc != 2)
        return 2;
    // A refuted claim aborts. Whoever runs this wants an exit status, and nothing left behind; it
    // is no interruption, so exit() may do its work.
    std::signal(SIGABRT, [](int) { std::exit(1); });
    int count = 0;
    for (const auto &entry : std::filesystem::directory_iterator(argv[1])) {
        std::ifstream file(entry.path(), std::ios::binary);
        const std::string input{std::istreambuf_iterator<char>(file), {}};
        std::fprintf(stderr, "%s\n", entry.path().filename().c_str());
        LLVMFuzzerTestOneInput(reinterpret_cast<const uint8_t *>(input.data()), input.size());
        ++count;
    }
    std::fprintf(stderr, "%d inputs\n", count);
    return count > 0 ? 0 : 1;
}
