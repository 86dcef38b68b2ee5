#include "C2K/BandClass.h"

#include "EnumTable.h"

namespace orvex {

namespace {
constexpr EnumText kBandClasses[] = {
    {0, "800 MHz cellular band [0]"},
    {1, "1.8 to 2.0GHz PCS band [1]"},
    {2, "872 to 960MHz TACS band [2]"},
    {3, "832 to 925MHz JTACS band [3]"},
    {4, "1.75 to 1.87GHz Korean PCS band [4]"},
    {5, "450MHz band [5]"},
    {6, "2GHz band [6]"},
    {7, "700MHz band [7]"},
    {8, "1800 MHz band [8]"},
    {9, "900 MHzband [9]"}, // without the blank, as it has always been shown
    {10, "Secondary 800 MHz band [10]"},
    {11, "400 MHz European PAMR band [11]"},
    {12, "800 MHz European PAMR band [12]"},
};
} // namespace

DeferredText bandClassText(int bandClass)
{
    return textOrNumberFor(bandClass, kBandClasses, "[Bad Value %d]");
}

} // namespace orvex
