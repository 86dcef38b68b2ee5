#include "StandardStreams.h"

#include <cerrno>
#include <cstdlib>
#include <initializer_list>

#include <fcntl.h>
#include <unistd.h>

namespace orvex {

void occupyStandardStreams()
{
    for (const int stream : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        // The lowest free number is this one.
        const bool isMissing = ::fcntl(stream, F_GETFD) < 0 && errno == EBADF;
        if (isMissing && ::open("/dev/null", O_RDONLY) != stream)
            std::_Exit(EXIT_FAILURE);
    }
}

} // namespace orvex
