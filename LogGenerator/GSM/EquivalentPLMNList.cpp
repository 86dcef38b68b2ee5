#include "GSM/EquivalentPLMNList.h"

namespace orvex {

EquivalentPLMNList::EquivalentPLMNList(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Equivalent PLMN List", dict, codeDict)
{
}

void EquivalentPLMNList::update(const LogCode_0x7150& report)
{
    RowList list(array());
    for (const auto& plmn : report.plmns()) {
        RowWriter& row = list.next();
        row.setText("Mobile Country Code", "%d", plmn.mobileCountryCode());
        row.setText("Mobile Network Code", "%d", plmn.mobileNetworkCode());
    }
}

} // namespace orvex
