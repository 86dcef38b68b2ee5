#include "UTRAN/TRCHBLERMeasurement.h"

#include "UTRAN/LogCode_0xD00C.h"

#include "SystemLog.h"

namespace orvex {

TRCHBLERMeasurement::TRCHBLERMeasurement(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("TRCH BLER", {LogCode_0xD00C::kCode}, dict, codeDict)
{
}

void TRCHBLERMeasurement::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::notice, "TRCH BLER Measurement");
    if (logCode != LogCode_0xD00C::kCode || packet.size() < LogCode_0xD00C::kMinimumLength)
        return;
    clearSection();
    Array channels;
    for (const auto& channel : LogCode_0xD00C(packet).transportChannels()) {
        Rows row = Rows::make();
        row.print("TRCH ID", "%d", channel.identity());
        row.print("TRCH BLER Measurement", "%d", channel.blockErrorRate());
        channels.append(row.dictionary());
    }
    replaceSection(channels);
}

} // namespace orvex
