#include "PortDirectory.h"

#include "SystemLog.h"
#include "VisibleText.h"

#include <cerrno>
#include <cstdlib>
#include <cstring>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

namespace orvex {

namespace {
std::string pathFromEnvironment()
{
    const auto variable = [](const char* name) {
        const char* value = std::getenv(name);
        return std::string(value ? value : "");
    };
    if (auto chosen = variable("ORVEX_PORT_DIR"); !chosen.empty())
        return chosen;
    if (const auto runtime = variable("XDG_RUNTIME_DIR"); !runtime.empty())
        return runtime + "/orvex";
    return "/tmp/orvex-" + std::to_string(geteuid());
}

class DirectoryLock {
public:
    explicit DirectoryLock(const std::string& path)
        : _file(open(path.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC))
    {
    }
    ~DirectoryLock()
    {
        if (_file >= 0)
            close(_file); // releases the lock
    }
    DirectoryLock(const DirectoryLock&) = delete;
    DirectoryLock& operator=(const DirectoryLock&) = delete;

    bool take() const
    {
        if (_file < 0)
            return false;
        while (flock(_file, LOCK_EX) != 0) {
            if (errno != EINTR)
                return false;
        }
        return true;
    }

private:
    int _file;
};
} // namespace

PortDirectory::PortDirectory()
    : PortDirectory(pathFromEnvironment())
{
}

std::string PortDirectory::fault() const
{
    constexpr mode_t kOwnerOnly = 0700;
    constexpr mode_t kOthers = 0077;
    if (mkdir(_path.c_str(), kOwnerOnly) != 0 && errno != EEXIST)
        return std::strerror(errno); // NOLINT(concurrency-mt-unsafe)
    struct stat status { };
    if (lstat(_path.c_str(), &status) != 0)
        return std::strerror(errno); // NOLINT(concurrency-mt-unsafe)
    if (S_ISLNK(status.st_mode))
        return "refused, it is a symbolic link";
    if (!S_ISDIR(status.st_mode))
        return "refused, it is not a directory";
    if (status.st_uid != geteuid())
        return "refused, it belongs to another user";
    if ((status.st_mode & kOthers) != 0)
        return "refused, it is open to other users";
    return {};
}

bool PortDirectory::isUsable() const
{
    const std::string why = fault();
    if (!why.empty())
        systemLog(Priority::error, "Port directory %s: %s", _path.c_str(), why.c_str());
    return why.empty();
}

std::optional<std::string> PortDirectory::socketPath(const std::string& portName) const
{
    const std::string shown = visibleText(portName);
    if (portName.empty() || portName == "." || portName == ".." || portName.find('/') != std::string::npos
        || shown != portName) { // log lines show it as it is
        systemLog(Priority::error, "\"%s\" cannot be the name of a message port", shown.c_str());
        return std::nullopt;
    }
    auto path = _path + '/' + portName;
    if (path.size() >= sizeof(sockaddr_un::sun_path)) {
        systemLog(Priority::error, "Message port %s: the path is too long for a socket: %s", portName.c_str(),
            visibleText(path).c_str());
        return std::nullopt;
    }
    return path;
}

std::shared_ptr<const void> PortDirectory::lock() const
{
    auto lock = std::make_shared<const DirectoryLock>(_path);
    if (lock->take())
        return lock;
    systemLog(Priority::error, "Port directory %s: cannot be locked: %s", _path.c_str(),
        std::strerror(errno)); // NOLINT(concurrency-mt-unsafe)
    return nullptr;
}

} // namespace orvex
