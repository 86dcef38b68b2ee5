#include "Date.h"

#include "TextFormat.h"

#include <algorithm>
#include <chrono>
#include <cmath>

namespace orvex {

std::string dateText(Date date)
{
    using namespace std::chrono;
    // std::chrono::year covers -32767 to 32767; dates outside are clamped.
    constexpr double kFarthest = 9.0e11;
    const double whole = std::floor(std::isnan(date.secondsSince1970) ? 0 : date.secondsSince1970);
    const sys_seconds moment{seconds(static_cast<long long>(std::clamp(whole, -kFarthest, kFarthest)))};
    const auto day = floor<days>(moment);
    const year_month_day calendar(day);
    const hh_mm_ss time(moment - day);
    return text("%04d-%02u-%02u %02d:%02d:%02d +0000", static_cast<int>(calendar.year()),
        static_cast<unsigned>(calendar.month()), static_cast<unsigned>(calendar.day()),
        static_cast<int>(time.hours().count()), static_cast<int>(time.minutes().count()),
        static_cast<int>(time.seconds().count()));
}

} // namespace orvex
