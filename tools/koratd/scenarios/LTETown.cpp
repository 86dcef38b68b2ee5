#include "LTETown.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
constexpr double kMargin = 3;         // dB
constexpr int kStepsToTrigger = 6;    // 0.6 s
constexpr double kWeakestRSRP = -140; // dBm
constexpr double kStrongestRSRP = -44;
constexpr double kWeakestRSRQ = -20; // dB
constexpr double kStrongestRSRQ = -3;
constexpr double kNoise = -125;             // dBm in 15 kHz, receiver included
constexpr double kElementsPerBlock = 10.79; // 12, in dB
constexpr double kAverageStep = 0.1;
constexpr double kCellLoad = 0.5; // share of a cell's resource elements in use

const RadioField::Underpass kUnderpass{2650, 2900};
constexpr double kMarketPlace = 1900;        // m
constexpr double kTrackingAreaBorder = 2300; // m

double milliwatts(double dBm)
{
    return std::pow(10, dBm / 10);
}
double decibels(double ratio)
{
    return 10 * std::log10(ratio);
}
} // namespace

const std::vector<LTECarrier>& LTETown::carriers()
{
    static const std::vector<LTECarrier> all{{6300, 20, 50, 4}, {1300, 3, 100, 5}, {3100, 7, 100, 6}};
    return all;
}

// Cells and their transmitters, side by side.
struct LTETown::Plan {
    std::vector<LTECell> cells;
    std::vector<RadioField::Transmitter> transmitters;

    void add(int enodeB, int sector, const LTECarrier& carrier, const RadioField::Transmitter& transmitter)
    {
        LTECell cell;
        cell.carrier = &carrier;
        cell.physicalCellID = static_cast<int>((7 + 11 * cells.size()) % 504);
        cell.cellIdentity = enodeB << 8 | sector;
        cell.trackingAreaCode = transmitter.position < kTrackingAreaBorder ? 4301 : 4302;
        cell.transmitAntennas = carrier.band == 20 ? 2 : 4;
        cells.push_back(cell);
        transmitters.push_back(transmitter);
    }

    // Two sectors: one looks ahead, one back along the road.
    void addSite(int enodeB, double position, const LTECarrier& carrier, double levelAt20m)
    {
        const int firstSector = carrier.band; // sectors are numbered by band, as operators like to do
        for (const int direction : {1, -1}) {
            RadioField::Transmitter transmitter;
            transmitter.position = position;
            transmitter.levelAt20m = levelAt20m;
            transmitter.direction = direction;
            add(enodeB, firstSector + (direction > 0 ? 0 : 1), carrier, transmitter);
        }
    }

    void addSmallCells(int enodeB, const LTECarrier& carrier)
    {
        constexpr int kCount = 40;
        for (int i = 0; i < kCount; ++i) {
            RadioField::Transmitter transmitter;
            transmitter.position = kMarketPlace - 160 + 8 * i;
            transmitter.offset = 60;
            transmitter.levelAt20m = -75;
            transmitter.slope = 45;
            add(enodeB + i / 10, i % 10 + 1, carrier, transmitter);
        }
    }
};

LTETown::LTETown()
    : LTETown([] {
        const LTECarrier& wide = carriers()[0];
        const LTECarrier& town = carriers()[1];
        const LTECarrier& fast = carriers()[2];
        Plan plan;
        plan.addSite(40321, 100, wide, -58);
        plan.addSite(40322, 600, wide, -58);
        plan.addSite(40322, 600, town, -63);
        plan.addSite(40323, 1150, town, -63);
        plan.addSite(40324, 1650, town, -63);
        plan.addSite(40325, 2250, town, -63);
        plan.addSite(40326, 3150, town, -64);
        plan.addSite(40326, 3150, fast, -61);
        plan.addSite(40327, 3600, fast, -62);
        plan.addSite(40327, 3600, wide, -59);
        plan.addSite(40328, 4150, wide, -58);
        plan.addSmallCells(40410, town);
        RadioField::Transmitter underground;
        underground.position = (kUnderpass.from + kUnderpass.to) / 2;
        underground.levelAt20m = -63;
        underground.isUnderground = true;
        plan.add(40330, 1, town, underground);
        return plan;
    }())
{
}

LTETown::LTETown(Plan plan)
    : _cells(std::move(plan.cells))
    , _field(std::move(plan.transmitters), kUnderpass, kWeakestRSRP, kStrongestRSRP)
    , _selector(kMargin, kStepsToTrigger)
{
}

bool LTETown::step(double position, Randomness& randomness)
{
    _field.step(position, randomness);
    listen();
    return _selector.step(_field);
}

void LTETown::listen()
{
    _received.assign(carriers().size(), milliwatts(kNoise));
    for (std::size_t i = 0; i < _cells.size(); ++i) {
        const auto carrier = static_cast<std::size_t>(_cells[i].carrier - carriers().data());
        if (_field.level(i) > kWeakestRSRP)
            _received[carrier] += kCellLoad * milliwatts(_field.level(i));
    }
    for (double& power : _received)
        power = decibels(power);
    for (std::size_t i = 0; i < _cells.size(); ++i) {
        if (_averageRSRQ.size() == i)
            _averageRSRQ.push_back(rsrq(i));
        _averageRSRQ[i] += (rsrq(i) - _averageRSRQ[i]) * kAverageStep;
    }
}

double LTETown::rsrq(std::size_t cell) const
{
    // RSRQ = N RSRP / RSSI, and the RSSI sums the 12 resource elements of each of the N resource blocks.
    const auto carrier = static_cast<std::size_t>(_cells[cell].carrier - carriers().data());
    const double rsrq = _field.level(cell) - _received[carrier] - kElementsPerBlock;
    return std::clamp(rsrq, kWeakestRSRQ, kStrongestRSRQ);
}

LTETown::Heard LTETown::heard(std::size_t cell) const
{
    Heard result;
    result.cell = &_cells[cell];
    result.rsrp = _field.level(cell);
    result.averageRSRP = _field.average(cell);
    result.rsrq = rsrq(cell);
    result.averageRSRQ = _averageRSRQ[cell];
    result.rssi = result.rsrp + decibels(result.cell->carrier->resourceBlocks) - result.rsrq;
    return result;
}

std::vector<LTETown::Heard> LTETown::othersOn(
    const LTECarrier& carrier, double weakest, double strongest) const
{
    std::vector<Heard> result;
    for (std::size_t i = 0; i < _cells.size(); ++i) {
        const double level = _field.level(i);
        if (i != _selector.serving() && _cells[i].carrier == &carrier && level >= weakest
            && level < strongest)
            result.push_back(heard(i));
    }
    std::sort(result.begin(), result.end(), [](const Heard& a, const Heard& b) { return a.rsrp > b.rsrp; });
    return result;
}

} // namespace orvex::korat
