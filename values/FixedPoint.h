#pragma once

#include <string>
#include <string_view>

namespace orvex {

// Appends what printf makes of a number by a conversion such as "%4.2f" or "%lf", if that is plain: a width
// and up to six decimals, and a number that is a whole count of 1/65536 below 2^26, as the scaled fields of
// packets are. Appends nothing and returns false for any other.
//
// Such numbers are rounded in integers, exactly, a half to the even digit as printf does.
bool appendFixedPoint(std::string& text, std::string_view conversion, double number);

} // namespace orvex
