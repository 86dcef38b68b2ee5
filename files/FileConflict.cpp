#include "FileConflict.h"

#include "OutputFile.h"

#include <filesystem>
#include <optional>
#include <tuple>

#include <sys/stat.h>

namespace orvex {

namespace {
namespace fs = std::filesystem;

// Identifies a file: device and inode, or those of the directory plus the name if it does not exist yet.
using Identity = std::tuple<dev_t, ino_t, std::string>;

// Empty for devices and pipes, which may be opened more than once, and for paths that cannot be resolved.
std::optional<Identity> identityOf(const std::string& path)
{
    struct stat status { };
    if (::stat(path.c_str(), &status) == 0) {
        const bool isStream = S_ISCHR(status.st_mode) || S_ISFIFO(status.st_mode) || S_ISSOCK(status.st_mode);
        return isStream ? std::nullopt : std::optional(Identity(status.st_dev, status.st_ino, {}));
    }
    const fs::path file = followLinks(path, FollowedLinks::all).path;
    const fs::path directory = file.has_parent_path() ? file.parent_path() : fs::path(".");
    if (::stat(directory.c_str(), &status) != 0)
        return std::nullopt;
    return Identity(status.st_dev, status.st_ino, file.filename().string());
}
} // namespace

std::string fileConflict(const std::vector<FileInUse>& inputs, const std::vector<FileInUse>& outputs)
{
    struct Known {
        Identity identity;
        const std::string& label;
    };
    std::vector<Known> known;
    for (const FileInUse& input : inputs) {
        if (const auto identity = identityOf(input.path))
            known.push_back({*identity, input.label});
    }
    for (const FileInUse& output : outputs) {
        const auto identity = identityOf(output.path);
        if (!identity)
            continue;
        for (const Known& other : known) {
            if (other.identity == *identity)
                return output.label + " and " + other.label + " are the same file";
        }
        known.push_back({*identity, output.label});
    }
    return {};
}

} // namespace orvex
