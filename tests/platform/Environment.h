#pragma once

#include <cstdlib>

namespace orvex::test {

// Sets a variable or, with null, unsets it. Not safe beside other threads.
inline void setEnvironment(const char* name, const char* value)
{
    value ? setenv(name, value, 1) : unsetenv(name); // NOLINT(concurrency-mt-unsafe)
}

} // namespace orvex::test
