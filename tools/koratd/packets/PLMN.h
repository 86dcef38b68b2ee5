#pragma once

namespace orvex::korat {

// A network: country code and network code, which has two digits or three.
struct PLMN {
    int mcc = 0;
    int mnc = 0;
    int mncDigits = 2;
};

// A digit of a code by its place: 0 is the last one.
constexpr int digit(int code, int place)
{
    for (; place > 0; --place)
        code /= 10;
    return code % 10;
}

} // namespace orvex::korat
