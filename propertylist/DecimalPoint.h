#pragma once

#include <clocale>

namespace orvex {

// While it lives, this thread reads and writes numbers with a decimal point, whatever the user's locale.
class DecimalPoint {
public:
    DecimalPoint();
    ~DecimalPoint();
    DecimalPoint(const DecimalPoint&) = delete;
    DecimalPoint& operator=(const DecimalPoint&) = delete;

private:
    locale_t _previous;
};

} // namespace orvex
