#include "GPRSReports.h"

#include "packets/GPRSCellOptionsPacket.h"
#include "packets/GPRSNetworkControlPacket.h"
#include "packets/GPRSPBCCHPacket.h"
#include "packets/GPRSSI13Packet.h"
#include "packets/GPRSSystemInformationPacket.h"

#include <iterator>

namespace orvex::korat {

namespace {
// Operators do not set up all their cells alike.
GPRSNetworkControlPacket networkControlOf(const GSMCell& cell)
{
    using Access = GPRSNetworkControlPacket::Access;
    static constexpr Access kAccess[] = {Access::all, Access::upTo4, Access::all, Access::upTo2};
    GPRSNetworkControlPacket control;
    control.supportsFlowContexts = cell.baseStationColorCode % 2 != 0;
    control.access = kAccess[cell.cellID % std::ssize(kAccess)];
    if (cell.cellID % 5 != 0)
        control.controlOrder = cell.cellID % 3;
    return control;
}

GPRSCellOptionsPacket cellOptionsOf(const GSMCell& cell)
{
    return {cell.cellID % 8, 1 + cell.cellID % 4, cell.networkColorCode % 2 != 0};
}

GPRSSystemInformationPacket systemInformationOf(const GSMCell& cell, Microseconds now)
{
    const auto minutes = std::chrono::duration_cast<std::chrono::minutes>(now).count();
    GPRSSystemInformationPacket information;
    information.psiStatus = cell.cellID % 2;
    // Counts of 4 bits, which every change makes one higher.
    information.lowRepetitionCount = static_cast<int>((cell.cellID + minutes / 10) % 16);
    information.highRepetitionCount = static_cast<int>((cell.cellID + minutes) % 16);
    information.extendedMeasurementOrder = cell.cellID % 3;
    information.supportsSIStatus = cell.networkColorCode % 2 == 0;
    return information;
}
} // namespace

std::span<const LogCode> GPRSReports::codes() const
{
    static constexpr LogCode kCodes[] = {GPRSSI13Packet::kCode, GPRSNetworkControlPacket::kCode,
        GPRSCellOptionsPacket::kCode, GPRSPBCCHPacket::kCode, GPRSSystemInformationPacket::kCode};
    return kCodes;
}

void GPRSReports::report(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    using Position = GPRSSI13Packet::Position;
    // A handset in a call does not read what the cell broadcasts.
    if (!moment.phase.isOnGSM() || moment.phase.isCall() || !(moment.isNewGSMCell || moment.isEvery(100)))
        return;
    const GSMCell& cell = *moment.gsm.serving().cell;
    const bool isExtended = cell.cellID % 4 == 0;
    messages.push_back(
        GPRSSI13Packet{isExtended ? Position::extendedBCCH : Position::bcch}.message(moment.now));
    messages.push_back(networkControlOf(cell).message(moment.now));
    messages.push_back(cellOptionsOf(cell).message(moment.now));
    messages.push_back(GPRSPBCCHPacket{cell.cellID % 6 == 0}.message(moment.now));
    messages.push_back(systemInformationOf(cell, moment.now).message(moment.now));
}

} // namespace orvex::korat
