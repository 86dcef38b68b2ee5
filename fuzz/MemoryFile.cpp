#include "MemoryFile.h"

#include "FuzzTarget.h"

#include <sys/mman.h>
#include <unistd.h>

namespace orvex::fuzz {

MemoryFile::MemoryFile(ByteView content)
    : _descriptor(memfd_create("orvex-fuzz", MFD_CLOEXEC))
    , _path("/proc/self/fd/" + std::to_string(_descriptor))
{
    require(_descriptor >= 0, "a file in memory");
    const auto written = write(_descriptor, content.data(), content.size());
    require(written == static_cast<ssize_t>(content.size()), "the content of a file in memory");
}

MemoryFile::~MemoryFile()
{
    close(_descriptor);
}

} // namespace orvex::fuzz
