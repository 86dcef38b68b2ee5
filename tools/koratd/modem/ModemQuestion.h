#pragma once

#include <chrono>
#include <cstdint>

namespace orvex::korat {

// A question to the modem that is asked again and again, but never before the answer to the last one: a modem
// may take minutes for one.
class ModemQuestion {
public:
    using Time = std::chrono::steady_clock::time_point;

    bool mayBeAsked(Time now) const { return !_isPending && now >= _notBefore; }
    // Whether the answer has been awaited for so long.
    bool isOverdue(Time now, std::chrono::seconds longest) const
    {
        return _isPending && now - _asked >= longest;
    }

    // The number of the question, which its answer takes along.
    std::uint64_t ask(Time now)
    {
        _isPending = true;
        _asked = now;
        return ++_number;
    }
    // False when the question is no longer of interest.
    bool answer(std::uint64_t number)
    {
        const bool isAwaited = _isPending && number == _number;
        _isPending = _isPending && !isAwaited;
        return isAwaited;
    }

    void waitUntil(Time time) { _notBefore = time; }
    void giveUp() { _notBefore = Time::max(); }
    // For another modem.
    void forget()
    {
        _isPending = false;
        _notBefore = {};
    }

private:
    bool _isPending = false;
    Time _asked;
    Time _notBefore;
    std::uint64_t _number = 0;
};

} // namespace orvex::korat
