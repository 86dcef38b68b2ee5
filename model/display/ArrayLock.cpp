#include "ArrayLock.h"

#include <cstdint>
#include <mutex>

namespace orvex {

namespace {
struct LockState {
    std::recursive_mutex mutex;
    std::uint8_t depth = 0;
};

// Never destroyed: the mutex may still hold the locks of nested arrays when the process ends.
LockState& state()
{
    static auto* const kState = new LockState;
    return *kState;
}
} // namespace

void ArrayLock::lockArray()
{
    state().mutex.lock();
    ++state().depth;
}

void ArrayLock::unlockArray()
{
    if (--state().depth == 0)
        state().mutex.unlock();
}

} // namespace orvex
