#include "WholeFile.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace orvex {

namespace {

std::string reasonOf(int error)
{
    return std::strerror(error); // NOLINT(concurrency-mt-unsafe)
}

} // namespace

WholeFile::WholeFile(const std::string& path)
{
    const LinkEnd end = followLinks(path, FollowedLinks::trusted);
    struct stat status { };
    const bool exists = ::stat(end.path.c_str(), &status) == 0;
    if (!end.error.empty()) {
        _error = end.error;
    } else if (exists && S_ISREG(status.st_mode) && status.st_uid != ::geteuid()) {
        _error = "belongs to another user";
    } else if (end.isOpenFile || (exists && !S_ISREG(status.st_mode))) {
        auto [file, error] = openOutputFile(path);
        _file = std::move(file);
        _error = error;
    } else {
        createBeside(end.path);
    }
    if (_file) {
        constexpr std::size_t kBuffered = std::size_t{64} << 10; // 4 KiB as a rule, a system call each
        _storage.resize(kBuffered);
        std::setvbuf(_file.get(), _storage.data(), _IOFBF, _storage.size());
        _buffer.emplace(*_file);
        _stream.emplace(&*_buffer);
    }
}

void WholeFile::createBeside(const std::string& target)
{
    const std::size_t folder = target.rfind('/') + 1; // 0 without a slash
    std::string name(target, 0, folder);
    name.append(".").append(target, folder).append(".XXXXXX");
    const int descriptor = ::mkostemp(name.data(), O_CLOEXEC); // with mode 0600
    if (descriptor >= 0) {
        _temporary = name;
        _target = target;
        _file.reset(::fdopen(descriptor, "wb"));
    }
    if (!_file)
        _error = reasonOf(errno);
}

WholeFile::~WholeFile()
{
    if (!_temporary.empty())
        ::unlink(_temporary.c_str());
}

std::string WholeFile::commit()
{
    _stream->flush();
    std::string error = closeOutputFile(std::move(_file));
    if (!error.empty() || _temporary.empty())
        return error;
    if (::rename(_temporary.c_str(), _target.c_str()) != 0)
        return reasonOf(errno);
    _temporary.clear();
    return {};
}

} // namespace orvex
