#include "UTRAN/CCTRCHSIRMeasurement.h"

#include "TextFormat.h"

namespace orvex {

namespace {

DictionaryRef rowsOf(const LogCode_0xD00C::CompositeChannel& channel)
{
    auto ratios = Array::make();
    for (std::size_t i = 0; i < LogCode_0xD00C::CompositeChannel::kSIRCount; ++i)
        ratios->append(text("%d", channel.sir(i)));
    Rows row = Rows::make();
    row.print("CCTRCH ID", "%d", channel.identity());
    row.print("TSNUM", "%d", channel.timeSlotNumber());
    row.set("SIR", ratios);
    return row.dictionary();
}

} // namespace

CCTRCHSIRMeasurement::CCTRCHSIRMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(
        "CCTRCH SIR", {Priority::warning, "CCTRCH SIR Measurement"}, OtherCodes::areIgnored, dict, codeDict)
{
}

void CCTRCHSIRMeasurement::update(const LogCode_0xD00C& report)
{
    refillSection(report.compositeChannels(), rowsOf);
}

} // namespace orvex
