#include "C2KTown.h"

#include "packets/PacketWriter.h"

#include <algorithm>
#include <cmath>
#include <functional>

namespace orvex::korat {

namespace {
using Roaming = C2K1xSystemPacket::Roaming;

constexpr double kMargin = 3;          // dB
constexpr int kStepsToTrigger = 6;     // 0.6 s
constexpr double kWeakestLevel = -125; // dBm
constexpr double kStrongestLevel = -25;
constexpr double kNoise = -105;             // dBm, in a carrier's 1.23 MHz
constexpr double kDistortion = 0.05;        // of a transmitter and a receiver: nothing is cleaner than 13 dB
constexpr double kLostPilot = -28;          // dB
constexpr double kPilotShare = 0.2;         // of the power of a 1x carrier
constexpr double kOpenLoopSum = -73;        // dBm of received and transmitted power, as standardised
constexpr double kWeakestTransmitter = -50; // dBm
constexpr double kStrongestTransmitter = 23;

constexpr RadioField::Underpass kUnderpass{1900, 2150};
constexpr int kSites = 10;

constexpr C2KSystem kSystems[] = {
    {1300, 4106, 7, Roaming::off, 0, 384, 507, 12},
    {2700, 4122, 65535, Roaming::on, 0, 283, 466, 40},
    {HUGE_VAL, 5213, 21, Roaming::alliancePartner, 1, 425, 675, 133},
};

// Two sectors a site, one along the road and one back.
std::vector<RadioField::Transmitter> transmitters()
{
    std::vector<RadioField::Transmitter> result;
    for (int site = 0; site < kSites; ++site) {
        for (const int direction : {1, -1}) {
            RadioField::Transmitter transmitter;
            transmitter.position = 400.0 * site;
            transmitter.levelAt20m = -45;
            transmitter.direction = direction;
            result.push_back(transmitter);
        }
    }
    return result;
}

std::vector<C2KSector> sectors()
{
    std::vector<C2KSector> result;
    for (const auto& transmitter : transmitters()) {
        const int i = static_cast<int>(result.size());
        const auto* system =
            std::ranges::find_if(kSystems, [&](const auto& each) { return transmitter.position < each.end; });
        C2KSector sector;
        sector.pnOffset = (12 + 168 * (i % 2) + 4 * 13 * (i / 2)) % 512;
        sector.baseID = 2049 + 16 * (i / 2) + i % 2;
        sector.packetZoneID = 1 + static_cast<int>(system - std::begin(kSystems));
        sector.system = system;
        result.push_back(sector);
    }
    return result;
}

double decibels(double ratio)
{
    return 10 * std::log10(ratio);
}
} // namespace

C2KTown::C2KTown()
    : _sectors(sectors())
    , _field(transmitters(), kUnderpass, kWeakestLevel, kStrongestLevel)
    , _selector(kMargin, kStepsToTrigger)
    , _pilots(_sectors.size())
{
}

bool C2KTown::step(double position, Randomness& randomness)
{
    _field.step(position, randomness);
    for (const C2KSystem& system : kSystems)
        measure(system);
    return _selector.step(_field);
}

void C2KTown::measure(const C2KSystem& system)
{
    double total = ratioOf(kNoise); // mW
    for (std::size_t i = 0; i < _sectors.size(); ++i) {
        if (_sectors[i].system == &system)
            total += ratioOf(_field.level(i));
    }
    for (std::size_t i = 0; i < _sectors.size(); ++i) {
        if (_sectors[i].system != &system)
            continue;
        const double own = ratioOf(_field.level(i));
        _pilots[i] = {&_sectors[i], decibels(total), decibels(kPilotShare * own / total),
            decibels(own / total), decibels(own / (total - own + kDistortion * own))};
    }
}

std::vector<C2KTown::Pilot> C2KTown::pilots(double weakest) const
{
    std::vector<Pilot> result;
    for (const Pilot& pilot : _pilots) {
        const bool isOther =
            pilot.sector != serving().sector && pilot.sector->system == serving().sector->system;
        if (isOther && pilot.strength1x >= weakest)
            result.push_back(pilot);
    }
    std::ranges::sort(result, std::greater{}, &Pilot::strength1x);
    if (serving().strength1x >= kLostPilot)
        result.insert(result.begin(), serving());
    return result;
}

double C2KTown::transmitPower() const
{
    return std::clamp(kOpenLoopSum - receivedPower(), kWeakestTransmitter, kStrongestTransmitter);
}

} // namespace orvex::korat
