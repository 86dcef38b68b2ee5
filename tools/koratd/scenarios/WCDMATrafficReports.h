#pragma once

#include "GSMTownReports.h"

#include "packets/WCDMABlockErrorPacket.h"
#include "packets/WCDMAHARQPacket.h"

namespace orvex::korat {

// What arrives on UMTS: blocks of the transport channels, and the HARQ processes of the fast downlink. The
// counters start anew with every connection.
class WCDMATrafficReports final : public GSMTownReports {
public:
    std::span<const LogCode> codes() const override;
    void report(const GSMTownMoment& moment, std::vector<LogMessage>& messages) override;

private:
    void startConnection();
    void reportTransportChannels(const GSMTownMoment& moment, std::vector<LogMessage>& messages);
    void reportHARQ(const GSMTownMoment& moment, std::vector<LogMessage>& messages);

    std::vector<WCDMABlockErrorPacket::Channel> _channels;
    std::vector<WCDMAHARQPacket::Process> _primary;
    std::vector<WCDMAHARQPacket::Process> _secondary;
};

} // namespace orvex::korat
