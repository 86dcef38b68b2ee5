#pragma once

#include <QString>

#include <chrono>
#include <functional>
#include <optional>

namespace orvex {

// Finds a row by the beginning of its name, typed letter by letter. The same letter again goes to the next
// row that begins with it.
class TypeAhead {
public:
    using Clock = std::chrono::steady_clock;

    // Adds a character. What was typed more than a second before is forgotten.
    void type(const QString& character, Clock::time_point now = Clock::now());
    bool isTyping(Clock::time_point now = Clock::now()) const;

    // The row to go to from the current one, which is -1 for none, around the end; absent when no name begins
    // with what was typed.
    std::optional<int> row(int count, int current, const std::function<QString(int row)>& nameOf) const;

private:
    QString _typed;
    Clock::time_point _last;
};

} // namespace orvex
