#include "modem/Cell.h"

#include "EnumTable.h"

#include <algorithm>

namespace orvex::korat {

namespace {
constexpr EnumText kRadios[] = {
    {static_cast<int>(Radio::gsm), "GSM"},
    {static_cast<int>(Radio::umts), "UMTS"},
    {static_cast<int>(Radio::tdscdma), "TD-SCDMA"},
    {static_cast<int>(Radio::cdma), "CDMA"},
    {static_cast<int>(Radio::lte), "LTE"},
    {static_cast<int>(Radio::nr5g), "5G"},
};

constexpr std::size_t kCountryDigits = 3;
} // namespace

const char* nameOf(Radio radio)
{
    return textFor(static_cast<int>(radio), kRadios, "");
}

std::optional<Network> Network::of(const std::string& operatorId)
{
    const auto isDigit = [](char character) { return character >= '0' && character <= '9'; };
    if ((operatorId.size() != 5 && operatorId.size() != 6) || !std::ranges::all_of(operatorId, isDigit))
        return std::nullopt;
    const std::string country = operatorId.substr(0, kCountryDigits);
    const std::string network = operatorId.substr(kCountryDigits);
    return Network{std::stoi(country), std::stoi(network), country + '-' + network};
}

} // namespace orvex::korat
