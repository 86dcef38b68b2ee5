#include "UTRAN/TRCHBLERMeasurement.h"

namespace orvex {

namespace {

DictionaryRef rowsOf(const LogCode_0xD00C::TransportChannel& channel)
{
    Rows row = Rows::make();
    row.print("TRCH ID", "%d", channel.identity());
    row.print("TRCH BLER Measurement", "%d", channel.blockErrorRate());
    return row.dictionary();
}

} // namespace

TRCHBLERMeasurement::TRCHBLERMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(
        "TRCH BLER", {Priority::notice, "TRCH BLER Measurement"}, OtherCodes::areIgnored, dict, codeDict)
{
}

void TRCHBLERMeasurement::update(const LogCode_0xD00C& report)
{
    refillSection(report.transportChannels(), rowsOf);
}

} // namespace orvex
