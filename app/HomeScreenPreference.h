#pragma once

#include "Storage.h"

namespace orvex {

// Switches the home screen's numeric signal-strength display: writes the preference to storage and tells the
// home screen, which looks at once. Monitors that switch it on leave it to this one to switch it off.
void setGSMRSSIPreference(Preferences& preferences, bool shown);

} // namespace orvex
