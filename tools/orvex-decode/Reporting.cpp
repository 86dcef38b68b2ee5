#include "Reporting.h"

#include "OutputFile.h"
#include "VisibleText.h"

#include <cerrno>
#include <cstring>
#include <iostream>

namespace orvex {

bool printError(const std::string& message)
{
    std::cerr << "orvex-decode: " << visibleText(message) << '\n';
    return false;
}

namespace {
bool writeFile(const std::string& path, const std::function<void(std::ostream&)>& write)
{
    auto [file, error] = openOutputFile(path);
    if (file) {
        FileBuffer buffer(*file);
        std::ostream stream(&buffer);
        write(stream);
        stream.flush();
        error = closeOutputFile(std::move(file));
    }
    return error.empty() || printError(path + ": " + error);
}
} // namespace

bool writeFile(const std::string& path, std::string_view content)
{
    return writeFile(path, [content](std::ostream& stream) { stream << content; });
}

bool printDocument(const std::function<void(std::ostream&)>& write, const DecodeOptions& options)
{
    if (options.outputFile)
        return writeFile(*options.outputFile, write);
    write(std::cout);
    std::cout.flush();
    return std::cout ? true : printError("standard output: could not be written");
}

} // namespace orvex
