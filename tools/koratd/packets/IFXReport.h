#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// What the engineering mode of an IFX modem shows: no packet, but a whole property list of dictionaries,
// arrays and texts, with no other kinds in it.
//
//   Serving Cell     technology, network, area, cell, carrier, levels, transmit power
//   Neighbours       UMTS: list of cells; GSM: list of cells
//   Timing           frame, timing advance, frequency error
//   Mobility         State; Cell Changes: list; Forbidden Networks: list of texts
//   Radio Resources  state, and for how long
//   Packet Data      list of contexts: Context; Name Servers: list of texts
//
// A list is an array that begins with its heading, and a value may stand in a dictionary of its own under the
// name of its unit or kind: monitors leave the one out and unwrap the other. The rows of one dictionary are
// either all texts then, or all containers.
struct IFXReport {
    enum class Form : std::uint8_t { xml, binary };

    struct Cell {
        bool isUMTS = false;
        int carrier = 0; // UARFCN or ARFCN
        int code = 0;    // scrambling code; or BSIC, network colour code * 8 + base station colour code
        int cellID = 0;
        int areaCode = 0;
        double level = 0; // dBm: RSCP or RxLev
        double ecN0 = 0;  // dB, UMTS only
    };
    struct CellChange {
        double time = 0; // s since power-up
        int from = 0;    // cell identities
        int to = 0;
    };

    int mcc = 0;
    int mnc = 0;
    Cell serving;
    double transmitPower = 0; // dBm
    std::vector<Cell> neighbors;
    int frameNumber = 0;
    int timingAdvance = 0;
    double frequencyError = 0; // Hz
    int locationUpdates = 0;
    std::vector<CellChange> cellChanges;
    const char* radioState = "";
    double secondsInState = 0;
    bool isConnected = false;
    ArrayRef contexts; // dictionaries of texts

    LogMessage message(Form form) const;
};

} // namespace orvex::korat
