#include "GSM/ProcessCO.h"

#include "GSM/MobilityStates.h"

namespace orvex {

// In the log it has always gone by the name of Process CS.
ProcessCO::ProcessCO(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Process CO", "ProcessCS", dict, codeDict)
{
}

void ProcessCO::update(const LogCode_0x7131& report)
{
    rows().setText("MM State", mmStateText(report.state()));
}

void ProcessCO::update(const LogCode_0x7132& report)
{
    rows().setText("MM Service State", registrationStateText(report.registrationState()));
}

} // namespace orvex
