#include "Reporting.h"

#include "VisibleText.h"

#include <cerrno>
#include <cstring>
#include <fstream>
#include <iostream>

namespace orvex {

bool complain(const std::string& message)
{
    std::cerr << "orvex-decode: " << visibleText(message) << '\n';
    return false;
}

bool writeFile(const std::string& path, std::string_view content)
{
    std::ofstream file(path, std::ios::binary);
    file << content << std::flush;
    return file ? true : complain(path + ": " + std::strerror(errno)); // NOLINT(concurrency-mt-unsafe)
}

bool printDocument(const std::string& document, const DecodeOptions& options)
{
    if (options.outputFile)
        return writeFile(*options.outputFile, document);
    std::cout << document << std::flush;
    return std::cout ? true : complain("standard output: could not be written");
}

} // namespace orvex
