#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace orvex::korat {

enum class Radio { gsm, umts, tdscdma, cdma, lte, nr5g };

// "GSM", "UMTS", "TD-SCDMA", "CDMA", "LTE" or "5G".
const char* nameOf(Radio radio);

// A network's identity, from the five or six digits of an operator identifier.
struct Network {
    int mcc = 0;
    int mnc = 0;
    std::string text; // "001-01"; the number of digits of the network code matters

    // None for any other text.
    static std::optional<Network> of(const std::string& operatorId);
};

// A cell that the modem hears. Fields that the modem does not report are absent.
struct Cell {
    using Number = std::optional<std::int64_t>;
    using Level = std::optional<double>;

    Radio radio = Radio::gsm;
    bool isServing = false;
    std::string operatorId; // MCC and MNC
    Number areaCode;        // location area; tracking area of LTE and 5G
    Number identity;        // in its network; base station of CDMA
    Number
        physicalIdentity; // on the air: BSIC, scrambling code, cell parameter, physical cell identity or PN
    Number channel;       // ARFCN, UARFCN, EARFCN or NR-ARFCN
    Number systemId;      // of CDMA
    Number networkId;     // of CDMA
    Number receiveLevel;  // of GSM, dB above -111 dBm
    Number timingAdvance;
    Number pathLoss;      // dB
    Number pilotStrength; // of CDMA
    Level rsrp;           // dBm
    Level rsrq;           // dB
    Level sinr;           // dB
    Level rscp;           // dBm
    Level ecio;           // dB
    // Everything else it reports, under its own names.
    std::vector<std::pair<std::string, std::string>> others;

    bool operator==(const Cell&) const = default;
};

} // namespace orvex::korat
