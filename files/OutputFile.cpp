#include "OutputFile.h"

#include <array>
#include <cerrno>
#include <climits>
#include <cstring>
#include <utility>

#include <fcntl.h>
#include <linux/magic.h>
#include <sys/stat.h>
#include <sys/vfs.h>
#include <unistd.h>

namespace orvex {

namespace {
constexpr mode_t kOwnerOnly = S_IRUSR | S_IWUSR;

class Descriptor {
public:
    explicit Descriptor(int number)
        : _number(number)
    {
    }
    ~Descriptor()
    {
        if (_number >= 0)
            ::close(_number);
    }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    int number() const { return _number; }
    bool isOpen() const { return _number >= 0; }
    int release() { return std::exchange(_number, -1); }

private:
    int _number;
};

OutputFile fail(const char* why)
{
    return {nullptr, why};
}

OutputFile fail()
{
    return fail(std::strerror(errno)); // NOLINT(concurrency-mt-unsafe)
}

OutputFile streamOf(Descriptor& descriptor)
{
    FilePointer file(::fdopen(descriptor.number(), "wb"));
    if (!file)
        return fail();
    descriptor.release();
    return {std::move(file), {}};
}

bool isTrusted(const struct stat& status)
{
    return status.st_uid == ::geteuid() || status.st_uid == 0;
}

// A link such as /proc/self/fd/1 leads to an open file, whose name may differ from the link's text.
bool isLinkToOpenFile(const Descriptor& link)
{
    struct statfs system { };
    return ::fstatfs(link.number(), &system) == 0 && system.f_type == PROC_SUPER_MAGIC;
}

// Resolves one link relative to its own directory.
std::string targetOf(const Descriptor& link, const std::string& path)
{
    std::array<char, PATH_MAX> buffer; // NOLINT(cppcoreguidelines-pro-type-member-init)
    const ssize_t length = ::readlinkat(link.number(), "", buffer.data(), buffer.size());
    const std::string target(buffer.data(), length > 0 ? static_cast<std::size_t>(length) : 0);
    return target.starts_with('/') ? target : path.substr(0, path.rfind('/') + 1) + target;
}

// Opens the file found earlier, even if another has since taken its name.
OutputFile reopen(const Descriptor& found, bool isRedirection)
{
    struct stat status { };
    if (::fstat(found.number(), &status) != 0)
        return fail();
    const bool isRegular = S_ISREG(status.st_mode);
    if (!S_ISCHR(status.st_mode) && (isRegular ? status.st_uid != ::geteuid() : !isTrusted(status)))
        return fail("belongs to another user");
    const std::string path = "/proc/self/fd/" + std::to_string(found.number());
    Descriptor file(::open(path.c_str(), O_WRONLY | O_CLOEXEC | O_NOCTTY));
    if (!file.isOpen())
        return fail();
    if (isRegular && !isRedirection && ::fchmod(file.number(), kOwnerOnly) != 0)
        return fail();
    if (isRegular && ::ftruncate(file.number(), 0) != 0)
        return fail();
    return streamOf(file);
}

} // namespace

LinkEnd followLinks(const std::string& path, FollowedLinks links)
{
    constexpr int kMostLinks = 40; // as many as the kernel follows
    LinkEnd end{path, false, {}};
    for (int i = 0; i <= kMostLinks; ++i) {
        const Descriptor found(::open(end.path.c_str(), O_PATH | O_NOFOLLOW | O_CLOEXEC));
        struct stat status { };
        if (!found.isOpen() || ::fstat(found.number(), &status) != 0 || !S_ISLNK(status.st_mode))
            return end;
        if (links == FollowedLinks::trusted && !isTrusted(status)) {
            end.error = "a link that belongs to another user";
            return end;
        }
        end.isOpenFile = isLinkToOpenFile(found);
        if (end.isOpenFile)
            return end;
        end.path = targetOf(found, end.path);
    }
    end.error = std::strerror(ELOOP); // NOLINT(concurrency-mt-unsafe)
    return end;
}

OutputFile openOutputFile(const std::string& path)
{
    const LinkEnd end = followLinks(path, FollowedLinks::trusted);
    if (!end.error.empty())
        return {nullptr, end.error};
    // Neither call follows a link, so one created from here on is refused.
    Descriptor created(::open(
        end.path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC | O_NOCTTY, kOwnerOnly));
    if (created.isOpen())
        return streamOf(created);
    if (errno != EEXIST)
        return fail();
    const Descriptor found(::open(end.path.c_str(), O_PATH | O_CLOEXEC | (end.isOpenFile ? 0 : O_NOFOLLOW)));
    return found.isOpen() ? reopen(found, end.isOpenFile) : fail();
}

std::string closeOutputFile(FilePointer file)
{
    const bool isWhole = std::fflush(file.get()) == 0 && std::ferror(file.get()) == 0;
    const bool isClosed = std::fclose(file.release()) == 0;
    return isWhole && isClosed ? std::string() : fail().error;
}

} // namespace orvex
