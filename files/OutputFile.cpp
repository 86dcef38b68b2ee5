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
constexpr int kMostLinks = 40; // as many as the kernel follows

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

// A link such as /proc/self/fd/1 leads to an open file, which need not have the name that the link shows.
bool isLinkToOpenFile(const Descriptor& link)
{
    struct statfs system { };
    return ::fstatfs(link.number(), &system) == 0 && system.f_type == PROC_SUPER_MAGIC;
}

// Where a link leads to, seen from where its own path is.
std::string targetOf(const Descriptor& link, const std::string& path)
{
    std::array<char, PATH_MAX> buffer; // NOLINT(cppcoreguidelines-pro-type-member-init)
    const ssize_t length = ::readlinkat(link.number(), "", buffer.data(), buffer.size());
    const std::string target(buffer.data(), length > 0 ? static_cast<std::size_t>(length) : 0);
    return target.starts_with('/') ? target : path.substr(0, path.rfind('/') + 1) + target;
}

// Opens what was looked at, whatever has taken its place meanwhile.
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

OutputFile openOutputFile(const std::string& path)
{
    std::string place = path;
    for (int links = 0; links <= kMostLinks; ++links) {
        Descriptor created(::open(
            place.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC | O_NOCTTY, kOwnerOnly));
        if (created.isOpen())
            return streamOf(created);
        if (errno != EEXIST)
            return fail();
        const Descriptor found(::open(place.c_str(), O_PATH | O_NOFOLLOW | O_CLOEXEC));
        struct stat status { };
        if (!found.isOpen() || ::fstat(found.number(), &status) != 0)
            return fail();
        if (!S_ISLNK(status.st_mode))
            return reopen(found, false);
        if (!isTrusted(status))
            return fail("a link that belongs to another user");
        if (isLinkToOpenFile(found)) {
            const Descriptor behind(::open(place.c_str(), O_PATH | O_CLOEXEC));
            return behind.isOpen() ? reopen(behind, true) : fail();
        }
        place = targetOf(found, place);
    }
    errno = ELOOP;
    return fail();
}

std::string closeOutputFile(FilePointer file)
{
    const bool isWhole = std::fflush(file.get()) == 0 && std::ferror(file.get()) == 0;
    const bool isClosed = std::fclose(file.release()) == 0;
    return isWhole && isClosed ? std::string() : fail().error;
}

} // namespace orvex
