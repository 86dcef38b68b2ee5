#pragma once

#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// LTE reselection candidates of any radio technology.
//
//   13     u8   version
//   15     u16  serving EARFCN
//   17     u16  serving cell identity
//   19     u16  number of candidates
//   21+4i  candidate i: u16 priority, u16 radio technology
//   25+4i  technology-specific fields of candidate i
//
// Candidates are 4 bytes apart, so the technology-specific fields of one lie where the next begins.
class LogCode_0xB186 {
public:
    static constexpr LogCode kCode = 0xB186;
    static constexpr std::size_t kMinimumLength = 21;

    enum Technology : int { lte = 0, utran = 1, geran = 2, cdma1xRTT = 3, cdmaHRPD = 4 };

    //   0  u16  EARFCN
    //   2  u16  cell identity in bits 7-15
    struct LTEFields {
        int earfcn;
        int cellIdentity;
    };
    //   0  u16  UARFCN
    //   2  u16  primary scrambling code
    struct UTRANFields {
        int uarfcn;
        int primaryScramblingCode;
    };
    //   0  u16  ARFCN
    //   2  u8   band
    //   3  u8   BSIC
    struct GERANFields {
        int arfcn;
        int band;
        int bsic;
    };
    //   0  u8   band
    //   4  u16  channel
    //   6  u16  pilot
    struct CDMAFields {
        int band;
        int channel;
        int pilot;
    };

    class Candidate {
    public:
        explicit Candidate(PacketReader record)
            : _record(record)
        {
        }

        int priority() const { return _record.u16(0); }
        int technology() const { return _record.u16(2); }
        // True when the packet holds the technology-specific fields too.
        bool isComplete() const;

        // Each throws ArrayOutOfBoundsException when the candidate is of another technology.
        LTEFields lteFields() const;
        UTRANFields utranFields() const;
        GERANFields geranFields() const;
        CDMAFields cdmaFields() const;

    private:
        void expectTechnology(int first, int last) const;

        PacketReader _record; // from the candidate on, to the end of the packet
    };

    explicit LogCode_0xB186(Packet packet)
        : _packet(packet)
    {
    }

    int version() const { return _packet.u8(13); }
    int servingEARFCN() const { return _packet.u16(15); }
    int servingCellIdentity() const { return _packet.u16(17); }
    RecordList<Candidate> candidates() const { return {_packet, 21, 4, _packet.u16(19)}; }

private:
    PacketReader _packet;
};

// "Reselection Candidates": the serving cell from which reselection is considered.
class ReselectionCandidatesMisc final : public PacketSection<LogCode_0xB186> {
public:
    ReselectionCandidatesMisc(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB186& report) override;
};

// "Reselection Candidates List": the cells of any radio technology considered for reselection, one row
// dictionary each.
class ReselectionCandidatesList final : public PacketSection<LogCode_0xB186> {
public:
    ReselectionCandidatesList(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB186& report) override;
};

} // namespace orvex
