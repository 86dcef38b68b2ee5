#pragma once

#include <stdexcept>
#include <string>

namespace orvex {

// Something that must hold does not, and the process ends: nobody catches it. Says what failed and, in
// parentheses, where.
class AssertionFailure : public std::runtime_error {
public:
    // `file` is the source file without its suffix.
    AssertionFailure(const std::string& description, const char* method, const char* file, int line)
        : std::runtime_error(
            description + " (" + method + ", " + file + ", line " + std::to_string(line) + ")")
        , _file(file)
        , _line(line)
    {
    }

    const char* file() const { return _file; }
    int line() const { return _line; }

private:
    const char* _file;
    int _line;
};

} // namespace orvex
