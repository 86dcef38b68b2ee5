#include "TypeAhead.h"

#include <algorithm>

namespace orvex {

namespace {
using namespace std::chrono_literals;

constexpr auto kLongestPause = 1s;
} // namespace

void TypeAhead::type(const QString& character, Clock::time_point now)
{
    if (!isTyping(now))
        _typed.clear();
    _typed += character;
    _last = now;
}

bool TypeAhead::isTyping(Clock::time_point now) const
{
    return !_typed.isEmpty() && now - _last <= kLongestPause;
}

std::optional<int> TypeAhead::row(int count, int current, const std::function<QString(int row)>& nameOf) const
{
    const bool repeatsLetter = std::ranges::count(_typed, _typed[0]) == _typed.size();
    const QString sought = repeatsLetter ? _typed.left(1) : _typed;
    // More letters of a name may leave the row where it is; a new or repeated one asks for another.
    const int first = repeatsLetter ? current + 1 : std::max(current, 0);
    for (int step = 0; step < count; ++step) {
        const int row = (first + step) % count;
        if (nameOf(row).startsWith(sought, Qt::CaseInsensitive))
            return row;
    }
    return std::nullopt;
}

} // namespace orvex
