#include "Randomness.h"

namespace orvex::korat {

// The SplitMix64 generator: a counter, well mixed.
std::uint64_t Randomness::bits()
{
    _state += 0x9E3779B97F4A7C15;
    std::uint64_t mixed = _state;
    mixed = (mixed ^ mixed >> 30) * 0xBF58476D1CE4E5B9;
    mixed = (mixed ^ mixed >> 27) * 0x94D049BB133111EB;
    return mixed ^ mixed >> 31;
}

double Randomness::share()
{
    return static_cast<double>(bits() >> 11) * 0x1p-53;
}

int Randomness::number(int first, int last)
{
    return first + static_cast<int>(share() * (static_cast<double>(last) - first + 1));
}

double Randomness::normal()
{
    // The sum of four even shares has the mean 2 and the variance 1/3.
    constexpr double kDeviation = 0.57735026918962576;
    const std::uint64_t four = bits();
    const std::uint64_t sum = (four & 0xFFFF) + (four >> 16 & 0xFFFF) + (four >> 32 & 0xFFFF) + (four >> 48);
    return (static_cast<double>(sum) / 0xFFFF - 2) / kDeviation;
}

} // namespace orvex::korat
