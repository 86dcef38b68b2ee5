#include "IFXTown.h"

#include "packets/PacketWriter.h"

#include <algorithm>
#include <cmath>
#include <functional>

namespace orvex::korat {

namespace {
constexpr double kMargin = 4;          // dB
constexpr int kStepsToTrigger = 10;    // 1 s
constexpr double kWeakestLevel = -115; // dBm
constexpr double kStrongestLevel = -25;
constexpr double kNoise = -102;      // dBm, in a UMTS carrier's 3.84 MHz
constexpr double kWeakestEcN0 = -24; // dB
constexpr double kPilotShare = 0.25; // of the power of a UMTS carrier

constexpr RadioField::Underpass kUnderpass{1500, 1750};
constexpr double kAreaBorder = 1250; // m
constexpr int kSites = 7;            // 400 m apart
constexpr int kGSMCells = 14;
constexpr int kUARFCN = 10588;

std::vector<RadioField::Transmitter> transmitters()
{
    std::vector<RadioField::Transmitter> result;
    for (int i = 0; i < kSites; ++i) {
        RadioField::Transmitter site;
        site.position = 400.0 * i;
        site.levelAt20m = -40;
        result.push_back(site);
    }
    for (int i = 0; i < kGSMCells; ++i) {
        RadioField::Transmitter cell;
        cell.position = IFXTown::kRoadLength * i / (kGSMCells - 1);
        cell.offset = 60;
        cell.levelAt20m = IFXTown::kGSMLevelAt20m;
        result.push_back(cell);
    }
    RadioField::Transmitter underground;
    underground.position = (kUnderpass.from + kUnderpass.to) / 2;
    underground.isUnderground = true;
    result.push_back(underground);
    return result;
}

std::vector<IFXReport::Cell> cells()
{
    std::vector<IFXReport::Cell> result;
    for (const auto& transmitter : transmitters()) {
        const int i = static_cast<int>(result.size());
        IFXReport::Cell cell;
        cell.isUMTS = i < kSites;
        cell.carrier = cell.isUMTS ? kUARFCN : 1 + 37 * i % 124;
        cell.code = cell.isUMTS ? 9 + 48 * i : 11 * i % 64;
        cell.cellID = (cell.isUMTS ? 212 << 16 | 3100 : 2001) + 7 * i;
        cell.areaCode = transmitter.position < kAreaBorder ? 5120 : 5121;
        result.push_back(cell);
    }
    return result;
}
} // namespace

IFXTown::IFXTown()
    : _cells(cells())
    , _field(transmitters(), kUnderpass, kWeakestLevel, kStrongestLevel)
    , _selector(kMargin, kStepsToTrigger)
{
}

bool IFXTown::step(double position, Randomness& randomness)
{
    _field.step(position, randomness);
    return _selector.step(_field);
}

std::vector<IFXReport::Cell> IFXTown::others(double weakest) const
{
    std::vector<IFXReport::Cell> result;
    for (std::size_t i = 0; i < _cells.size(); ++i) {
        const IFXReport::Cell cell = measured(i);
        const bool isHeard = cell.level >= weakest && (!cell.isUMTS || cell.ecN0 > kWeakestEcN0);
        if (isHeard && i != _selector.serving())
            result.push_back(cell);
    }
    std::ranges::sort(result, std::greater{}, &IFXReport::Cell::level);
    return result;
}

IFXReport::Cell IFXTown::measured(std::size_t cell) const
{
    double total = ratioOf(kNoise); // mW
    for (std::size_t i = 0; i < _cells.size(); ++i)
        total += _cells[i].isUMTS ? ratioOf(_field.level(i)) / kPilotShare : 0;
    IFXReport::Cell result = _cells[cell];
    result.level = _field.level(cell);
    if (result.isUMTS)
        result.ecN0 = std::max(result.level - 10 * std::log10(total), kWeakestEcN0);
    return result;
}

} // namespace orvex::korat
