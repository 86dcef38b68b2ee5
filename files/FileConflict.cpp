#include "FileConflict.h"

#include <filesystem>
#include <optional>
#include <tuple>

#include <sys/stat.h>

namespace orvex {

namespace {
namespace fs = std::filesystem;

// Device, inode and, for a file that does not exist yet, its name in the directory that these stand for.
using Identity = std::tuple<dev_t, ino_t, std::string>;

fs::path withoutLinks(fs::path path)
{
    constexpr int kMostLinks = 40; // as many as the kernel follows
    std::error_code error;
    for (int i = 0; i < kMostLinks && fs::is_symlink(path, error); ++i)
        path = path.parent_path() / fs::read_symlink(path, error);
    return path;
}

// None for what may be opened twice, or cannot be opened at all.
std::optional<Identity> identityOf(const std::string& path)
{
    struct stat status { };
    if (::stat(path.c_str(), &status) == 0) {
        const bool isStream = S_ISCHR(status.st_mode) || S_ISFIFO(status.st_mode) || S_ISSOCK(status.st_mode);
        return isStream ? std::nullopt : std::optional(Identity(status.st_dev, status.st_ino, {}));
    }
    const fs::path file = withoutLinks(path);
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
