#pragma once

#include <clocale>
#include <memory>

namespace orvex {

struct PropertyListNodeFree {
    void operator()(void* node) const;
};

// A node of libplist that is not part of a tree, with all below it.
using PropertyListNode = std::unique_ptr<void, PropertyListNodeFree>;

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

// Property lists count dates from 2001-01-01 00:00:00 UTC.
inline constexpr double kPropertyListEpoch = 978'307'200; // seconds since 1970

} // namespace orvex
