#include "WCDMALayer.h"

#include "GSMTown.h"

#include <algorithm>
#include <cmath>
#include <iterator>

namespace orvex::korat {

namespace {
constexpr double kMargin = 3;         // dB
constexpr int kStepsToTrigger = 6;    // 0.6 s
constexpr double kWeakestRSCP = -115; // dBm
constexpr double kStrongestRSCP = -25;
constexpr double kWeakestEcNo = -24;    // dB
constexpr double kNoise = -103;         // dBm in 3.84 MHz, receiver included
constexpr double kPowerOverPilot = 3.5; // a pilot sends a tenth of its cell's power; cells are half empty

constexpr int kFrequencies[] = {10588, 10563};
constexpr int kSites = 16;
constexpr int kSmallCells = 36;
constexpr double kMarketRadius = 144; // m

std::vector<RadioField::Transmitter> transmitters()
{
    return gsmTown::transmittersAt({.wide = kSites,
        .small = kSmallCells,
        .marketRadius = kMarketRadius,
        .wideLevelAt20m = -48,
        .smallLevelAt20m = -52,
        .nearest = 60,
        .furtherBy = 70,
        .distances = 3});
}

std::vector<WCDMACell> cells()
{
    std::vector<WCDMACell> result;
    for (const auto& transmitter : transmitters()) {
        const int i = static_cast<int>(result.size());
        const bool isSmall = i >= kSites && i < kSites + kSmallCells;
        WCDMACell cell;
        cell.uarfcn = kFrequencies[isSmall ? 1 : 0];
        cell.scramblingCode = (37 + 83 * i) % 512;
        cell.cellIdentity = 318 << 16 | (4100 + 11 * i);
        cell.uraID = transmitter.position < gsmTown::kMarketPlace ? 31 : 32;
        cell.isListed = i % 4 != 3;
        result.push_back(cell);
    }
    return result;
}

double milliwatts(double dBm)
{
    return std::pow(10, dBm / 10);
}

std::size_t frequencyIndex(const WCDMACell& cell)
{
    return static_cast<std::size_t>(std::ranges::find(kFrequencies, cell.uarfcn) - std::begin(kFrequencies));
}
} // namespace

WCDMALayer::WCDMALayer()
    : _cells(cells())
    , _field(transmitters(), gsmTown::kUnderpass, kWeakestRSCP, kStrongestRSCP)
    , _selector(kMargin, kStepsToTrigger)
{
}

bool WCDMALayer::step(double position, Randomness& randomness)
{
    _field.step(position, randomness);
    _received.assign(std::size(kFrequencies), milliwatts(kNoise));
    for (std::size_t i = 0; i < _cells.size(); ++i) {
        if (_field.level(i) > kWeakestRSCP)
            _received[frequencyIndex(_cells[i])] += milliwatts(_field.level(i) + kPowerOverPilot);
    }
    for (double& power : _received)
        power = 10 * std::log10(power);
    return _selector.step(_field);
}

std::vector<WCDMALayer::Heard> WCDMALayer::others(double weakest) const
{
    std::vector<Heard> result;
    for (std::size_t i = 0; i < _cells.size(); ++i) {
        if (i != _selector.serving() && _field.level(i) >= weakest)
            result.push_back(heard(i));
    }
    std::sort(result.begin(), result.end(), [](const Heard& a, const Heard& b) { return a.rscp > b.rscp; });
    return result;
}

WCDMALayer::Heard WCDMALayer::heard(std::size_t cell) const
{
    Heard result;
    result.cell = &_cells[cell];
    result.rscp = _field.level(cell);
    result.averageRSCP = _field.average(cell);
    result.ecNo = std::max(result.rscp - received(*result.cell), kWeakestEcNo);
    return result;
}

double WCDMALayer::received(const WCDMACell& cell) const
{
    return _received[frequencyIndex(cell)];
}

} // namespace orvex::korat
