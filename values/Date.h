#pragma once

#include <compare>
#include <string>

namespace orvex {

// A moment, in seconds since 1970-01-01 00:00:00 UTC.
struct Date {
    double secondsSince1970 = 0;

    friend auto operator<=>(const Date&, const Date&) = default;
};

// In UTC and whole seconds: "2026-11-16 05:54:31 +0000".
std::string dateText(Date date);

} // namespace orvex
