#include "C2K/LogCode_0x119C_ActiveSet.h"

#include "ArrayOutOfBoundsException.h"

#include <cmath>

namespace orvex {

std::optional<LogCode_0x119C_ActiveSet::Pilot> LogCode_0x119C_ActiveSet::pilot(int index) const
{
    if (index < 0 || index >= count())
        throw ArrayOutOfBoundsException();
    const auto fingers = static_cast<std::size_t>(field8(9));
    const std::size_t stride = (6 * fingers + 15) & 0xFFC;
    const std::size_t start = 12 + static_cast<std::size_t>(index) * stride;
    const auto pn = _subpacket.u16(start);
    const auto energy = _subpacket.u16(start + 12 + 4 * fingers);
    if (!pn || !energy)
        return std::nullopt;
    return Pilot{*pn, strengthOf(*energy)};
}

double LogCode_0x119C_ActiveSet::strengthOf(int energy) const
{
    const double m = field16(4);
    const double g = field8(6);
    const int exponent = 2 * field8(7) - 3;
    const double strength = std::ldexp(energy, exponent) / (9 * m * m * g) - 1 / m;
    return std::fmax(strength, kFloor); // the floor, too, for what a length of zero makes of it: no number
}

} // namespace orvex
