#include "UTRAN/TRCHBLERMeasurement.h"

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

} // namespace orvex
