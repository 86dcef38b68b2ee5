#include "FatalErrors.h"

#include "SystemLog.h"

#include <atomic>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cxxabi.h>
#include <exception>
#include <memory>
#include <string>
#include <thread>
#include <typeinfo>
#include <utility>

namespace orvex {

namespace {
struct Free {
    void operator()(char* memory) const
    {
        std::free(memory);
    } // NOLINT: the demangler hands out malloc's memory
};

std::string readableName(const std::type_info& type)
{
    int status = 0;
    const std::unique_ptr<char, Free> name(abi::__cxa_demangle(type.name(), nullptr, nullptr, &status));
    return name ? name.get() : type.name();
}

std::string descriptionOfCurrentException()
{
    const std::type_info* type = abi::__cxa_current_exception_type();
    if (!type)
        return "terminated without an exception";
    std::string description = "uncaught exception of type " + readableName(*type);
    try {
        throw;
    } catch (const std::exception& exception) {
        description += std::string(": ") + exception.what();
    } catch (...) { // NOLINT(bugprone-empty-catch): nothing more is known of it
    }
    return description;
}

[[noreturn]] void sayWhyAndAbort()
{
    static std::atomic_flag isTold = ATOMIC_FLAG_INIT;
    thread_local bool isTelling = false;
    if (std::exchange(isTelling, true))
        std::abort(); // telling failed in its turn
    if (isTold.test_and_set()) {
        // Another thread has the word and will end the process.
        std::this_thread::sleep_for(std::chrono::seconds(10));
        std::abort();
    }
    const std::string description = descriptionOfCurrentException();
    if (SystemLog* log = SystemLog::installed()) {
        systemLog(Priority::error, "Fatal: %s", description.c_str());
        log->flush();
    } else {
        std::fprintf(stderr, "Fatal: %s\n", description.c_str());
    }
    std::abort();
}
} // namespace

void installFatalErrorHandler()
{
    std::set_terminate(sayWhyAndAbort);
}

} // namespace orvex
