#pragma once

#include <cstdlib>
#include <optional>
#include <string>

namespace orvex::test {

// Sets or, with null, unsets an environment variable while it lives.
class Environment {
public:
    Environment(const char* name, const char* value)
        : _name(name)
    {
        if (const char* before = std::getenv(name))
            _before = before;
        set(value);
    }
    ~Environment() { set(_before ? _before->c_str() : nullptr); }
    Environment(const Environment&) = delete;
    Environment& operator=(const Environment&) = delete;

private:
    // Tests change the environment before they start threads.
    void set(const char* value)
    {
        if (value)
            setenv(_name, value, 1); // NOLINT(concurrency-mt-unsafe)
        else
            unsetenv(_name); // NOLINT(concurrency-mt-unsafe)
    }

    const char* _name;
    std::optional<std::string> _before;
};

} // namespace orvex::test
