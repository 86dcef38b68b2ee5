#pragma once

#include "LogMessage.h"

#include <array>
#include <vector>

namespace orvex::korat {

// Idle mode: the cells of any technology that the handset may move to.
//
//   13     u8   version
//   15     u16  EARFCN of the serving cell
//   17     u16  serving cell
//   19     u16  k, number of candidates
//   21+4i  candidate i: u16 priority, u16 technology
//   25+4i  what the technology says of candidate i, 4 bytes (CDMA: 8)
//
// Candidates lie only 4 bytes apart, so the details of each fall on the header of the next, which wins. Only
// the last candidate's details survive; of the others, readers see the next header.
struct LTEReselectionPacket {
    static constexpr LogCode kCode = 0xB186;

    struct Candidate {
        enum class Technology : std::uint16_t { lte = 0, utran = 1, geran = 2, cdma1x = 3, cdmaHRPD = 4 };

        // Details by technology:
        //   LTE          u16 EARFCN, u16 physical cell identity << 7
        //   UTRAN        u16 UARFCN, u16 primary scrambling code
        //   GERAN        u16 ARFCN, u8 band, u8 BSIC
        //   CDMA (both)  u8 band, 3 bytes not read, u16 channel, u16 pilot
        static Candidate makeLTE(int priority, int earfcn, int physicalCellID);
        static Candidate makeUTRAN(int priority, int uarfcn, int scramblingCode);
        static Candidate makeGERAN(int priority, int arfcn, int band, int bsic);
        static Candidate makeCDMA(Technology technology, int priority, int band, int channel, int pilot);

        int priority = 0;
        Technology technology = Technology::lte;
        std::array<std::uint8_t, 8> details{};
    };

    int version = 1;
    int servingEARFCN = 0;
    int servingCellID = 0;
    std::vector<Candidate> candidates;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
