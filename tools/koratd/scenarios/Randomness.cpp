#include "Randomness.h"

namespace orvex::korat {

double Randomness::share()
{
    return static_cast<double>(_engine() >> 11) * 0x1p-53;
}

int Randomness::number(int first, int last)
{
    return first + static_cast<int>(share() * (static_cast<double>(last) - first + 1));
}

double Randomness::normal()
{
    // The sum of twelve even shares has the variance 1.
    double sum = -6;
    for (int i = 0; i < 12; ++i)
        sum += share();
    return sum;
}

} // namespace orvex::korat
