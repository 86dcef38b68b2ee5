#pragma once

#include <QString>

#include <chrono>
#include <functional>
#include <optional>

namespace orvex {

// Finds a row by the beginning of its name as it is typed. Repeating a letter moves to the next row that
// begins with it.
class TypeAhead {
public:
    using Clock = std::chrono::steady_clock;

    // Adds a character. After a pause of more than a second, typing starts over.
    void type(const QString& character, Clock::time_point now = Clock::now());
    bool isTyping(Clock::time_point now = Clock::now()) const;

    // The next matching row from the current one (-1 for none), wrapping around. Absent if no name begins
    // with the typed text.
    std::optional<int> row(int count, int current, const std::function<QString(int row)>& nameOf) const;

private:
    QString _typed;
    Clock::time_point _last;
};

} // namespace orvex
