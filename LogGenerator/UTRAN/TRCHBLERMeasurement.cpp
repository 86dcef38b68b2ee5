#include "UTRAN/TRCHBLERMeasurement.h"

namespace orvex {

namespace {

void printRecord(RowWriter& row, const LogCode_0xD00C::TransportChannel& channel)
{
    row.setText("TRCH ID", "%d", channel.identity());
    row.setText("TRCH BLER Measurement", "%d", channel.blockErrorRate());
}

} // namespace

TRCHBLERMeasurement::TRCHBLERMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(
        "TRCH BLER", {Priority::notice, "TRCH BLER Measurement"}, OtherCodes::areIgnored, dict, codeDict)
{
}

void TRCHBLERMeasurement::update(const LogCode_0xD00C& report)
{
    refillSection(report.transportChannels(), printRecord);
}

} // namespace orvex
