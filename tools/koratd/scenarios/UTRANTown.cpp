#include "UTRANTown.h"

namespace orvex::korat {

namespace {
constexpr double kMargin = 3;         // dB
constexpr int kStepsToTrigger = 6;    // 0.6 s
constexpr double kWeakestRSCP = -115; // dBm
constexpr double kStrongestRSCP = -25;
constexpr double kWeakestGSM = -110; // dBm
constexpr double kStrongestGSM = -47;

constexpr RadioField::Underpass kUnderpass{2500, 2750};
constexpr double kMarketPlace = 1500; // m
constexpr double kAreaBorder = 1900;  // m
constexpr int kSites = 10;
constexpr int kSmallCells = 40;
constexpr int kGSMCells = 44;
constexpr int kFrequencies[] = {10055, 10063, 10071}; // band 34, 200 kHz each

RadioField::Transmitter siteTransmitter(int site)
{
    RadioField::Transmitter transmitter;
    transmitter.position = 400.0 * site;
    transmitter.levelAt20m = -45;
    return transmitter;
}

RadioField::Transmitter smallTransmitter(int i)
{
    RadioField::Transmitter transmitter;
    transmitter.position = kMarketPlace - 160 + 8 * i;
    transmitter.offset = 60;
    transmitter.levelAt20m = -58;
    transmitter.slope = 45;
    return transmitter;
}

RadioField::Transmitter undergroundTransmitter()
{
    RadioField::Transmitter transmitter;
    transmitter.position = (kUnderpass.from + kUnderpass.to) / 2;
    transmitter.isUnderground = true;
    return transmitter;
}

RadioField::Transmitter gsmTransmitter(int i)
{
    RadioField::Transmitter transmitter;
    transmitter.position = UTRANTown::kRoadLength * i / kGSMCells;
    transmitter.offset = 30 + 10 * (i % 7);
    transmitter.levelAt20m = -40;
    return transmitter;
}

std::vector<RadioField::Transmitter> utranTransmitters()
{
    std::vector<RadioField::Transmitter> result;
    result.reserve(kSites + kSmallCells + 1);
    for (int site = 0; site < kSites; ++site)
        result.push_back(siteTransmitter(site));
    for (int i = 0; i < kSmallCells; ++i)
        result.push_back(smallTransmitter(i));
    result.push_back(undergroundTransmitter());
    return result;
}

std::vector<UTRANCell> utranCells()
{
    std::vector<UTRANCell> result;
    for (const auto& transmitter : utranTransmitters()) {
        const int i = static_cast<int>(result.size());
        const bool isSmall = i >= kSites && i < kSites + kSmallCells;
        UTRANCell cell;
        cell.uarfcn = kFrequencies[i % 3];
        cell.cellParameterID = (5 + 9 * i) % 128;
        cell.cellIdentity = 212 << 16 | (3100 + 7 * i);
        cell.locationAreaCode = transmitter.position < kAreaBorder ? 5120 : 5121;
        cell.uraID = transmitter.position < kAreaBorder ? 12 : 13;
        cell.isListed = !isSmall || i % 4 != 0;
        cell.isBarred = isSmall && i % 5 == 0;
        result.push_back(cell);
    }
    return result;
}

std::vector<RadioField::Transmitter> gsmTransmitters()
{
    std::vector<RadioField::Transmitter> result;
    result.reserve(kGSMCells);
    for (int i = 0; i < kGSMCells; ++i)
        result.push_back(gsmTransmitter(i));
    return result;
}

std::vector<GSMCell> gsmCellsOfTown()
{
    std::vector<GSMCell> result;
    result.reserve(kGSMCells);
    for (int i = 0; i < kGSMCells; ++i)
        result.push_back({1 + (37 * i) % 124, i % 8, (i / 8) % 8, 2001 + 3 * i});
    return result;
}
} // namespace

UTRANTown::UTRANTown()
    : _cells(utranCells())
    , _field(utranTransmitters(), kUnderpass, kWeakestRSCP, kStrongestRSCP)
    , _selector(kMargin, kStepsToTrigger)
    , _gsmCells(gsmCellsOfTown())
    , _gsmField(gsmTransmitters(), kUnderpass, kWeakestGSM, kStrongestGSM)
{
}

bool UTRANTown::step(double position, Randomness& randomness)
{
    _field.step(position, randomness);
    _gsmField.step(position, randomness);
    return _selector.step(_field);
}

Heard<UTRANCell> UTRANTown::serving() const
{
    return {&_cells[_selector.serving()], _field.level(_selector.serving())};
}

std::vector<Heard<UTRANCell>> UTRANTown::others(double weakest) const
{
    auto result = heardCells(_cells, _field, weakest);
    std::erase_if(result, [this](const auto& each) { return each.cell == serving().cell; });
    return result;
}

std::vector<Heard<GSMCell>> UTRANTown::gsmCells(double weakest) const
{
    return heardCells(_gsmCells, _gsmField, weakest);
}

} // namespace orvex::korat
