#include "UTRAN/TransportChannels.h"

namespace orvex {

TRCHBLERMeasurement::TRCHBLERMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(
        "TRCH BLER", {Priority::notice, "TRCH BLER Measurement"}, OtherCodes::areIgnored, dict, codeDict)
{
}

void TRCHBLERMeasurement::update(const LogCode_0xD00C& report)
{
    RowList list(array());
    for (const auto& channel : report.transportChannels()) {
        RowWriter& row = list.next();
        row.setText("TRCH ID", "%d", channel.identity());
        row.setText("TRCH BLER Measurement", "%d", channel.blockErrorRate());
    }
}

CCTRCHSIRMeasurement::CCTRCHSIRMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(
        "CCTRCH SIR", {Priority::warning, "CCTRCH SIR Measurement"}, OtherCodes::areIgnored, dict, codeDict)
{
}

void CCTRCHSIRMeasurement::update(const LogCode_0xD00C& report)
{
    RowList list(array());
    for (const auto& channel : report.compositeChannels()) {
        RowWriter& row = list.next();
        row.setText("CCTRCH ID", "%d", channel.identity());
        row.setText("TSNUM", "%d", channel.timeSlotNumber());
        auto ratios = Array::make();
        for (std::size_t i = 0; i < LogCode_0xD00C::CompositeChannel::kSIRCount; ++i)
            ratios->append(DeferredText("%d", channel.sir(i)));
        row.set("SIR", ratios);
    }
}

} // namespace orvex
