#pragma once

#include "PacketReader.h"
#include "PacketSection.h"

namespace orvex {

// LTE idle-mode serving cell measurement and cell selection (3GPP TS 36.304, clause 5.2).
//
//   13  u8   version
//   17  u16  EARFCN
//   19  bit string:
//       0-8      physical cell identity
//       9-12     serving layer priority
//       16-24    measured RSRP, 0.25 dB above -140 dBm
//       25-33    average RSRP, the same
//       34-40    measured RSRQ, 0.25 dB above -30 dB
//       41-47    average RSRQ, the same
//       48-56    measured RSSI, 0.5 dB above -140 dBm
//       57-62    Qrxlevmin, 2 dB above -140 dBm
//       63-69    P-Max, dBm above -30; 64 for none
//       70-75    maximum UE transmit power, dBm above -30
//       80-86    Srxlev, above -30
//       87-92    consecutive DRX cycles with S below 0
//       93-98    S-IntraSearch, 2 dB; 32 for none
//       99-104   S-NonIntraSearch, 2 dB; 32 for none
//       105      measurement rules updated
//       106-109  measurement rules
class LogCode_0xB17F {
public:
    static constexpr LogCode kCode = 0xB17F;
    static constexpr std::size_t kMinimumLength = 33;

    static constexpr int kNoPower = 64;  // of pMax() and maximumTransmitPower()
    static constexpr int kNoSearch = 32; // of the two search thresholds

    explicit LogCode_0xB17F(Packet packet)
        : _packet(packet)
    {
    }

    int version() const { return _packet.u8(13); }
    int earfcn() const { return _packet.u16(17); }
    int physicalCellIdentity() const { return bits(0, 9); }
    int servingLayerPriority() const { return bits(9, 4); }
    double measuredRSRP() const { return bits(16, 9) * 0.25 - 140; }
    double averageRSRP() const { return bits(25, 9) * 0.25 - 140; }
    double measuredRSRQ() const { return bits(34, 7) * 0.25 - 30; }
    double averageRSRQ() const { return bits(41, 7) * 0.25 - 30; }
    double measuredRSSI() const { return bits(48, 9) * 0.5 - 140; }
    int qRxLevMin() const { return 2 * bits(57, 6) - 140; }
    int pMax() const { return bits(63, 7); }                 // raw
    int maximumTransmitPower() const { return bits(70, 6); } // raw
    int srxlev() const { return bits(80, 7) - 30; }
    int drxCyclesBelowZero() const { return bits(87, 6); }
    int sIntraSearch() const { return bits(93, 6); }    // raw
    int sNonIntraSearch() const { return bits(99, 6); } // raw
    bool measurementRulesUpdated() const { return bits(105, 1) == 1; }
    int measurementRules() const { return bits(106, 4); }

private:
    int bits(std::size_t first, std::size_t width) const
    {
        return static_cast<int>(_packet.bits(19, first, width));
    }

    PacketReader _packet;
};

// "Serving Cell Measurements": the serving cell as measured in idle mode, and its cell selection values.
class ServingCellMeasurement final : public PacketSection<LogCode_0xB17F> {
public:
    ServingCellMeasurement(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB17F& report) override;
};

} // namespace orvex
