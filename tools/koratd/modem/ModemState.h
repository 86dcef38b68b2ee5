#pragma once

#include "modem/Cell.h"

#include <string>
#include <vector>

namespace orvex::korat {

// Where the modem is registered: the network tells it, whether or not the modem tells its cells.
struct Location {
    std::string operatorId;
    Cell::Number locationArea;
    Cell::Number trackingArea;
    Cell::Number cell;
};

struct Registration {
    std::string state; // "home", "roaming", "searching"...
    std::string operatorId;
    std::string operatorName;
};

struct SimCard {
    std::string iccid;
    std::string operatorId;
    std::string operatorName;
    std::vector<std::string> ownNumbers;
    std::string imsi; // read only when identities are asked for, as the next
    std::string eid;
};

// A packet data connection.
struct Bearer {
    struct Addresses {
        std::string address; // with its prefix length
        std::string gateway;
        std::vector<std::string> nameServers;
    };

    std::string apn;
    std::string interface;
    bool isConnected = false;
    Addresses ipv4;
    Addresses ipv6;
    Cell::Number duration;      // s
    Cell::Number receivedBytes; // since it was connected
    Cell::Number sentBytes;
};

// A measurement of the serving cell, apart from the list of cells: "LTE RSRP", -94, "dBm".
struct SignalLevel {
    std::string name;
    double value = 0;
    const char* unit = "";
};

// What is known of the cells.
enum class CellAnswer {
    notAsked,
    told,
    notSupported, // by this modem
    denied,       // to this user
    none,         // the modem takes too long, or fails
};

// The modem's state as far as the operating system may stay in the way of it.
enum class Condition {
    unknown,   // not asked yet
    noService, // nobody who knows modems is running
    noModem,
    failed,
    locked, // the SIM wants a PIN
    disabled,
    enabled,
};

// What is known of a modem at one moment: a plain value, whatever service it comes from. What the service
// does not tell is empty or absent.
struct ModemState {
    Condition condition = Condition::unknown;
    std::string conditionText; // of failed and locked: why
    std::size_t modemCount = 0;
    std::string manufacturer;
    std::string model;
    std::string revision;
    std::string imei; // read only when identities are asked for
    std::string stateName;
    std::vector<std::string> accessTechnologies;
    std::optional<Radio> radio; // of them; LTE where 5G stands beside it
    Cell::Number signalQuality; // percent
    Registration registration;
    std::optional<Location> location;
    std::optional<SimCard> sim;
    std::vector<Bearer> bearers;
    std::vector<SignalLevel> signal;
    CellAnswer cellAnswer = CellAnswer::notAsked;
    std::vector<Cell> cells;
    std::size_t cellsLeftOut = 0; // beyond what is kept

    // The cell that the modem camps on, one that a technology of its own shows if there are several; null
    // when the modem tells none.
    const Cell* servingCell() const;
};

} // namespace orvex::korat
