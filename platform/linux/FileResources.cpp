#include "FileResources.h"

#include "PropertyList.h"
#include "RegularFile.h"

#include <algorithm>
#include <cstdlib>
#include <filesystem>

namespace orvex {

namespace {
namespace fs = std::filesystem;

bool isInside(const fs::path& path, const fs::path& directory)
{
    const auto [inPath, inDirectory] =
        std::mismatch(path.begin(), path.end(), directory.begin(), directory.end());
    return inDirectory == directory.end();
}

DictionaryResult refuse(const std::string& path, const std::string& why)
{
    return {nullptr, path + ": " + why};
}
} // namespace

std::string FileResources::defaultDirectory()
{
    if (const char* chosen = std::getenv("ORVEX_RESOURCES"); chosen && *chosen)
        return chosen;
    std::error_code error;
    const fs::path program = fs::read_symlink("/proc/self/exe", error);
    if (error)
        return ORVEX_DATA_DIRECTORY;
    const fs::path besideProgram = (program.parent_path() / ORVEX_DATA_FROM_PROGRAM).lexically_normal();
    if (fs::is_directory(besideProgram, error))
        return besideProgram.string();
    // An installed program knows nothing of the source tree.
    const fs::path sources = fs::path(ORVEX_SOURCE_DIRECTORY) / "resources";
    if (isInside(program, ORVEX_BUILD_DIRECTORY) && fs::is_directory(sources, error))
        return sources.string();
    return ORVEX_DATA_DIRECTORY;
}

std::vector<std::string> FileResources::propertyListPaths() const
{
    std::vector<std::string> paths;
    std::error_code error;
    fs::directory_iterator entry(_directory, error);
    for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
        if (entry->path().extension() == ".plist")
            paths.push_back(entry->path().filename().string());
    }
    std::sort(paths.begin(), paths.end());
    return paths;
}

DictionaryResult FileResources::dictionaryNamed(const std::string& baseName) const
{
    const std::string path = fs::path(_directory) / (baseName + ".plist");
    const auto [data, error] = readFile(path, PropertyListLimits().maximumBytes);
    if (!error.empty())
        return refuse(path, error);
    const auto list = propertyListFromData(data);
    if (!list.value)
        return refuse(path, list.error);
    if (auto dictionary = list.value->dictionary())
        return {std::move(dictionary), {}};
    return refuse(path, std::string("it holds no dictionary but: ") + nameOf(list.value->kind()));
}

} // namespace orvex
