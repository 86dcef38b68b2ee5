#include "GSM/EquivalentPLMNList.h"

namespace orvex {

namespace {

DictionaryRef rowsOf(const LogCode_0x7150::PLMN& plmn)
{
    Rows row = Rows::make();
    row.print("Mobile Country Code", "%d", plmn.mobileCountryCode());
    row.print("Mobile Network Code", "%d", plmn.mobileNetworkCode());
    return row.dictionary();
}

} // namespace

EquivalentPLMNList::EquivalentPLMNList(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Equivalent PLMN List", dict, codeDict)
{
}

void EquivalentPLMNList::update(const LogCode_0x7150& report)
{
    refillSection(report.plmns(), rowsOf);
}

} // namespace orvex
