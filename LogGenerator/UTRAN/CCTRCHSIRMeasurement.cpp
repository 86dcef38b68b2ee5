#include "UTRAN/CCTRCHSIRMeasurement.h"

#include "UTRAN/LogCode_0xD00C.h"

#include "SystemLog.h"
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
    : Base("CCTRCH SIR", {LogCode_0xD00C::kCode}, dict, codeDict)
{
}

void CCTRCHSIRMeasurement::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "CCTRCH SIR Measurement");
    if (logCode != LogCode_0xD00C::kCode || packet.size() < LogCode_0xD00C::kMinimumLength)
        return;
    clearSection();
    Array channels;
    for (const auto& channel : LogCode_0xD00C(packet).compositeChannels())
        channels.append(rowsOf(channel));
    replaceSection(channels);
}

} // namespace orvex
