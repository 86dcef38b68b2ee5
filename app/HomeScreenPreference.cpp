#include "HomeScreenPreference.h"

namespace orvex {

namespace {
constexpr const char* kHomeScreenDomain = "org.orvex.HomeScreen";
constexpr const char* kShowGSMRSSI = "HXShowGSMRSSI";
} // namespace

void setGSMRSSIPreference(Preferences& preferences, bool shown)
{
    preferences.setValue(kHomeScreenDomain, kShowGSMRSSI, shown);
    preferences.synchronize(kHomeScreenDomain);
    preferences.postChanged(kHomeScreenDomain, kShowGSMRSSI);
}

} // namespace orvex
