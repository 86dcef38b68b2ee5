#include "GSM/EquivalentPLMNList.h"

namespace orvex {

namespace {

void printRecord(RowWriter& row, const LogCode_0x7150::PLMN& plmn)
{
    row.setText("Mobile Country Code", "%d", plmn.mobileCountryCode());
    row.setText("Mobile Network Code", "%d", plmn.mobileNetworkCode());
}

} // namespace

EquivalentPLMNList::EquivalentPLMNList(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Equivalent PLMN List", dict, codeDict)
{
}

void EquivalentPLMNList::update(const LogCode_0x7150& report)
{
    refillSection(report.plmns(), printRecord);
}

} // namespace orvex
