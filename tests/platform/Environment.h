#pragma once

#include <cstdlib>

namespace orvex::test {

// Sets or, with null, unsets a variable, before there are threads.
inline void setEnvironment(const char* name, const char* value)
{
    value ? setenv(name, value, 1) : unsetenv(name); // NOLINT(concurrency-mt-unsafe)
}

} // namespace orvex::test
