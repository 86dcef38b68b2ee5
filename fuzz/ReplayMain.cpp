// Runs a target over a corpus without a fuzzer: replay CORPUS

#include "FuzzTarget.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <vector>

int main(int argc, char** argv)
{
    namespace fs = std::filesystem;
    if (argc != 2) {
        std::cerr << "usage: " << argv[0] << " CORPUS\n";
        return 2;
    }
    std::vector<fs::path> files;
    for (const auto& entry : fs::directory_iterator(argv[1]))
        files.push_back(entry.path());
    std::ranges::sort(files);
    for (const fs::path& path : files) {
        std::cout << path.filename().string()
                  << std::endl; // flushed first: the last name printed is at fault
        std::ifstream file(path, std::ios::binary);
        const std::vector<char> bytes(
            (std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
        LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
    }
    std::cout << files.size() << " inputs\n";
    return files.empty() ? 1 : 0;
}
