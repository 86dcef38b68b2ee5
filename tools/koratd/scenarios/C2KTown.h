#pragma once

#include "CellSelector.h"
#include "RadioField.h"
#include "Randomness.h"

#include "packets/C2K1xSystemPacket.h"

#include <vector>

namespace orvex::korat {

// A network with 1x and EV-DO, each on a carrier of its own.
struct C2KSystem {
    double end = 0; // where the next one begins, along the road, m
    int systemID = 0;
    int networkID = 0;
    C2K1xSystemPacket::Roaming roaming{};
    int bandClass = 0;
    int channel1x = 0;
    int channelEVDO = 0;
    int colorCode = 0;
};

struct C2KSector {
    int pnOffset = 0; // units of 64 chips
    int baseID = 0;
    int packetZoneID = 0;
    const C2KSystem* system = nullptr;
};

// The base stations along a road that leads from the home network through two others. In an underpass there
// is no service.
class C2KTown {
public:
    static constexpr double kRoadLength = 3600; // m

    struct Pilot {
        const C2KSector* sector = nullptr;
        double carrierPower = 0;          // dBm, all sectors on its carrier and the noise
        double strength1x = 0;            // Ec/Io, dB: the pilot is a fifth of what a 1x carrier sends
        double strengthEVDO = 0;          // Ec/Io, dB: alone in its bursts
        double carrierToInterference = 0; // EV-DO, dB
    };

    C2KTown();

    // Moves the handset; true when another sector serves it now.
    bool step(double position, Randomness& randomness);

    bool isCovered() const { return _field.average(_selector.serving()) >= kWeakestService; }
    const Pilot& serving() const { return _pilots[_selector.serving()]; }
    // The serving pilot unless it is lost, and all others of its system, which are on the same carrier, whose
    // 1x strength is at least that many dB, strongest first.
    std::vector<Pilot> pilots(double weakest) const;

    double receivedPower() const { return serving().carrierPower; } // dBm
    double transmitPower() const; // dBm, as the handset sets it by what it receives

private:
    // Of one system; the others, on carriers of their own, do not disturb it.
    void measure(const C2KSystem& system);

    static constexpr double kWeakestService = -107; // dBm

    std::vector<C2KSector> _sectors;
    RadioField _field; // a transmitter for each sector
    CellSelector _selector;
    std::vector<Pilot> _pilots; // for each sector
};

} // namespace orvex::korat
